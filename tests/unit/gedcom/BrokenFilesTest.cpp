// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Broken files: every trouble is reported with its line, and everything that can be read is read.

#include <string>

#include <gtest/gtest.h>

#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

std::string allReported(const GedcomData& data) {
    std::string text;
    for (const Diagnostic& diagnostic : data.diagnostics())
        text.append(formatDiagnostic(diagnostic)).append("\n");
    return text;
}

TEST(BrokenFiles, aSoundFileHasNothingToReport) {
    EXPECT_EQ(allReported(read(document("0 @I1@ INDI\n1 NAME Jane\n"))), "");
    EXPECT_EQ(allReported(read(document7("0 @I1@ INDI\n1 NAME Jane\n1 _EXT x\n2 _OTHER\n"))), "");
}

TEST(BrokenFiles, aMissingHeaderIsReported) {
    const GedcomData data = read("0 @I1@ INDI\n1 NAME John /Doe/\n0 TRLR\n");
    EXPECT_EQ(namesOf(data), "John Doe");
    EXPECT_EQ(allReported(data),
              "test.ged:1: warning: the file does not begin with HEAD (INDI); read without it\n");
}

TEST(BrokenFiles, aFileCutOffIsReadAsFarAsItGoes) {
    const GedcomData data = read("0 HEAD\n0 @I1@ INDI\n1 NAME John\n0 @I2@ INDI\n1 NAME Ja");
    EXPECT_EQ(namesOf(data), "John|Ja");
    EXPECT_EQ(linesReported(data, DiagnosticKind::missingTrailer), "5");
}

TEST(BrokenFiles, recordsBehindTheTrailerAreReadAndReported) {
    const GedcomData data = read(document("").append("0 @I1@ INDI\n1 NAME Late\n"));
    EXPECT_EQ(namesOf(data), "Late");
    EXPECT_EQ(linesReported(data, DiagnosticKind::afterTrailer), "7");
}

TEST(BrokenFiles, aLevelJumpKeepsTheLineUnderItsParent) {
    const GedcomData data = read(
        document("0 @I1@ INDI\n1 BIRT\n4 DATE 1900\n4 PLAC x\n1 DEAT\n7 DATE 1970\n1 NAME John\n99 X\n"));
    EXPECT_EQ(data.person(1).birth.year, 1900);
    EXPECT_EQ(data.person(1).death.year, 1970);
    EXPECT_EQ(namesOf(data), "John");
    EXPECT_EQ(linesReported(data, DiagnosticKind::levelJump), "8 11 13");
    EXPECT_EQ(reported(data, DiagnosticKind::levelJump)[0],
              "8: level jumps from 1 to 4 (DATE); read as one below the line before");
}

TEST(BrokenFiles, aLevelThatIsNoNumberSkipsTheLine) {
    const GedcomData data = read(document("0 @I1@ INDI\nx NAME Wrong\n1 NAME Right\n1. NAME Wrong\n"));
    EXPECT_EQ(namesOf(data), "Right");
    EXPECT_EQ(linesReported(data, DiagnosticKind::notALine), "7 9");
}

TEST(BrokenFiles, aLevelBadlyWrittenIsGuessed) {
    const GedcomData data =
        read(document("00 @I1@ INDI\n01 NAME A\n0@I2@ INDI\n1NAME B\n0 @I3@ INDI\n-1 NAME C\n"));
    EXPECT_EQ(namesOf(data), "A|B|C");
    EXPECT_EQ(linesReported(data, DiagnosticKind::wrongLevel), "6 7 8 9 11");
}

TEST(BrokenFiles, aLevelOutOfAllBoundsIsOneBelow) {
    const GedcomData data = read(document("0 @I1@ INDI\n1 BIRT\n99999999999999999999 DATE 1900\n"));
    EXPECT_EQ(data.person(1).birth.year, 1900);
}

