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

void tellFacts(std::span<const Fact> facts, std::string& text) {
    for (const Fact& fact : facts) {
        text.append(" ").append(fact.tag).append("[").append(fact.value).append("|").append(fact.place);
        text.append("|").append(dateOf(fact.date)).append("]");
    }
}

// Everything that a picture or a panel could tell, a line a record.
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
        tellFacts(data.factsOfPerson(id), text);
        text += '\n';
    }
    for (FamilyId id = 1; id <= data.familyCount(); ++id) {
        const Family& family = data.family(id);
        text += "couple " + std::to_string(family.husband) + " " + std::to_string(family.wife) +
                (family.married ? " married" : "") + (family.divorced ? " divorced" : "");
        tellFacts(data.factsOfFamily(id), text);
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
