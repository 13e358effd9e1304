// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is written can be read again, and what is hidden is not in it.

#include <cstdlib>
#include <filesystem>
#include <string>

#include <gtest/gtest.h>

#include <olvane/gedcom/GedcomWriter.h>
#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

ReadOptions withFacts() {
    ReadOptions options;
    options.facts = true;
    return options;
}

GedcomData readWithFacts(std::string bytes) {
    return readGedcomBytes(std::move(bytes), "test.ged", withFacts());
}

std::string dateOf(const GedcomDate& date) {
    return std::string(date.written) + "=" + sortText(date);
}

void appendFacts(std::span<const Fact> facts, std::string& text) {
    for (const Fact& fact : facts) {
        text.append(" ").append(fact.tag).append("[").append(fact.value).append("|").append(fact.place);
        text.append("|").append(dateOf(fact.date)).append("]");
    }
}

// Everything that a picture or a panel could show, a line a record.
std::string everythingOf(const GedcomData& data) {
    std::string text;
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        const Person& person = data.person(id);
        for (const PersonName& name : data.names(id)) {
            for (const std::string_view piece :
                 {name.written, name.prefix, name.given, name.surname, name.suffix, name.nickname}) {
                text.append(piece).append("/");
            }
        }
        text += std::to_string(static_cast<int>(person.sex)) + (person.dead ? " dead " : " ") +
                dateOf(person.birth) + " " + dateOf(person.death) + " parents " +
                std::to_string(person.father) + " " + std::to_string(person.mother) + " spouses " +
                idsOf(data.spouses(id)) + " children " + idsOf(data.children(id));
        for (const FamilyLink& link : data.parentLinks(id)) {
            if (link.family == 0) continue;
            text +=
                " in " + std::to_string(link.family) + ":" + std::to_string(static_cast<int>(link.pedigree));
        }
        appendFacts(data.factsOfPerson(id), text);
        text += '\n';
    }
    for (FamilyId id = 1; id <= data.familyCount(); ++id) {
        const Family& family = data.family(id);
        text += "couple " + std::to_string(family.husband) + " " + std::to_string(family.wife) +
                (family.married ? " married" : "") + (family.divorced ? " divorced" : "");
        appendFacts(data.factsOfFamily(id), text);
        text += '\n';
    }
    return text;
}

TEST(Writing, readsAgainAsTheSameFamily) {
    const GedcomData data = readWithFacts(document(
        "0 @I1@ INDI\n1 NAME Dr. John /van Berg/ Jr.\n2 NPFX Dr.\n2 SPFX van\n2 SURN Berg\n2 NICK Jack\n"
        "1 NAME /Li/ Wei\n1 SEX M\n1 BIRT\n2 DATE @#DJULIAN@ 24 FEB 1700\n2 PLAC at @@ home\n1 DEAT\n"
        "1 FAMS @F1@\n0 @I2@ INDI\n1 SEX F\n1 FAMS @F1@\n"
        "0 @I3@ INDI\n1 FAMC @F1@\n2 PEDI adopted\n"
        "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 CHIL @I3@\n1 MARR\n2 DATE 1720\n1 DIV Y\n"));
    const GedcomData again = readWithFacts(writeGedcom(data));
    EXPECT_EQ(everythingOf(again), everythingOf(data));
    EXPECT_EQ(again.person(3).xref, "I3");
    EXPECT_TRUE(again.diagnostics().empty());
}

// Two passes, so that what one of them loses by halves is seen.
void expectLastingly(const std::string& bytes) {
    const GedcomData data = readWithFacts(bytes);
    const GedcomData once = readWithFacts(writeGedcom(data));
    EXPECT_EQ(everythingOf(once), everythingOf(data));
    EXPECT_EQ(everythingOf(readWithFacts(writeGedcom(once))), everythingOf(data));
}

TEST(Writing, keepsEveryAtSignBehindWhatBeginsAsACalendar) {
    expectLastingly(
        document("0 @I1@ INDI\n1 NAME @#x@@@@y /S/\n1 OCCU @#ab@@@@c\n1 BIRT\n"
                 "2 DATE @#DJULIAN@@@@ 5 MAY 1700\n"));
    expectLastingly(
        document("0 @I1@ INDI\n1 BIRT\n2 DATE @@@@@#DJULIAN@ 5 MAY 1700\n1 DEAT\n2 DATE @#DX\n"
                 "1 BURI\n2 DATE @#DX@@#DY@ @#DZ@@@\n1 OCCU @\n1 OCCU @@@@@@\n"));
}

