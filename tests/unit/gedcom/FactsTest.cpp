// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a file states of persons and couples beyond birth, death and marriage.

#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

GedcomData readWithFacts(std::string bytes) {
    ReadOptions options;
    options.facts = true;
    return readGedcomBytes(std::move(bytes), "test.ged", options);
}

// "TAG value, date, place" a line.
std::string linesOf(std::span<const Fact> facts) {
    std::string text;
    for (const Fact& fact : facts) {
        text += std::string(fact.tag) + " " + std::string(fact.value) + ", " +
                std::string(fact.date.written) + ", " + std::string(fact.place) + "\n";
    }
    return text;
}

TEST(Facts, standInTheOrderOfTheRecordWithDateAndPlace) {
    const GedcomData data = readWithFacts(
        document("0 @I1@ INDI\n1 NAME A\n1 OCCU Naturalist\n2 DATE FROM 1831\n2 PLAC Down House\n1 SEX M\n"
                 "1 BIRT\n2 PLAC Shrewsbury\n2 DATE 12 FEB 1809\n1 DEAT Y\n"));
    EXPECT_EQ(linesOf(data.factsOfPerson(1)),
              "OCCU Naturalist, FROM 1831, Down House\n"
              "BIRT , 12 FEB 1809, Shrewsbury\n"
              "DEAT , , \n");
    EXPECT_EQ(data.factsOfPerson(1)[0].date.year, 1831);
    EXPECT_EQ(data.factsOfPerson(1)[1].date.day, 12);
}

TEST(Facts, aTypeIsTheValueWhereThereIsNone) {
    const GedcomData data = readWithFacts(
        document("0 @I1@ INDI\n1 EVEN\n2 TYPE Knighted\n1 EVEN stated\n2 TYPE Untold\n1 EVEN\n2 TYPE\n"));
    EXPECT_EQ(linesOf(data.factsOfPerson(1)), "EVEN Knighted, , \nEVEN stated, , \nEVEN , , \n");
}

TEST(Facts, ofACoupleStandWithTheFamily) {
    const GedcomData data = readWithFacts(
        document("0 @F1@ FAM\n1 MARR\n2 DATE 1839\n2 PLAC Maer\n1 DIV N\n0 @F2@ FAM\n1 DIV Y\n"));
    EXPECT_EQ(linesOf(data.factsOfFamily(1)), "MARR , 1839, Maer\n");
    EXPECT_EQ(linesOf(data.factsOfFamily(2)), "DIV , , \n");
}

TEST(Facts, whatDidNotHappenIsNoFactAndHasNoDate) {
    const GedcomData data = readWithFacts(document("0 @I1@ INDI\n1 DEAT N\n2 DATE 1900\n2 PLAC Nowhere\n"));
    EXPECT_EQ(linesOf(data.factsOfPerson(1)), "");
    EXPECT_FALSE(data.person(1).dead);
    EXPECT_FALSE(data.person(1).death.isGiven());
}

TEST(Facts, numbersOfOfficesAndNotesAreNone) {
    const GedcomData data = readWithFacts(
        document("0 @I1@ INDI\n1 SSN 123\n1 IDNO 9\n1 NOTE secret\n1 RESI\n2 ADDR Street\n2 NOTE hush\n"));
    EXPECT_EQ(linesOf(data.factsOfPerson(1)), "RESI , , \n");
}

TEST(Facts, aLineBelowAnotherRecordBelongsToNoFact) {
    const GedcomData data = readWithFacts(
        document("0 @I1@ INDI\n1 BIRT\n0 @N1@ NOTE x\n2 PLAC Lost\n0 @I2@ INDI\n2 PLAC Lost too\n"));
    EXPECT_EQ(linesOf(data.factsOfPerson(1)), "BIRT , , \n");
    EXPECT_EQ(linesOf(data.factsOfPerson(2)), "");
}

TEST(Facts, aPhraseStandsForADateOfVersion7) {
    const GedcomData data =
        readWithFacts(document7("0 @I1@ INDI\n1 BIRT\n2 DATE\n3 PHRASE at harvest time\n"));
    EXPECT_EQ(linesOf(data.factsOfPerson(1)), "BIRT , at harvest time, \n");
}

TEST(Facts, anUnreadableDateIsReportedOnce) {
    const GedcomData data = readWithFacts(document("0 @I1@ INDI\n1 BIRT\n2 DATE some day\n"));
    EXPECT_EQ(linesReported(data, DiagnosticKind::unreadableDate), "8");
}

TEST(Facts, areLeftInTheFileUnlessAskedFor) {
    const GedcomData data = read(document("0 @I1@ INDI\n1 OCCU Naturalist\n0 @F1@ FAM\n1 MARR\n"));
    EXPECT_TRUE(data.factsOfPerson(1).empty());
    EXPECT_TRUE(data.factsOfFamily(1).empty());
    EXPECT_THROW(data.factsOfPerson(2), std::out_of_range);
    EXPECT_THROW(data.factsOfFamily(2), std::out_of_range);
}

}  // namespace
}  // namespace olvane::gedcom::test
