// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/KinshipText.h>

#include <gtest/gtest.h>

#include <olvane/kin/KinJson.h>
#include <olvane/kin/words/KinshipWordsInternal.h>

#include "KinFamily.h"

using namespace olvane::kin;

namespace {

struct Row {
    const char* who;
    const char* english;
    const char* german;
    const char* spanish;
};

void expectRows(const KinFamily& family, const char* from, std::initializer_list<Row> rows) {
    KinshipFinder finder(family.graph());
    for (const Row& row : rows) {
        const Kinship found = finder.between(family[from], family[row.who]);
        EXPECT_EQ(kinshipText(family.graph(), found, Language::english), row.english) << row.who;
        EXPECT_EQ(kinshipText(family.graph(), found, Language::german), row.german) << row.who;
        EXPECT_EQ(kinshipText(family.graph(), found, Language::spanish), row.spanish) << row.who;
    }
}

}  // namespace

TEST(KinshipText, ancestorsCarryOneGreatForEachGenerationBeyondTheGrandparents) {
    const KinFamily family{"Adam + Eva: Seth.m",  "Seth + Sara: Noah.m", "Noah + Nora: Otto.m",
                           "Otto + Olga: Paul.m", "Paul + Pia: Quin.m",  "Quin + Queenie: Rolf.m Rosa.f",
                           "Rolf + Rita: Theo.m"};
    expectRows(
        family, "Theo",
        {{"Theo", "the same person", "dieselbe Person", "la misma persona"},
         {"Rolf", "father", "Vater", "padre"},
         {"Quin", "grandfather (father's father)", "Großvater väterlicherseits", "abuelo paterno"},
         {"Paul", "great-grandfather (father's side)", "Urgroßvater väterlicherseits", "bisabuelo paterno"},
         {"Olga", "great-great-grandmother (father's side)", "Ururgroßmutter väterlicherseits",
          "tatarabuela paterna"},
         {"Noah", "great-great-great-grandfather (father's side)", "Urururgroßvater väterlicherseits",
          "cuarto abuelo paterno"},
         {"Sara", "4th great-grandmother (father's side)", "4×Urgroßmutter väterlicherseits",
          "quinta abuela paterna"}});
    expectRows(family, "Seth",
               {{"Noah", "son", "Sohn", "hijo"},
                {"Otto", "grandson", "Enkel", "nieto"},
                {"Paul", "great-grandson", "Urenkel", "bisnieto"},
                {"Rosa", "great-great-great-granddaughter", "Urururenkelin", "cuarta nieta"},
                {"Theo", "4th great-grandson", "4×Urenkel", "quinto nieto"}});
}

TEST(KinshipText, relativesBesideTheLineCountDegreesAndRemovals) {
    const KinFamily family{"Urban + Ursula: Georg.m Gustav.m",
                           "Georg + Gerda: Victor.m Vera.f",
                           "Gustav + Gisela: Konrad.m",
                           "Konrad + Karla: Lukas.m",
                           "Lukas + Lotte: Moritz.m",
                           "Hans + Hilde: Maria.f Martin.m Marta.f",
                           "Victor + Maria: Fritz.m Frida.f",
                           "Martin + Monika: Carl.m Clara.f",
                           "Clara.f + Claus.m: Dirk.m Dina.f",
                           "Frida.f + Ferdi.m: Niko.m Nina.f",
                           "Niko + Nele: Olaf.m",
                           "Victor + Zoe: Hella.f"};
    expectRows(family, "Fritz",
               {{"Frida", "sister", "Schwester", "hermana"},
                {"Martin", "uncle (mother's brother)", "Onkel mütterlicherseits", "tío materno"},
                {"Vera", "aunt (father's sister)", "Tante väterlicherseits", "tía paterna"},
                {"Gustav", "great-uncle (father's side)", "Großonkel väterlicherseits", "tío abuelo paterno"},
                {"Nina", "niece", "Nichte", "sobrina"},
                {"Olaf", "great-nephew", "Großneffe", "sobrino nieto"},
                {"Clara", "first cousin", "Cousine ersten Grades", "prima hermana"},
                {"Dirk", "first cousin once removed", "Neffe zweiten Grades", "sobrino segundo"},
                {"Konrad", "first cousin once removed", "Onkel zweiten Grades", "tío segundo"},
                {"Lukas", "second cousin", "Großcousin", "primo segundo"},
                {"Moritz", "second cousin once removed", "Neffe dritten Grades", "sobrino tercero"},
                {"Hella", "half sister", "Halbschwester", "media hermana"}});
    expectRows(family, "Olaf",
               {{"Moritz", "third cousin once removed", "Onkel vierten Grades", "tío cuarto"}});
    expectRows(
        family, "Niko",
        {{"Hella", "half aunt (mother's half sister)", "Halbtante mütterlicherseits", "media tía materna"}});
}