TEST(Writing, leavesTheSignsOfACalendarSingle) {
    const GedcomData data = readWithFacts(
        document("0 @I1@ INDI\n1 BIRT\n2 DATE BET @#DJULIAN@ 1700 AND @#DFRENCH R@ 8 (a@@b)\n"));
    EXPECT_NE(writeGedcom(data).find("2 DATE BET @#DJULIAN@ 1700 AND @#DFRENCH R@ 8 (a@@b)\n"),
              std::string::npos);
}

TEST(Writing, distinguishesAValueFromAYesOrNo) {
    const GedcomData data = readWithFacts(document("0 @I1@ INDI\n1 EVEN\n2 TYPE Y\n1 DEAT Y\n2 TYPE N\n"));
    EXPECT_TRUE(readWithFacts(writeGedcom(data)).person(1).dead);
    expectLastingly(document("0 @I1@ INDI\n1 EVEN\n2 TYPE Y\n1 DEAT Y\n2 TYPE N\n"));
}

TEST(Writing, keepsWhatAPhraseWasReadAs) {
    expectLastingly(
        document7("0 @I1@ INDI\n1 BIRT\n2 DATE\n3 PHRASE 1900\n1 DEAT\n2 DATE\n3 PHRASE in May\n"));
}

TEST(Writing, keepsChildrenClaimedInAFileOfLooseLinks) {
    std::string records = "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 CHIL @I3@\n";
    for (int loose = 0; loose < 400; ++loose) records += "1 CHIL @LOOSE@\n";
    for (int person = 1; person <= 1500; ++person) {
        records += "0 @I" + std::to_string(person) + "@ INDI\n1 FAMS @F1@\n";
    }
    const GedcomData data = readWithFacts(document(records));
    EXPECT_EQ(idsOf(data.children(1001)), "3");
    EXPECT_EQ(idsOf(data.children(1500)), "");
    EXPECT_TRUE(everythingOf(readWithFacts(writeGedcom(data))) == everythingOf(data));
}

TEST(Writing, knowsNothingOfWhatDidNotHappen) {
    expectLastingly(
        document("0 @I1@ INDI\n1 BIRT N\n2 DATE 1800\n1 BURI N\n0 @F1@ FAM\n1 MARR N\n2 DATE 1900\n"));
}

TEST(Writing, givesEveryRecordAnIdentifierOfItsOwn) {
    const GedcomData data = readWithFacts(
        document("0 @A@ INDI\n1 NAME one\n0 @A@ INDI\n1 NAME two\n0 INDI\n1 NAME three\n0 @P3@ INDI\n"
                 "1 NAME four\n0 @has space@ INDI\n1 NAME five\n"));
    const GedcomData again = readWithFacts(writeGedcom(data));
    EXPECT_EQ(everythingOf(again), everythingOf(data));
    EXPECT_EQ(again.person(1).xref, "A");
    EXPECT_EQ(again.person(2).xref, "P2");
    EXPECT_EQ(again.person(3).xref, "P3X");
    EXPECT_EQ(again.person(4).xref, "P3");
    EXPECT_EQ(again.person(5).xref, "P5");
    EXPECT_TRUE(again.diagnostics().empty());
}

TEST(Writing, leavesOutWhatIsHidden) {
    const GedcomData data = readWithFacts(document(
        "0 @ANNA_1990@ INDI\n1 NAME Anna /Hidden/\n2 GIVN Anna\n1 SEX F\n1 BIRT\n2 DATE 7 MAY 1990\n"
        "2 PLAC Bern\n1 OCCU Spy\n1 FAMS @ANNAS@\n0 @I2@ INDI\n1 NAME Karl /Shown/\n1 DEAT\n2 DATE 1999\n"
        "1 FAMS @ANNAS@\n0 @ANNAS@ FAM\n1 WIFE @ANNA_1990@\n1 HUSB @I2@\n1 MARR\n2 DATE 2 JAN 1989\n"
        "2 PLAC Thun\n"));
    WriteOptions options;
    options.hidden = {true, false};
    const std::string text = writeGedcom(data, options);
    for (const char* secret : {"Anna", "ANNA", "Hidden", "1990", "Bern", "Spy", "1989", "Thun"}) {
        EXPECT_EQ(text.find(secret), std::string::npos) << secret << " in\n" << text;
    }
    const GedcomData again = readWithFacts(text);
    EXPECT_EQ(namesOf(again), "Living|Karl Shown");
    EXPECT_EQ(again.person(1).sex, Sex::female);
    EXPECT_EQ(idsOf(again.spouses(2)), "1");
    EXPECT_FALSE(again.family(1).married);
    EXPECT_EQ(dateOf(again.person(2).death), "1999=1999");
}

