// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Measuring: what a text is wide, what a reader calls a character, and what may stand in a picture.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include <olvane/draw/TextMeasureInternal.h>

namespace olvane::draw {
namespace {

TEST(TextMeasure, widthGrowsWithTheSizeOfTheFont) {
    EXPECT_DOUBLE_EQ(textWidth("Anna", {20, false}), 2 * textWidth("Anna", {10, false}));
}

TEST(TextMeasure, boldIsWiderThanRegular) {
    EXPECT_GT(textWidth("Wilhelmina", {12, true}), textWidth("Wilhelmina", {12, false}));
}

TEST(TextMeasure, narrowLettersAreNarrower) {
    EXPECT_LT(textWidth("iii", {12, false}), textWidth("mmm", {12, false}) / 2);
}

TEST(TextMeasure, combiningMarkAddsNothing) {
    EXPECT_DOUBLE_EQ(textWidth("e\xCC\x81", {12, false}), textWidth("e", {12, false}));
}

TEST(TextMeasure, eastAsianCharacterTakesOneEm) {
    EXPECT_DOUBLE_EQ(textWidth("毛", {12, false}), 12);
}

TEST(TextMeasure, characterWithoutAGlyphIsTakenAsWide) {
    EXPECT_GE(textWidth("\xE0\xA4\x95", {10, false}), 7);
}

TEST(TextMeasure, lettersKeepTheirMarksWhenTakenApart) {
    EXPECT_THAT(readersCharacters("ae\xCC\x81o"), testing::ElementsAre("a", "e\xCC\x81", "o"));
}

TEST(TextMeasure, emptyTextHasNoCharacters) {
    EXPECT_TRUE(readersCharacters("").empty());
}

TEST(TextMeasure, flagsAndFamiliesOfEmojiStayWhole) {
    EXPECT_EQ(readersCharacters("\xF0\x9F\x91\xA9\xE2\x80\x8D\xF0\x9F\x91\xA7").size(), 1u);
}

TEST(TextMeasure, lineEndsAndTabsBecomeSpaces) {
    EXPECT_EQ(cleanText("a\tb\nc\rd"), "a b c d");
}

TEST(TextMeasure, controlCharactersAndBrokenBytesAreReplaced) {
    EXPECT_EQ(cleanText(std::string("a\0b", 3)),
              "a\xEF\xBF\xBD"
              "b");
    EXPECT_EQ(cleanText("a\xFF"), "a\xEF\xBF\xBD");
    EXPECT_EQ(cleanText("a\xC3"), "a\xEF\xBF\xBD");
    EXPECT_EQ(cleanText("\xEF\xBF\xBE"), "\xEF\xBF\xBD");
}

TEST(TextMeasure, cleaningIsDoneOnce) {
    EXPECT_EQ(cleanText(cleanText("a\xFF\tb")), cleanText("a\xFF\tb"));
}

TEST(TextMeasure, firstLetterWithADirectionDecides) {
    EXPECT_TRUE(runsRightToLeft("שרה"));
    EXPECT_TRUE(runsRightToLeft("(1) محمد"));
    EXPECT_FALSE(runsRightToLeft("Sara שרה"));
    EXPECT_FALSE(runsRightToLeft("123"));
}

}  // namespace
}  // namespace olvane::draw