TEST(BrokenFiles, textWithoutLevelAndTagIsSkipped) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 NOTE a note\nthat goes on here\n1 NAME A\n12\n1 \n1 @X@\n1 (what\n"));
    EXPECT_EQ(namesOf(data), "A");
    EXPECT_EQ(linesReported(data, DiagnosticKind::notALine), "8 10 11 12 13");
    EXPECT_EQ(reported(data, DiagnosticKind::notALine)[0],
              "8: not a line with level and tag (that goes on here); skipped");
}

TEST(BrokenFiles, aRecordWhoseEndIsMissingEndsWithTheNext) {
    const GedcomData data = read(document("0 @I1@ INDI\n1 NAME A\n2 GI\n0 @I2@ INDI\n1 NAME B\n"));
    EXPECT_EQ(namesOf(data), "A|B");
}

TEST(BrokenFiles, theFirstOfTwoRecordsOfOneIdentifierIsPointedTo) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 NAME First\n1 FAMS @F1@\n0 @I1@ INDI\n1 NAME Second\n0 @F1@ FAM\n1 "
                      "HUSB @I1@\n0 @F1@ FAM\n1 WIFE @I1@\n"));
    EXPECT_EQ(namesOf(data), "First|Second");
    EXPECT_EQ(data.personByXref("I1"), 1U);
    EXPECT_EQ(data.family(1).husband, 1U);
    EXPECT_EQ(data.family(2).wife, 1U);
    EXPECT_EQ(data.coupleLinks(1)[0].family, 1U);
    EXPECT_EQ(linesReported(data, DiagnosticKind::duplicateXref), "9 13");
    EXPECT_EQ(
        reported(data, DiagnosticKind::duplicateXref)[0],
        "9: identifier already used in line 6 (I1); read as a record of its own; pointers lead to the first");
}

TEST(BrokenFiles, pointersToNothingAreNobody) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 FAMS @F9@\n1 FAMC @F8@\n0 @F1@ FAM\n1 HUSB @I7@\n1 CHIL @I6@\n"));
    EXPECT_EQ(linesReported(data, DiagnosticKind::danglingPointer), "7 8 10 11");
    EXPECT_EQ(reported(data, DiagnosticKind::danglingPointer)[0], "7: a pointer to no record (F9); left out");
    EXPECT_EQ(data.family(1).husband, 0U);
    EXPECT_EQ(data.childLinks(1)[0].child, 0U);
}

TEST(BrokenFiles, pointersToRecordsOfAnotherSortAreNobody) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 FAMS @I1@\n0 @F1@ FAM\n1 HUSB @F1@\n1 CHIL @N1@\n1 WIFE Jane\n1 "
                      "CHIL\n0 @N1@ NOTE\n"));
    EXPECT_EQ(linesReported(data, DiagnosticKind::wrongPointer), "7 9 10 11 12");
    EXPECT_EQ(linesReported(data, DiagnosticKind::danglingPointer), "");
}

TEST(BrokenFiles, voidPointersNeedNoWord) {
    const GedcomData data = read(
        document7("0 @I1@ INDI\n1 FAMS @VOID@\n1 FAMC @VOID@\n0 @F1@ FAM\n1 HUSB @VOID@\n1 CHIL @VOID@\n"));
    EXPECT_EQ(allReported(data), "");
}

TEST(BrokenFiles, identifiersWithoutTheirSecondAtAreReadUpToTheSpace) {
    const GedcomData data =
        read(document("0 @I1 INDI\n1 NAME A\n1 FAMS @F1\n0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I1@ x\n"));
    EXPECT_EQ(data.personByXref("I1"), 1U);
    EXPECT_EQ(data.coupleLinks(1)[0].family, 1U);
    EXPECT_EQ(linesReported(data, DiagnosticKind::brokenXref), "6 8 11");
}

TEST(BrokenFiles, identifiersMayHaveSpacesAndCases) {
    const GedcomData data = read(document("0 @a b@ INDI\n1 NAME A\n0 @A B@ INDI\n1 NAME B\n"));
    EXPECT_EQ(data.personByXref("@a b@"), 1U);
    EXPECT_EQ(data.personByXref("A B"), 2U);
    EXPECT_EQ(allReported(data), "");
}