// What a dead person's record states with Livia Secret hidden, who is written so.
std::string shownBeside(const std::string& livia, const std::string& facts) {
    const GedcomData data = readWithFacts(document("0 @I1@ INDI\n" + livia + "1 FAMS @F1@\n" +
                                                   "0 @I2@ INDI\n1 NAME Karl /Shown/\n1 FAMS @F1@\n" + facts +
                                                   "0 @F1@ FAM\n1 WIFE @I1@\n1 HUSB @I2@\n"));
    WriteOptions options;
    options.hidden = {true, false};
    const GedcomData again = readWithFacts(writeGedcom(data, options));
    std::string text;
    appendFacts(again.factsOfPerson(2), text);
    return text;
}

constexpr const char* kLivia = "1 NAME Livia Maria /von Secret/\n2 NICK Livi\n";

TEST(Writing, leavesOutFreeTextWithAnybodyHidden) {
    EXPECT_EQ(shownBeside(kLivia, "1 EVEN\n2 TYPE Witness Livia Secret\n1 FACT a friend\n2 DATE 1900\n"),
              " FACT[||1900=1900]");
    EXPECT_EQ(shownBeside("1 NAME /Secret/\n", "1 EVEN any\n1 EVEN\n2 PLAC Bern\n1 DEAT Y\n"),
              " EVEN[|Bern|=] DEAT[||=]");
}

TEST(Writing, leavesOutTextThatNamesSomebodyHidden) {
    EXPECT_EQ(shownBeside(kLivia, "1 OCCU Servant of LIVIA SECRET\n2 PLAC Bern\n"), " OCCU[|Bern|=]");
    EXPECT_EQ(shownBeside(kLivia, "1 RESI\n2 PLAC Secret's house, given to Livi\n"), " RESI[||=]");
    EXPECT_EQ(shownBeside(kLivia, "1 DEAT\n2 DATE (day of Maria\xE2\x80\x94Secret)\n"), " DEAT[||=]");
    EXPECT_EQ(shownBeside(kLivia, "1 TITL Guardian of Livia Shown\n"), " TITL[||=]");
    EXPECT_EQ(shownBeside("1 NAME X /Y/\n1 NAME L\xC3\xADvia /Secret/\n", "1 OCCU livia secret\n"),
              " OCCU[||=]");
    EXPECT_EQ(shownBeside("1 NAME L. /Sekret/\n2 GIVN Livia\n2 SURN Secret\n", "1 OCCU Livia Sekret\n"),
              " OCCU[||=]");
    EXPECT_EQ(shownBeside("1 NAME Jon Jonsson\n", "1 OCCU of Jonsson, Jon\n"), " OCCU[||=]");
    EXPECT_EQ(shownBeside("1 NAME \xE5\xB0\x8F\xE6\x98\x8E /\xE7\x8E\x8B/\n",
                          "1 OCCU \xE8\xAD\x89\xE4\xBA\xBA\xE7\x8E\x8B\xE5\xB0\x8F\xE6\x98\x8E\n"),
              " OCCU[||=]");
}

TEST(Writing, leavesTextThatNamesNobodyHidden) {
    EXPECT_EQ(shownBeside(kLivia, "1 OCCU agent\n2 PLAC Santa Maria von Bern\n"),
              " OCCU[agent|Santa Maria von Bern|=]");
    EXPECT_EQ(shownBeside(kLivia, "1 OCCU Livias Secretary\n"), " OCCU[Livias Secretary||=]");
    EXPECT_EQ(shownBeside("1 NAME Bern\n", "1 OCCU Smith\n2 PLAC Bern\n"), " OCCU[Smith|Bern|=]");
}

// A place may bear a name by chance; what is said of a person's life hardly does.
TEST(Writing, leavesOutTextWithAWordThatOnlySomebodyHiddenIsCalled) {
    EXPECT_EQ(shownBeside(kLivia, "1 OCCU nurse of livi\n2 PLAC Livia\n"), " OCCU[|Livia|=]");
    EXPECT_EQ(shownBeside(kLivia, "1 RESI with the Secret family\n"), " RESI[||=]");
    EXPECT_EQ(shownBeside("1 NAME Livia /Shown/\n", "1 OCCU Shown in public\n"), " OCCU[Shown in public||=]");
    EXPECT_EQ(shownBeside("1 NAME Karl /Secret/\n", "1 OCCU servant of Karl\n"), " OCCU[servant of Karl||=]");
}