TEST(KinshipText, bothSidesAtOnceSayNeitherAndHowManyWaysThereAre) {
    const KinFamily family{"Abel + Anna: Bert.m Bea.f Bodo.m", "Bert + Bea: Theo.m"};
    expectRows(
        family, "Theo",
        {{"Bodo", "uncle; related in 2 ways", "Onkel; verwandt auf 2 Wegen", "tío; parentesco por 2 vías"},
         {"Abel", "grandfather; related in 2 ways", "Großvater; verwandt auf 2 Wegen",
          "abuelo; parentesco por 2 vías"}});
}

TEST(KinshipText, doubleCousinsHaveAWord) {
    const KinFamily family{"Abel + Anna: Bert.m Bodo.m", "Carl + Cora: Dora.f Dina.f", "Bert + Dora: Emil.m",
                           "Bodo + Dina: Else.f"};
    expectRows(family, "Emil",
               {{"Else", "double first cousin", "Doppelcousine ersten Grades", "prima hermana doble"}});
}

TEST(KinshipText, relationsByMarriageHaveWords) {
    const KinFamily family{"Hugo + Helga: Max.m Mona.f",
                           "Walter + Wanda: Eva.f Erika.f",
                           "Max + Eva: Sven.m Sina.f",
                           "Mona.f + Moritz.m",
                           "Erika.f + Emil.m: Ella.f",
                           "Sven + Svea",
                           "Sina.f + Simon.m",
                           "Svante + Selma: Svea.f",
                           "Rainer | Eva: Ralf.m",
                           "Hugo + Ute: Uwe.m",
                           "Udo + Ute: Ulla.f",
                           "Karl + Kira: Hugo.m Kurt.m",
                           "Kurt + Kora: Kim.x",
                           "Kim.x + Kai.m",
                           "Ida ~ Oskar.m"};
    expectRows(
        family, "Max",
        {{"Eva", "wife", "Ehefrau", "esposa"},
         {"Walter", "father-in-law", "Schwiegervater", "suegro"},
         {"Svea", "daughter-in-law", "Schwiegertochter", "nuera"},
         {"Erika", "sister-in-law (wife's sister)", "Schwägerin (Schwester der Ehefrau)",
          "cuñada (hermana de la esposa)"},
         {"Moritz", "brother-in-law (sister's husband)", "Schwager (Ehemann der Schwester)",
          "cuñado (esposo de la hermana)"},
         {"Ralf", "stepson", "Stiefsohn", "hijastro"},
         {"Ute", "stepmother", "Stiefmutter", "madrastra"},
         {"Uwe", "half brother", "Halbbruder", "medio hermano"},
         {"Ulla", "stepsister", "Stiefschwester", "hermanastra"},
         {"Kora", "wife of an uncle", "Ehefrau eines Onkels", "esposa de un tío"},
         {"Kai", "husband of a first cousin", "Ehemann eines Cousins/Cousine ersten Grades",
          "esposo de un primo/a hermano/a"},
         {"Ella", "wife's niece", "Nichte der Ehefrau", "sobrina de la esposa"},
         {"Emil", "wife's sister's husband", "Ehemann der Schwester der Ehefrau",
          "esposo de la hermana de la esposa"},
         {"Rainer", "wife's former husband", "früherer Ehemann der Ehefrau", "exesposo de la esposa"},
         {"Selma", "son's wife's mother", "Mutter der Ehefrau des Sohnes", "madre de la esposa del hijo"},
         {"Ida", "", "", ""}});
    expectRows(family, "Eva", {{"Rainer", "former husband", "früherer Ehemann", "exesposo"}});
    expectRows(family, "Ida", {{"Oskar", "partner", "Partner", "pareja"}});
}

TEST(KinshipText, aWifeWhoIsACousinIsBoth) {
    const KinFamily family{"Josiah + Sarah: Susannah.f Jos.m", "Robert + Susannah: Charles.m Caroline.f",
                           "Jos + Bessy: Emma.f Joe.m", "Charles + Emma: George.m", "Joe + Caroline"};
    expectRows(
        family, "Charles",
        {{"Emma", "wife and first cousin", "Ehefrau und Cousine ersten Grades", "esposa y prima hermana"}});
    expectRows(family, "George",
               {{"Emma", "mother; related in 2 ways", "Mutter; verwandt auf 2 Wegen",
                 "madre; parentesco por 2 vías"}});
}

