// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Measuring: what a text is wide, what a reader calls a character, and what may stand in a picture.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include <olvane/picture/TextMetrics.h>

namespace olvane::picture {
namespace {

TEST(TextMetrics, widthGrowsWithTheSizeOfTheFont) {
    EXPECT_DOUBLE_EQ(textWidth("Anna", {20, false}), 2 * textWidth("Anna", {10, false}));
}

TEST(TextMetrics, boldIsWiderThanRegular) {
    EXPECT_GT(textWidth("Wilhelmina", {12, true}), textWidth("Wilhelmina", {12, false}));
}

TEST(TextMetrics, narrowLettersAreNarrower) {
    EXPECT_LT(textWidth("iii", {12, false}), textWidth("mmm", {12, false}) / 2);
}

TEST(TextMetrics, combiningMarkAddsNothing) {
    EXPECT_DOUBLE_EQ(textWidth("e\xCC\x81", {12, false}), textWidth("e", {12, false}));
}

TEST(TextMetrics, eastAsianCharacterTakesOneEm) {
    EXPECT_DOUBLE_EQ(textWidth("毛", {12, false}), 12);
}

TEST(TextMetrics, characterWithoutAGlyphIsTakenAsWide) {
    EXPECT_GE(textWidth("\xE0\xA4\x95", {10, false}), 7);
}

TEST(TextMetrics, lettersKeepTheirMarksWhenTakenApart) {
    EXPECT_THAT(graphemeClusters("ae\xCC\x81o"), testing::ElementsAre("a", "e\xCC\x81", "o"));
}

TEST(TextMetrics, emptyTextHasNoCharacters) {
    EXPECT_TRUE(graphemeClusters("").empty());
}

TEST(TextMetrics, flagsAndFamiliesOfEmojiStayWhole) {
    EXPECT_EQ(graphemeClusters("\xF0\x9F\x91\xA9\xE2\x80\x8D\xF0\x9F\x91\xA7").size(), 1u);
}

TEST(TextMetrics, lineEndsAndTabsBecomeSpaces) {
    EXPECT_EQ(cleanText("a\tb\nc\rd"), "a b c d");
}

TEST(TextMetrics, controlCharactersAndBrokenBytesAreReplaced) {
    EXPECT_EQ(cleanText(std::string("a\0b", 3)),
              "a\xEF\xBF\xBD"
              "b");
    EXPECT_EQ(cleanText("a\xFF"), "a\xEF\xBF\xBD");
    EXPECT_EQ(cleanText("a\xC3"), "a\xEF\xBF\xBD");
    EXPECT_EQ(cleanText("\xEF\xBF\xBE"), "\xEF\xBF\xBD");
}

TEST(TextMetrics, cleaningIsDoneOnce) {
    EXPECT_EQ(cleanText(cleanText("a\xFF\tb")), cleanText("a\xFF\tb"));
}

TEST(TextMetrics, firstLetterWithADirectionDecides) {
    EXPECT_TRUE(runsRightToLeft("שרה"));
    EXPECT_TRUE(runsRightToLeft("(1) محمد"));
    EXPECT_FALSE(runsRightToLeft("Sara שרה"));
    EXPECT_FALSE(runsRightToLeft("123"));
}

TEST(TextMetrics, surrogatesAndOverlongBytesAreReplaced) {
    EXPECT_EQ(cleanText("\xED\xA0\x80"), "\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_EQ(cleanText("\xE0\x80\x80"), "\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_EQ(cleanText("\xF4\x90\x80\x80").size(), 12u);
}

TEST(TextMetrics, separatorsOfLinesBecomeSpaces) {
    EXPECT_EQ(cleanText("a\u2028b\u2029c"), "a b c");
}

TEST(TextMetrics, syllablesOfHangulAreClustersOfOneEm) {
    EXPECT_EQ(graphemeClusters("한글").size(), 2u);
    EXPECT_DOUBLE_EQ(textWidth("한글", {10, false}), 20);
}

TEST(TextMetrics, aTextIsCutBetweenCharactersThatAreClustersOfTheirOwn) {
    // Four bytes each behind one, so that the bound lies within one.
    std::string name = "a";
    for (std::size_t i = 0; i < kMostTextBytes; ++i) name += "\xF0\x9F\xA7\x99";
    const std::string cut = cutText(name);
    EXPECT_EQ(cut, name.substr(0, 1 + 4 * 248) + "\xE2\x80\xA6");
}

TEST(TextMetrics, shortTextIsNotCut) {
    EXPECT_EQ(cutText(std::string(kMostTextBytes, 'a')), std::string(kMostTextBytes, 'a'));
}

TEST(TextMetrics, longTextIsCutBetweenClusters) {
    std::string name;
    for (int i = 0; i < 100000; ++i) name += "e\u0301";
    const std::string cut = cutText(name);
    EXPECT_LE(cut.size(), kMostTextBytes + 3);
    EXPECT_TRUE(cut.ends_with("e\u0301\u2026")) << cut;
}

TEST(TextMetrics, oneEndlessClusterIsCutBetweenCharacters) {
    std::string name = "e";
    for (int i = 0; i < 100000; ++i) name += "\u0301";
    const std::string cut = cutText(name);
    EXPECT_LE(cut.size(), kMostTextBytes + 3);
    EXPECT_EQ(cleanText(cut), cut);
}

}  // namespace
}  // namespace olvane::picture
