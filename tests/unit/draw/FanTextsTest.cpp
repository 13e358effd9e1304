// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/draw/FanTextsInternal.h>

#include <gtest/gtest.h>

#include <cmath>
#include <string>
#include <vector>

#include "Chooser.h"

namespace olvane::draw {
namespace {

using picture::NameLoss;
using picture::textWidth;

FanTextRoom rectangle(double width, double height) {
    return {height, [width](double, double) { return width; }};
}

// Narrower the farther a line is from the middle.
FanTextRoom disc(double radius) {
    return {2 * radius, [radius](double offset, double height) {
                const double reach = std::abs(offset) + height / 2;
                return reach < radius ? 2 * std::sqrt(radius * radius - reach * reach) : 0;
            }};
}

FanText anna() {
    return {"Anna Charlotte Sophie", "von Hohenlohe-Langenburg", false, {"* 1763", "\xE2\x80\xA0 1811"}};
}

std::vector<std::string> textsOf(const FanTextLines& fitted) {
    std::vector<std::string> texts;
    for (const FanTextLine& line : fitted.lines) texts.push_back(line.text);
    return texts;
}

using Texts = std::vector<std::string>;

TEST(FanTexts, aNameHasItsSurnameOnALineOfItsOwnAndFactsBelow) {
    const FanTextLines fitted = fitFanText({"Anna", "Berg", false, {"* 1763", "x"}}, rectangle(150, 100));
    EXPECT_EQ(textsOf(fitted), (Texts{"Anna", "Berg", "* 1763  x"}));
    EXPECT_EQ(fitted.lines[0].size, 13);
    EXPECT_TRUE(fitted.lines[1].isName);
    EXPECT_FALSE(fitted.lines[2].isName);
    EXPECT_LT(fitted.lines[0].offset, fitted.lines[1].offset);
    EXPECT_EQ(fitted.lines[1].offset, 0);
    const FanTextLines other = fitFanText({"Anna", "Berg", true, {}}, rectangle(150, 100));
    EXPECT_EQ(textsOf(other), (Texts{"Berg", "Anna"}));
}

TEST(FanTexts, aLongNameTakesMoreLinesBeforeItsLettersShrink) {
    const FanTextLines fitted = fitFanText(anna(), rectangle(150, 100));
    EXPECT_EQ(fitted.lines.front().size, 13);
    EXPECT_GT(fitted.lines.size(), 3u);
    EXPECT_EQ(fitted.loss, NameLoss::nothing);
}

TEST(FanTexts, lettersShrinkBeforeANameIsCut) {
    const FanTextLines fitted = fitFanText(anna(), rectangle(160, 40));
    EXPECT_EQ(fitted.loss, NameLoss::nothing);
    EXPECT_LT(fitted.lines.front().size, 13);
    EXPECT_GE(fitted.lines.front().size, 8);
}

TEST(FanTexts, namesAreCutOnlyInTheSmallestLetters) {
    const FanTextLines fitted = fitFanText(anna(), rectangle(60, 40));
    EXPECT_EQ(fitted.loss, NameLoss::letters);
    EXPECT_EQ(fitted.lines.front().size, 8);
}

TEST(FanTexts, datesThatAreTooWideForALineTakeTwo) {
    const FanTextLines fitted =
        fitFanText({"Anna", "Berg", false, {"* 12 February 1763", "\xE2\x80\xA0 30 November 1811", "=1"}},
                   rectangle(130, 100));
    EXPECT_EQ(textsOf(fitted),
              (Texts{"Anna", "Berg", "* 12 February 1763", "\xE2\x80\xA0 30 November 1811  =1"}));
}

TEST(FanTexts, aThinCellLosesItsFactsBeforeItsName) {
    const FanTextLines fitted = fitFanText({"Anna", "Berg", false, {"* 1763"}}, rectangle(150, 12));
    EXPECT_EQ(textsOf(fitted), (Texts{"Anna Berg"}));
    EXPECT_EQ(fitted.lines[0].size, 12);
    EXPECT_EQ(textsOf(fitFanText({"Anna", "Berg", false, {"* 1763"}}, rectangle(150, 16))),
              (Texts{"Anna Berg", "* 1763"}));
    EXPECT_TRUE(fitFanText({"Anna", "Berg", false, {}}, rectangle(150, 5)).lines.empty());
}

// A name in one line is written smaller where that keeps it whole.
TEST(FanTexts, aThinCellHasSmallerLettersBeforeItsNameIsCut) {
    const FanTextLines fitted = fitFanText({"Wilhelmine Auguste", "Berg", false, {}}, rectangle(130, 13));
    EXPECT_EQ(fitted.loss, NameLoss::nothing);
    EXPECT_EQ(fitted.lines.size(), 1u);
    EXPECT_LT(fitted.lines[0].size, 13);
}

TEST(FanTexts, everyLineLiesInItsRoom) {
    const std::vector<std::string> given{"", "Anna", "Maria Theresia Josepha", "Bo", "Wilhelmine"};
    const std::vector<std::string> surnames{"Berg", "von Hohenlohe-Langenburg", "", "of_Saxe-Coburg"};
    for (unsigned seed = 1; seed <= 400; ++seed) {
        SCOPED_TRACE(seed);
        const Chooser choose(seed);
        FanText text;
        text.given = given[static_cast<std::size_t>(choose(5))];
        text.surname = surnames[static_cast<std::size_t>(choose(4))];
        if (text.given.empty() && text.surname.empty()) text.given = "?";
        text.surnameFirst = choose(2) == 0;
        if (choose(2) == 0) text.facts.push_back("* 1763");
        if (choose(2) == 0) text.facts.push_back("\xE2\x80\xA0 30 NOV 1811");
        const FanTextRoom room =
            choose(2) == 0 ? disc(20 + choose(80)) : rectangle(20 + choose(200), 3 + choose(150));
        const FanTextLines fitted = fitFanText(text, room);
        for (const FanTextLine& line : fitted.lines) {
            EXPECT_LE(std::abs(line.offset) + line.size / 2, room.height / 2 + 1e-6) << line.text;
            EXPECT_LE(textWidth(line.text, {line.size, line.isName}),
                      room.width(line.offset, line.size) + 1e-6)
                << line.text;
        }
    }
}

}  // namespace
}  // namespace olvane::draw
