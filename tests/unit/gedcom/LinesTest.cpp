// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lines: their ends, their parts, and values that go on in further lines.

#include <string>

#include <gtest/gtest.h>

#include <olvane/gedcom/LineScannerInternal.h>
#include "GedcomText.h"

namespace olvane::gedcom::test {
namespace {

std::string withLineEnds(const std::string& text, const std::string& lineEnd) {
    std::string changed;
    for (const char c : text) changed.append(c == '\n' ? lineEnd : std::string(1, c));
    return changed;
}

// "level/xref/tag/value" of each line.
std::string scanned(const std::string& bytes) {
    DiagnosticList diagnostics("x", 10);
    LineScanner scanner(bytes, diagnostics);
    GedcomLine line;
    std::string text;
    while (scanner.next(line)) {
        text.append(std::to_string(line.level)).append("/").append(line.xref).append("/");
        text.append(line.tag).append("/").append(scanner.wholeValue(line)).append(";");
    }
    return text;
}

TEST(Lines, allLineEndsAreAlike) {
    const std::string text = document("0 @I1@ INDI\n1 NAME Jane\n2 CONC  /Doe/\nbad line\n1 SEX F\n");
    for (const char* lineEnd : {"\n", "\r", "\r\n"}) {
        const GedcomData data = read(withLineEnds(text, lineEnd));
        EXPECT_EQ(namesOf(data), "Jane Doe");
        EXPECT_EQ(data.person(1).sex, Sex::female);
        EXPECT_EQ(linesReported(data, DiagnosticKind::notALine), "9");
    }
}

TEST(Lines, lineEndsMayBeMixed) {
    EXPECT_EQ(scanned("0 A\r1 B\n1 C\r\n1 D\r\r\n1 E"), "0//A/;1//B/;1//C/;1//D/;1//E/;");
}

TEST(Lines, partsAreTakenAsTheyStand) {
    EXPECT_EQ(scanned("0 @X1@ TAG a value \n1 SUB  two spaces\n\t 2 DEEP\tx\n  1   BACK\n"),
              "0/X1/TAG/a value ;1//SUB/ two spaces;2//DEEP/x;1//BACK/;");
}

TEST(Lines, aMarkInTheMiddleOfAFileIsPassedOver) {
    EXPECT_EQ(scanned("0 A\n\xEF\xBB\xBF"
                      "0 HEAD\n"),
              "0//A/;0//HEAD/;");
}

TEST(Lines, depthFollowsTheLinesBefore) {
    EXPECT_EQ(scanned("0 A\n3 B\n5 C\n5 D\n4 E\n3 F\n1 G\n"), "0//A/;1//B/;2//C/;2//D/;2//E/;1//F/;1//G/;");
    EXPECT_EQ(scanned("1 A\n2 B\n0 C\n"), "1//A/;2//B/;0//C/;");
}

TEST(Lines, valuesGoOnInConcAndContLines) {
    EXPECT_EQ(scanned("0 A one\n1 CONC  two\n1 CONT three\n1 CONC\n1 CONT\n1 CONT four\n1 B\n"),
              "0//A/one two\nthree\n\nfour;1//CONC/ two;1//CONT/three;1//CONC/;1//CONT/;1//CONT/four;1//B/;");
}

TEST(Lines, aContinuationOfAnotherLineIsNotTaken) {
    EXPECT_EQ(scanned("0 A one\n1 B two\n2 CONC x\n1 CONC y\n"), "0//A/one;1//B/twox;2//CONC/x;1//CONC/y;");
    EXPECT_EQ(scanned("0 A one\n1 CONCX y\n"), "0//A/one;1//CONCX/y;");
}

TEST(Lines, aNameJoinsItsLinesOnOne) {
    const GedcomData data = read(document(
        "0 @I1@ INDI\n1 NAME Anna Ma\n2 CONC ria /Lou\n2 CONC ise/\n2 CONT of X\n2 GIVN An\n3 CONC na\n"));
    EXPECT_EQ(namesOf(data), "Anna Maria Louise of X");
    EXPECT_EQ(data.firstName(1).given, "Anna");
    EXPECT_EQ(data.firstName(1).surname, "Louise");
}

TEST(Lines, tagsInSmallLettersAreKnown) {
    EXPECT_EQ(namesOf(read("0 head\n0 @I1@ indi\n1 name Jane\n0 trlr\n")), "Jane");
}

std::string withEnds(std::string text, const std::string& end) {
    for (std::size_t at = text.find('\n'); at != std::string::npos; at = text.find('\n', at + end.size())) {
        text.replace(at, 1, end);
    }
    return text;
}

TEST(Lines, numbersAreRightAfterEveryLineEnd) {
    const std::string text = document("0 @I1@ INDI\n1 NAME Anna \n2 CONC Bert\n\nrubbish\n1 FAMC @F1@\n");
    for (const char* end : {"\n", "\r", "\r\n", "\n\r", "\r\r\n"}) {
        const GedcomData data = read(withEnds(text, end));
        EXPECT_EQ(namesOf(data), "Anna Bert") << static_cast<int>(end[0]) << static_cast<int>(end[1]);
        EXPECT_EQ(linesReported(data, DiagnosticKind::emptyLine), "9");
        EXPECT_EQ(linesReported(data, DiagnosticKind::notALine), "10");
        EXPECT_EQ(linesReported(data, DiagnosticKind::danglingPointer), "11");
    }
}

TEST(Lines, mixedLineEndsCountEachOnce) {
    const GedcomData data =
        read("0 HEAD\n1 CHAR UTF-8\r\n0 @I1@ INDI\n\r\n1 NAME A\r\r\nrubbish\n\rrubbish\r0 TRLR\n");
    EXPECT_EQ(linesReported(data, DiagnosticKind::emptyLine), "4");
    EXPECT_EQ(linesReported(data, DiagnosticKind::notALine), "6 7");
}

TEST(Lines, aLevelOfThirtyDigitsIsReportedAsWritten) {
    const std::string digits = "123456789012345678901234567890";
    const GedcomData data = read(document("0 @I1@ INDI\n" + digits + " NAME Anna\n0" + digits + " SEX M\n"));
    ASSERT_EQ(reported(data, DiagnosticKind::levelJump).size(), 1U);
    EXPECT_EQ(reported(data, DiagnosticKind::levelJump)[0],
              "7: level jumps from 0 to " + digits + " (NAME); read as one below the line before");
    ASSERT_EQ(reported(data, DiagnosticKind::wrongLevel).size(), 1U);
    EXPECT_EQ(reported(data, DiagnosticKind::wrongLevel)[0],
              "8: level badly written (0" + digits + "); read as one below the line before");
    EXPECT_EQ(namesOf(data), "Anna");
}

}  // namespace
}  // namespace olvane::gedcom::test
