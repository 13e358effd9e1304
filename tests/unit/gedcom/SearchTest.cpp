// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finding persons by identifier, number and words of their names.

#include <gtest/gtest.h>

#include <olvane/gedcom/PersonSearch.h>
#include <olvane/gedcom/UnicodeTextInternal.h>
#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

GedcomData people() {
    return read(
        document("0 @I5@ INDI\n1 NAME John /Grüber/\n"
                 "0 @I6@ INDI\n1 NAME Łukasz /Kowalski/\n"
                 "0 @I7@ INDI\n1 NAME Johnny /Gruber-Straße/\n2 NICK Ace\n"
                 "0 @2@ INDI\n1 NAME Søren /Nielsen/\n1 NAME Sören /Sørensen/\n"
                 "0 @I9@ INDI\n1 NAME Алексей /Иванов/\n"
                 "0 @I10@ INDI\n1 NAME 田中 /太郎/\n"
                 "0 @I11@ INDI\n1 NAME O'Brien \"Paddy\" (old)\n"));
}

std::string found(const char* text) {
    return idsOf(findPersons(people(), text));
}

TEST(Search, identifiersAreFoundWithAndWithoutAt) {
    EXPECT_EQ(found("I7"), "3");
    EXPECT_EQ(found("@I7@"), "3");
    EXPECT_EQ(found("  I7 "), "3");
}

TEST(Search, aNumberIsAnIdentifierFirstAndAnIdElse) {
    EXPECT_EQ(found("2"), "4");
    EXPECT_EQ(found("3"), "3");
    EXPECT_EQ(found("99"), "");
}

TEST(Search, wordsMayComeInAnyOrderAndAnyCase) {
    EXPECT_EQ(found("kowalski ŁUKASZ"), "2");
    EXPECT_EQ(found("GRÜBER john"), "1 3");
}

TEST(Search, accentsDoNotCount) {
    EXPECT_EQ(found("gruber"), "1 3");
    EXPECT_EQ(found("lukasz"), "2");
    EXPECT_EQ(found("soren"), "4");
    EXPECT_EQ(found("sorensen"), "4");
    EXPECT_EQ(found("strasse"), "3");
    EXPECT_EQ(found("иванов"), "5");
    EXPECT_EQ(found("太郎"), "6");
    EXPECT_EQ(found("Jóhn"), "1 3");
}

TEST(Search, wholeWordsComeBeforeBeginnings) {
    EXPECT_EQ(found("john"), "1 3");
    EXPECT_EQ(found("johnn"), "3");
    EXPECT_EQ(found("ohn"), "");
}

TEST(Search, nicknamesAndFurtherNamesAreFound) {
    EXPECT_EQ(found("ace"), "3");
    EXPECT_EQ(found("paddy"), "7");
    EXPECT_EQ(found("o'brien"), "7");
}

TEST(Search, nothingFindsNobody) {
    EXPECT_EQ(found(""), "");
    EXPECT_EQ(found(" / "), "");
    EXPECT_EQ(found("@@"), "");
    EXPECT_EQ(found("\xFF"), "");
}

TEST(Search, theLimitKeepsTheBest) {
    const GedcomData data =
        read(document("0 INDI\n1 NAME Annabel\n0 INDI\n1 NAME Anna\n0 INDI\n1 NAME Annamaria\n"));
    EXPECT_EQ(idsOf(findPersons(data, "anna")), "2 1 3");
    EXPECT_EQ(idsOf(findPersons(data, "anna", 2)), "2 1");
    EXPECT_EQ(idsOf(findPersons(data, "anna", 0)), "");
}

TEST(Search, foldingTakesCaseAccentsAndStrokesAway) {
    EXPECT_EQ(foldedForSearch("ÄÖÜ ÉÈ Çß ØŁĐÐÞÆŒ"),
              "aou ee css oldd"
              "thaeoe");
    EXPECT_EQ(foldedForSearch("Plain ASCII"), "plain ascii");
}

}  // namespace
}  // namespace olvane::gedcom::test