TEST(Writing, leavesOutANicknameThatNamesSomebodyHidden) {
    const GedcomData data =
        readWithFacts(document("0 INDI\n1 NAME Livia /Secret/\n0 INDI\n1 NAME Karl /Shown/\n"
                               "2 NICK Livia's man\n0 INDI\n1 NAME Otto /Shown/\n2 NICK Bear\n"));
    WriteOptions options;
    options.hidden = {true, false, false};
    const GedcomData again = readWithFacts(writeGedcom(data, options));
    EXPECT_EQ(again.firstName(2).nickname, "");
    EXPECT_EQ(again.firstName(3).nickname, "Bear");
    options.hidden.clear();
    EXPECT_EQ(readWithFacts(writeGedcom(data, options)).firstName(2).nickname, "Livia's man");
}

// Neither for the same record nor, made again, for another.
TEST(Writing, usesNoIdentifierOfSomebodyHidden) {
    const GedcomData data = readWithFacts(
        document("0 @P1@ INDI\n1 NAME Livia /Secret/\n1 FAMC @U1@\n0 @P3@ INDI\n1 NAME Vera /Secret/\n"
                 "1 FAMC @U1@\n0 INDI\n1 NAME Karl /Shown/\n0 @U1@ FAM\n1 CHIL @P1@\n1 CHIL @P3@\n"
                 "1 MARR\n2 DATE 1960\n"));
    WriteOptions options;
    options.hidden = {true, true, false};
    const std::string text = writeGedcom(data, options);
    for (const char* secret : {"@P1@", "@P3@", "@U1@", "1960"}) {
        EXPECT_EQ(text.find(secret), std::string::npos) << secret << " in\n" << text;
    }
    const GedcomData again = readWithFacts(text);
    EXPECT_EQ(again.personCount(), 3U);
    EXPECT_EQ(again.childLinks(1).size(), 2U);
}

TEST(Writing, makesAnIdentifierForOneThatNamesSomebodyHidden) {
    const GedcomData data = readWithFacts(document(
        "0 @I1@ INDI\n1 NAME Livia /Secret/\n0 @Father_of_Livia_Secret@ INDI\n1 NAME Karl /Shown/\n"));
    WriteOptions options;
    options.hidden = {true, false};
    EXPECT_EQ(writeGedcom(data, options).find("Livia"), std::string::npos);
}

// Each pair of the names would be looked up otherwise, for hours.
TEST(Writing, leavesOutATextOfThousandsOfNames) {
    std::string occupation;
    std::string records;
    for (int person = 0; person < 20000; ++person) {
        const std::string number = std::to_string(person);
        occupation.append(" Anna").append(number).append(" Berg").append(std::to_string(person + 1));
        records.append("0 INDI\n1 NAME Anna").append(number).append(" /Berg").append(number).append("/\n");
    }
    const GedcomData data = readWithFacts(document("0 INDI\n1 OCCU" + occupation + "\n" + records));
    WriteOptions options;
    options.hidden.assign(data.personCount(), true);
    options.hidden[0] = false;
    EXPECT_EQ(readWithFacts(writeGedcom(data, options)).factsOfPerson(1)[0].value, "");
}

TEST(Writing, leavesOutThatAHiddenPersonWasAdopted) {
    const GedcomData data = readWithFacts(
        document("0 @I1@ INDI\n1 FAMC @F1@\n2 PEDI adopted\n1 FAMC @F2@\n2 PEDI birth\n"
                 "0 @I2@ INDI\n1 SEX M\n1 FAMS @F1@\n0 @I3@ INDI\n1 SEX M\n1 FAMS @F2@\n"
                 "0 @F1@ FAM\n1 HUSB @I2@\n1 CHIL @I1@\n0 @F2@ FAM\n1 HUSB @I3@\n1 CHIL @I1@\n"));
    WriteOptions options;
    options.hidden = {true, false, false};
    const std::string text = writeGedcom(data, options);
    EXPECT_EQ(text.find("PEDI"), std::string::npos) << text;
    const GedcomData again = readWithFacts(text);
    EXPECT_EQ(again.person(1).father, 3U);
    EXPECT_EQ(again.parentLinks(1).size(), 1U);
}

TEST(Writing, readsAgainAsTheSameFamilyForEveryRealFile) {
    const char* folder = std::getenv("OLVANE_GEDCOM_DIR");
    if (folder == nullptr || *folder == '\0')
        GTEST_SKIP() << "OLVANE_GEDCOM_DIR names no folder of GEDCOM files";
    std::size_t files = 0;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
        if (entry.path().extension() != ".ged") continue;
        const GedcomData data = readGedcomFile(entry.path().string(), withFacts());
        EXPECT_EQ(everythingOf(readWithFacts(writeGedcom(data))), everythingOf(data)) << entry.path();
        ++files;
    }
    EXPECT_GT(files, 60U);
}

}  // namespace
}  // namespace olvane::gedcom::test
