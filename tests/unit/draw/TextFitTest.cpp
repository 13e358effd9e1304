// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Fitting names into the width of a box.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include <olvane/draw/TextFitInternal.h>

namespace olvane::draw {
namespace {

using testing::ElementsAre;

const Font kFont{12, true};
const std::string kEllipsis = "\xE2\x80\xA6";

TEST(TextFit, shortNameStaysOnOneLine) {
    const FittedText fitted = fitText("Anna Maria", kFont, 200, 2);
    EXPECT_THAT(fitted.lines, ElementsAre("Anna Maria"));
    EXPECT_FALSE(fitted.shortened);
}

TEST(TextFit, nameBreaksBetweenWords) {
    EXPECT_THAT(fitText("Anna Maria", kFont, 60, 2).lines, ElementsAre("Anna", "Maria"));
}

TEST(TextFit, doubleNameBreaksBehindItsHyphen) {
    EXPECT_THAT(fitText("Cavendish-Bentinck", kFont, 100, 2).lines, ElementsAre("Cavendish-", "Bentinck"));
}

TEST(TextFit, leadingHyphenStaysWithItsWord) {
    EXPECT_THAT(fitText("-x", kFont, 100, 1).lines, ElementsAre("-x"));
}

TEST(TextFit, tooManyWordsEndInAnEllipsis) {
    const FittedText fitted = fitText("Anna Maria Louisa Josepha", kFont, 60, 2);
    EXPECT_THAT(fitted.lines, ElementsAre("Anna", "Maria" + kEllipsis));
    EXPECT_TRUE(fitted.shortened);
}

TEST(TextFit, longWordIsBrokenAndSaysSo) {
    const FittedText fitted = fitText("Wolfeschlegelsteinhausen", kFont, 60, 5);
    EXPECT_TRUE(fitted.wordBroken);
    std::string joined;
    for (const std::string& line : fitted.lines) joined += line;
    EXPECT_EQ(joined, "Wolfeschlegelsteinhausen");
}

TEST(TextFit, noTextGivesNoLines) {
    EXPECT_TRUE(fitText("", kFont, 60, 2).lines.empty());
    EXPECT_TRUE(fitText("   ", kFont, 60, 2).lines.empty());
}

TEST(TextFit, noLinesAllowedLeavesNothing) {
    EXPECT_TRUE(fitText("Anna", kFont, 60, 0).lines.empty());
}

TEST(TextFit, lettersAreNeverTornFromTheirMarks) {
    std::string name;
    for (int i = 0; i < 40; ++i) name += "e\xCC\x81";
    for (const std::string& line : fitText(name, kFont, 50, 3).lines) {
        const std::string letters = line.ends_with(kEllipsis) ? line.substr(0, line.size() - 3) : line;
        ASSERT_EQ(letters.size() % 3, 0u) << line;
        EXPECT_TRUE(letters.starts_with('e'));
    }
}

TEST(TextFit, everyLineFitsWhateverTheName) {
    const std::vector<std::string> names = {
        "Augusta Marie Luise Katharina",  "Schleswig-Holstein-Sonderburg-Glücksburg",
        "毛泽东毛泽东毛泽东毛泽东毛泽东", "محمد بن عبد الله بن عبد المطلب",
        "MMMMMMMMMMMMMMMMMMMMMMMMMMMMMM", "a b c d e f g h i j k l m n o p q r s t"};
    for (const std::string& name : names) {
        for (double width = 20; width < 200; width += 7) {
            for (const std::string& line : fitText(name, kFont, width, 3).lines) {
                EXPECT_LE(textWidth(line, kFont), width) << line;
            }
            EXPECT_LE(textWidth(fitLine(name, kFont, width), kFont), width);
        }
    }
}

TEST(TextFit, lineTooNarrowForAnEllipsisIsEmpty) {
    EXPECT_EQ(fitLine("Anna", kFont, 5), "");
}

}  // namespace
}  // namespace olvane::draw