TEST(BrokenFiles, unreadableDatesAreReported) {
    const GedcomData data = read(
        document("0 @I1@ INDI\n1 BIRT\n2 DATE sometime\n1 DEAT\n2 DATE (unknown)\n1 EVEN\n2 DATE never\n"));
    EXPECT_EQ(linesReported(data, DiagnosticKind::unreadableDate), "8");
    EXPECT_EQ(displayYear(data.person(1).death), "(unknown)");
}

TEST(BrokenFiles, binaryRubbishAmongRecordsIsSkipped) {
    std::string rubbish = "\x89PNG\r\n";
    for (int byte = 0; byte < 256; ++byte) rubbish.push_back(static_cast<char>(byte));
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 NAME A\n").append(rubbish).append("\n0 @I2@ INDI\n1 NAME B\n"));
    EXPECT_EQ(namesOf(data), "A|B");
    EXPECT_NE(linesReported(data, DiagnosticKind::notALine), "");
}

TEST(BrokenFiles, whatIsNoGedcomIsRefusedInOneLine) {
    EXPECT_EQ(refusal(""), "is empty");
    for (const char* other :
         {"\n", "   \n\n", "{\"persons\": []}\n", "<html>\n", "0 HELLO\n1 NAME x\n", "%PDF-1.5\n"}) {
        EXPECT_EQ(refusal(other), "holds nothing that looks like GEDCOM") << other;
    }
    EXPECT_EQ(refusal(std::string(1000, '\0')), "holds nothing that looks like GEDCOM");
    EXPECT_EQ(refusal("0 HEAD\n"), "");
}

TEST(BrokenFiles, emptyLinesAreCountedTogether) {
    const GedcomData data = read("\n\n0 HEAD\n\n0 @I1@ INDI\n1 NAME A\n0 TRLR\n\n");
    EXPECT_EQ(allReported(data), "test.ged:1: note: empty line, the first of 4; skipped\n");
}

TEST(BrokenFiles, ofOneKindTheFirstAreListedAndTheRestCounted) {
    std::string records = "0 @I1@ INDI\n";
    for (int line = 0; line < 250; ++line) records.append("not a line\n");
    const GedcomData data = read(document(records));
    EXPECT_EQ(reported(data, DiagnosticKind::notALine).size(), 100U);
    ASSERT_EQ(reported(data, DiagnosticKind::moreOfAKind).size(), 1U);
    EXPECT_EQ(reported(data, DiagnosticKind::moreOfAKind)[0],
              "0: 150 more of: line without level and tag; not listed singly");
    EXPECT_EQ(readGedcomBytes(document(records), "x", {250}).diagnostics().size(), 250U);
}

TEST(BrokenFiles, quotedTextIsShortAndFitToPrint) {
    const GedcomData data = read(document(std::string("\x1B[2J\xFF").append(1000, 'x').append("\n")));
    ASSERT_EQ(reported(data, DiagnosticKind::notALine).size(), 1U);
    EXPECT_EQ(reported(data, DiagnosticKind::notALine)[0],
              std::string("6: not a line with level and tag (?[2J?").append(55, 'x').append("...); skipped"));
}

TEST(BrokenFiles, aDateWithDayAndMonthInDoubtIsReported) {
    const GedcomData data =
        read(document("0 @I1@ INDI\n1 BIRT\n2 DATE 05/06/1900\n1 DEAT\n2 DATE 24/01/1915\n"));
    ASSERT_EQ(reported(data, DiagnosticKind::ambiguousDate).size(), 1U);
    EXPECT_EQ(reported(data, DiagnosticKind::ambiguousDate)[0],
              "8: a date whose day and month may be either way round (05/06/1900); its year alone is read");
    EXPECT_EQ(data.diagnostics().size(), 1U);
    EXPECT_EQ(data.diagnostics()[0].severity, Severity::note);
}

}  // namespace
}  // namespace olvane::gedcom::test
