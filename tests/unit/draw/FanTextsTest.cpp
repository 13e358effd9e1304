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
    FanTextRoom room;
    room.breadth = width;
    room.height = height;
    return room;
}

// Narrower the farther a line is from the middle.
FanTextRoom disc(double radius) {
    FanTextRoom room;
    room.form = FanTextRoom::Form::disc;
    room.height = 2 * radius;
    room.outer = radius;
    return room;
}

// Of a quarter of a ring.
FanTextRoom quarter(FanTextRoom::Form form, bool isReversed) {
    FanTextRoom room;
    room.form = form;
    room.height = 60;
    room.inner = 100;
    room.middle = 130;
    room.outer = 160;
    room.slope = 1;
    room.isReversed = isReversed;
    return room;
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

// By hand: a line of 20 whose middle is 20 above that of the ring reaches to a radius of 160, one below it to 120.
TEST(FanTexts, linesAcrossARingEndAtItsOuterArcAndItsSides) {
    const FanTextRoom upper = quarter(FanTextRoom::Form::across, false);
    EXPECT_EQ(upper.width(-20, 20), 0);
    EXPECT_DOUBLE_EQ(upper.width(20, 20), 2 * std::min(100.0 - 4, std::sqrt(160.0 * 160 - 120 * 120)));
    const FanTextRoom lower = quarter(FanTextRoom::Form::across, true);
    EXPECT_EQ(lower.width(20, 20), 0);
    EXPECT_EQ(lower.width(-20, 20), upper.width(20, 20));
}

TEST(FanTexts, linesAlongTheRadiusEndAtBothArcs) {
    const FanTextRoom room = quarter(FanTextRoom::Form::along, false);
    EXPECT_DOUBLE_EQ(room.width(0, 0), 60);
    EXPECT_EQ(room.width(90, 12), 0);  // 128 from the middle, as (128, 96) lies on the arc
    EXPECT_NEAR(room.width(30, 20), 2 * (154.92 - 130), 0.01);
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