// Words with and without the side; ways over several marriages are not said beside one by blood.
TEST(KinshipText, aCousinIsNoMoreThanThatByMarriagesFarOff) {
    const KinFamily family{"Urban + Ursula: Georg.m Gustav.m",
                           "Georg + Gerda: Victor.m",
                           "Gustav + Gisela: Konrad.m",
                           "Victor + Vera: Fritz.m Franz.m",
                           "Konrad + Karla: Lukas.m",
                           "Ludwig + Luise: Lena.f Lotte.f",
                           "Franz + Lena",
                           "Lukas + Laura: Moritz.m",
                           "Moritz + Lotte"};
    KinshipFinder finder(family.graph());
    const Kinship found = finder.between(family["Fritz"], family["Moritz"]);
    ASSERT_FALSE(found.marriage.empty());
    ASSERT_LT(found.marriage.front().links(), found.blood.front().length());
    EXPECT_EQ(kinshipText(family.graph(), found, Language::english), "second cousin once removed");
}

TEST(KinshipText, whereThereIsLittleRoomTheNearestWayStandsAlone) {
    const KinFamily family{"Hugo + Helga: Max.m Mona.f",
                           "Walter + Wanda: Eva.f Erika.f",
                           "Max + Eva: Sven.m",
                           "Mona.f + Moritz.m",
                           "Karl + Kira: Hugo.m Kurt.m",
                           "Kurt + Kora: Kim.x",
                           "Josiah + Sarah: Susannah.f Jos.m",
                           "Robert + Susannah: Charles.m",
                           "Jos + Bessy: Emma.f",
                           "Charles + Emma: George.m",
                           "Ida ~ Oskar.m"};
    KinshipFinder finder(family.graph());
    const auto words = [&](const char* from, const char* to, Language language) {
        return shortKinshipText(family.graph(), finder.between(family[from], family[to]), language);
    };
    EXPECT_EQ(words("Max", "Erika", Language::english), "sister-in-law");
    EXPECT_EQ(words("Max", "Erika", Language::german), "Schwägerin");
    EXPECT_EQ(words("Max", "Erika", Language::spanish), "cuñada");
    EXPECT_EQ(words("Max", "Walter", Language::english), "father-in-law");
    EXPECT_EQ(words("Sven", "Mona", Language::english), "aunt");
    EXPECT_EQ(words("Sven", "Hugo", Language::german), "Großvater");
    EXPECT_EQ(words("Max", "Kora", Language::english), "wife of an uncle");
    EXPECT_EQ(words("Charles", "Emma", Language::english), "wife");
    EXPECT_EQ(words("George", "Emma", Language::english), "mother");
    EXPECT_EQ(words("Max", "Max", Language::english), "the same person");
    EXPECT_EQ(words("Ida", "Max", Language::english), "");
}

TEST(KinshipText, adoptionAndFosteringAreNamed) {
    const KinFamily family{"Bruno + Birte: Finn.m Fee.f", "Anselm + Agnes: Finn(adopted) Alma.f",
                           "Pelle + Petra: Finn(foster) Piet.m", "Alois + Amalie: Anselm.m Arno.m"};
    expectRows(family, "Finn",
               {{"Bruno", "father", "Vater", "padre"},
                {"Anselm", "adoptive father", "Adoptivvater", "padre adoptivo"},
                {"Petra", "foster mother", "Pflegemutter", "madre de acogida"},
                {"Alma", "adoptive sister", "Adoptivschwester", "hermana adoptiva"},
                {"Arno", "adoptive uncle (father's side)", "Adoptivonkel väterlicherseits",
                 "tío adoptivo paterno"}});
    expectRows(family, "Anselm", {{"Finn", "adopted son", "Adoptivsohn", "hijo adoptivo"}});
}

TEST(KinshipText, unknownSexTakesNeutralWords) {
    const KinFamily family{"Kim.x + Lou.x: Max.x Nic.x", "Nic.x + Sam.x: Toni.x",
                           "Pat.x + Pip.x: Kim.x Robin.x"};
    expectRows(family, "Max",
               {{"Kim", "parent", "Elternteil", "progenitor"},
                {"Nic", "sibling", "Geschwister", "hermano/a"},
                {"Toni", "niece or nephew", "Neffe/Nichte", "sobrino/a"},
                {"Robin", "aunt or uncle", "Onkel/Tante", "tío/a"}});
}

