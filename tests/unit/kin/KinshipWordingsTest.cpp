// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Words for relatives in narrow boxes: what each language says in fewer letters, and whether it goes in.

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include <olvane/kin/KinshipText.h>
#include <olvane/kin/words/KinshipWordsInternal.h>
#include <olvane/picture/TextFit.h>

#include "KinFamily.h"

using namespace olvane::kin;

namespace {

// The page's boxes as they are without options, in px: the narrower ones leave this to a line, and may have two.
constexpr double kRoom = 104;
constexpr double kLetters = 9.5;
constexpr std::size_t kLines = 2;
constexpr int kGenerations = 12;

using Wordings = std::vector<std::string>;

Wordings wordingsOf(const KinFamily& family, const char* from, const char* to, Language language) {
    KinshipFinder finder(family.graph());
    return kinshipWordings(family.graph(), finder.between(family[from], family[to]), language);
}

bool goesIntoABox(const std::string& text) {
    const auto fitted =
        olvane::picture::fitText(olvane::picture::cleanText(text), {kLetters, false}, kRoom, kLines);
    return !fitted.shortened && !fitted.wordBroken;
}

// Calls check with each relation to twelve generations.
template <class Check>
void forEachRelation(const Check& check) {
    for (const Sex sex : {Sex::male, Sex::female, Sex::unknown}) {
        for (int up = 0; up <= kGenerations; ++up) {
            for (int down = up == 0 ? 1 : 0; down <= kGenerations; ++down) {
                for (const Bond bond : {Bond::blood, Bond::adopted, Bond::foster, Bond::step}) {
                    BloodWords way{up, down, false, false, bond, KinSide::none, sex};
                    check(way);
                    if (bond != Bond::blood || up == 0 || down == 0) continue;
                    way.half = true;
                    check(way);
                    way.half = false;
                    way.doubled = up > 1 && down > 1;
                    if (way.doubled) check(way);
                }
            }
        }
    }
}

}  // namespace

TEST(KinshipWordings, countGreatsAndRemovalsWhereTheRoomIsNarrow) {
    const KinFamily family{"Adam + Eva: Seth.m Sina.f", "Seth + Sara: Noah.m", "Noah + Nora: Otto.m",
                           "Otto + Olga: Paul.m",       "Paul + Pia: Quin.m",  "Sina.f + Sven.m: Sune.m"};
    EXPECT_EQ(wordingsOf(family, "Quin", "Seth", Language::english),
              (Wordings{"great-great-grandfather", "2nd great-grandfather", "kin, 4th degree"}));
    EXPECT_EQ(wordingsOf(family, "Quin", "Eva", Language::german),
              (Wordings{"Urururgroßmutter", "3×Urgroßmutter", "verwandt im 5. Grad"}));
    EXPECT_EQ(wordingsOf(family, "Quin", "Eva", Language::spanish),
              (Wordings{"cuarta abuela", "4.ª abuela", "pariente en 5.º grado"}));
    EXPECT_EQ(wordingsOf(family, "Quin", "Sune", Language::english),
              (Wordings{"first cousin 3 times removed", "1st cousin 3× removed", "kin, 7th degree"}));
    EXPECT_EQ(wordingsOf(family, "Quin", "Sune", Language::german),
              (Wordings{"Urgroßonkel zweiten Grades", "Urgroßonkel 2. Grades", "verwandt im 7. Grad"}));
    EXPECT_EQ(wordingsOf(family, "Quin", "Sune", Language::spanish),
              (Wordings{"tío bisabuelo segundo", "tío bisabuelo 2.º", "pariente en 7.º grado"}));
}

TEST(KinshipWordings, sayOfWaysOverMarriagesHowManyLinksTheyHave) {
    const KinFamily family{"Urs + Uta: Vera.f Viktor.m", "Viktor + Wilma", "Xaver + Xenia: Wilma.f Yann.m",
                           "Yann + Zita"};
    EXPECT_EQ(wordingsOf(family, "Vera", "Zita", Language::english),
              (Wordings{"brother's wife's brother's wife", "by marriage (6 links)"}));
    EXPECT_EQ(wordingsOf(family, "Vera", "Wilma", Language::english), Wordings{"sister-in-law"});
    EXPECT_EQ(wordingsOf(family, "Viktor", "Wilma", Language::spanish), Wordings{"esposa"});
}

TEST(KinshipWordings, areOneForTheSamePersonAndEmptyForStrangers) {
    const KinFamily family{"Adam + Eva: Seth.m", "Ida ~ Oskar.m"};
    EXPECT_EQ(wordingsOf(family, "Seth", "Seth", Language::english), Wordings{"the same person"});
    EXPECT_EQ(wordingsOf(family, "Seth", "Ida", Language::english), Wordings{""});
}

// Nobody of unknown sex among adoptive relatives beside the line has to be: those fall back to the degree.
TEST(KinshipWordings, ofBloodRelativesToTwelveGenerationsGoIntoABoxAsAWord) {
    for (const Language language : kLanguages) {
        const KinshipWords& words = kinshipWords(language);
        forEachRelation([&](BloodWords way) {
            if (way.sex == Sex::unknown || (way.bond != Bond::blood && way.up > 0 && way.down > 0)) return;
            const std::string full = words.relative(way).plain;
            way.wording = Wording::brief;
            const std::string brief = words.relative(way).plain;
            EXPECT_TRUE(goesIntoABox(full) || goesIntoABox(brief)) << full << " / " << brief;
        });
    }
}

TEST(KinshipWordings, ofAnyRelationToTwelveGenerationsGoIntoABox) {
    for (const Language language : kLanguages) {
        const KinshipWords& words = kinshipWords(language);
        forEachRelation([&](BloodWords way) {
            way.wording = Wording::brief;
            EXPECT_TRUE(goesIntoABox(words.relative(way).plain) ||
                        goesIntoABox(words.ofDegree(way.up + way.down)))
                << words.relative(way).plain;
        });
        for (int links = 1; links < 1000; ++links)
            EXPECT_TRUE(goesIntoABox(words.brieflyByMarriage(std::to_string(links)))) << links;
        for (const Sex sex : {Sex::male, Sex::female, Sex::unknown}) {
            for (const InLaw which : {InLaw::parent, InLaw::child, InLaw::sibling, InLaw::stepparent,
                                      InLaw::stepchild, InLaw::stepsibling})
                EXPECT_TRUE(goesIntoABox(words.inLaw(which, sex).plain)) << words.inLaw(which, sex).plain;
            for (const UnionState state :
                 {UnionState::married, UnionState::divorced, UnionState::unmarried, UnionState::unknown})
                EXPECT_TRUE(goesIntoABox(words.spouse(state, sex).plain)) << words.spouse(state, sex).plain;
        }
    }
}

// But for a hyphen, at which a line may end.
TEST(KinshipWordings, areNeverLongerThanTheOnesBeforeThem) {
    for (const Language language : kLanguages) {
        const KinshipWords& words = kinshipWords(language);
        forEachRelation([&](BloodWords way) {
            const std::string full = words.relative(way).plain;
            way.wording = Wording::brief;
            const auto lettersOf = [](const std::string& text) {
                return std::count_if(text.begin(), text.end(), [](char c) { return (c & 0xC0) != 0x80; });
            };
            EXPECT_LE(lettersOf(words.relative(way).plain), lettersOf(full) + 1) << full;
        });
    }
}