TEST(KinshipText, farWaysOverMarriagesAreCounted) {
    const KinFamily family{"Aa + Ab: Ac.m",        "Ac + Ad", "Bb.m + Ba: Ad.f Bc.m", "Bc + Bd",
                           "Cb.m + Ca: Bd.f Cc.m", "Cc + Cd", "Db.m + Da: Cd.f Dc.m"};
    expectRows(family, "Ac",
               {{"Dc", "related by marriage over 9 links", "verschwägert über 9 Verbindungen",
                 "pariente por matrimonio a través de 9 vínculos"}});
}

// Nobody forgets a word: whatever relation there is, no language is silent.
TEST(KinshipText, everyLanguageHasWordsForEveryRelation) {
    for (const Language language : kLanguages) {
        const KinshipWords& words = kinshipWords(language);
        for (const Sex sex : {Sex::male, Sex::female, Sex::unknown}) {
            for (int up = 0; up < 14; ++up) {
                for (int down = up == 0 ? 1 : 0; down < 14; ++down) {
                    for (const Bond bond :
                         {Bond::blood, Bond::adopted, Bond::foster, Bond::step, Bond::other}) {
                        const Noun noun = words.relative({up, down, false, false, bond, KinSide::none, sex});
                        EXPECT_FALSE(noun.plain.empty() || noun.ofOne.empty() || noun.owner.empty());
                        EXPECT_EQ(noun.plain.find("  "), std::string::npos) << noun.plain;
                    }
                }
            }
            for (const InLaw which : {InLaw::parent, InLaw::child, InLaw::sibling, InLaw::stepparent,
                                      InLaw::stepchild, InLaw::stepsibling}) {
                EXPECT_FALSE(words.inLaw(which, sex).plain.empty());
            }
            for (const UnionState state :
                 {UnionState::married, UnionState::divorced, UnionState::unmarried, UnionState::unknown}) {
                EXPECT_FALSE(words.spouse(state, sex).plain.empty());
            }
        }
        EXPECT_FALSE(words.self().empty());
    }
}

TEST(KinshipText, languagesAreFoundByTheirCodes) {
    EXPECT_EQ(languageOf("de_AT.UTF-8"), Language::german);
    EXPECT_EQ(languageOf("es"), Language::spanish);
    EXPECT_EQ(languageOf("en-GB"), Language::english);
    EXPECT_EQ(languageOf("fr"), std::nullopt);
    EXPECT_EQ(languageOf("des"), std::nullopt);
    EXPECT_EQ(languageOf(""), std::nullopt);
}

TEST(KinshipJson, holdsWaysNumbersAndWords) {
    const KinFamily family{"Adam + Eva: Seth.m Sara.f"};
    KinshipFinder finder(family.graph());
    EXPECT_EQ(
        kinshipJson(family.graph(), finder.between(family["Seth"], family["Sara"])),
        R"({"a": 3, "b": 4, "words": {"en": "sister", "de": "Schwester", "es": "hermana"}, "phi": 0.25, "degree": 2, )"
        R"("blood": [{"up": 1, "down": 1, "half": false, "ancestors": [1, 2], "persons": [3, 1, 4], )"
        R"("words": {"en": "sister", "de": "Schwester", "es": "hermana"}}], "bloodCount": 1, )"
        R"("legal": [], "legalCount": 0, "marriage": [], "marriageCount": 0})");
}

TEST(KinshipJson, saysWhyANumberIsNull) {
    const KinFamily family{"Ouro + Mona: Ouro.m Sid.m"};
    KinshipFinder finder(family.graph());
    const std::string json = kinshipJson(family.graph(), finder.between(family["Ouro"], family["Sid"]));
    EXPECT_NE(json.find(R"("phi": null, "reason": "loop")"), std::string::npos) << json;
    EXPECT_NE(json.find(R"("bloodCount": null)"), std::string::npos) << json;
}

TEST(KinshipJson, namesABondThatIsNotByBlood) {
    const KinFamily family{"Anselm + Agnes: Finn.m(adopted)"};
    KinshipFinder finder(family.graph());
    const std::string json = kinshipJson(family.graph(), finder.between(family["Finn"], family["Agnes"]));
    EXPECT_NE(json.find(R"("bond": "adopted")"), std::string::npos) << json;
    EXPECT_NE(json.find(R"("degree": null)"), std::string::npos) << json;
}
