// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Cells of round charts: their outlines, and where their texts stand.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include <olvane/draw/FanCell.h>

namespace olvane::draw {
namespace {

// From the top to the right, with the chart's middle at (200, 100).
FanCell quarter() {
    return {0, 90, 50, 100, 200, 100, false};
}

TEST(FanCell, aPieceOfARingGoesOutsideClockwiseAndInsideBack) {
    EXPECT_EQ(outlineOf(quarter()), "M200 0A100 100 0 0 1 300 100L250 100A50 50 0 0 0 200 50Z");
}

TEST(FanCell, moreThanHalfATurnIsTheLargeArc) {
    EXPECT_EQ(outlineOf({0, 270, 50, 100, 0, 0, false}),
              "M0 -100A100 100 0 1 1 -100 0L-50 0A50 50 0 1 0 0 -50Z");
}

TEST(FanCell, withoutAHoleAPieceMeetsInTheMiddle) {
    EXPECT_EQ(outlineOf({0, 90, 0, 100, 0, 0, false}), "M0 -100A100 100 0 0 1 100 0L0 0Z");
}

TEST(FanCell, aWholeRingIsTwoCircles) {
    EXPECT_EQ(outlineOf({0, 360, 10, 20, 0, 0, false}),
              "M0 -20A20 20 0 0 1 0 20A20 20 0 0 1 0 -20ZM0 -10A10 10 0 0 0 0 10A10 10 0 0 0 0 -10Z");
}

TEST(FanCell, ofAPictureItHasTheRingsOfItsBoxInTheScaleAsked) {
    picture::Picture fan;
    fan.ringRadii = {0, 30, 70};
    fan.arcs = {{.ring = 0, .from = 0, .to = 360}, {.ring = 1, .from = 90, .to = 180}};
    const FanCell centre = FanCell::of(fan, 0);
    EXPECT_TRUE(centre.isCentre);
    EXPECT_EQ(centre.outer, 30);
    const FanCell cell = FanCell::of(fan, 1, 2);
    EXPECT_FALSE(cell.isCentre);
    EXPECT_EQ(cell.inner, 60);
    EXPECT_EQ(cell.outer, 140);
    EXPECT_EQ(cell.from, 90);
}

// Around the top a name is read across the cell, at the bottom as well, and at neither is it upside down.
TEST(FanCell, textAcrossIsNeverUpsideDown) {
    const std::vector<PlacedFanLine> top =
        placedTextOf({-45, 45, 100, 160, 0, 0, false}, {"Anna", "", false, {}});
    ASSERT_EQ(top.size(), 1U);
    EXPECT_TRUE(top[0].isName);
    EXPECT_NEAR(top[0].x, 0, 1e-9);
    EXPECT_NEAR(top[0].y, -130, 1e-9);
    EXPECT_EQ(top[0].turn, 0);
    const std::vector<PlacedFanLine> below =
        placedTextOf({135, 225, 100, 160, 0, 0, false}, {"Anna", "", false, {}});
    ASSERT_EQ(below.size(), 1U);
    EXPECT_NEAR(below[0].y, 130, 1e-9);
    EXPECT_EQ(below[0].turn, 360);
}

// A cell of 6 degrees is 12 px broad, and 90 deep.
TEST(FanCell, textFollowsTheRadiusOfANarrowCell) {
    const std::vector<PlacedFanLine> right =
        placedTextOf({87, 93, 120, 210, 0, 0, false}, {"Anna", "", false, {}});
    ASSERT_EQ(right.size(), 1U);
    EXPECT_EQ(right[0].turn, 0);
    EXPECT_NEAR(right[0].x, 165, 1e-9);
    const std::vector<PlacedFanLine> left =
        placedTextOf({267, 273, 120, 210, 0, 0, false}, {"Anna", "", false, {}});
    ASSERT_EQ(left.size(), 1U);
    EXPECT_EQ(left[0].turn, 360);
    EXPECT_NEAR(left[0].x, -165, 1e-9);
}

TEST(FanCell, theTextOfTheCentreStandsUprightAroundTheMiddle) {
    const std::vector<PlacedFanLine> lines =
        placedTextOf({0, 360, 0, 60, 10, 20, true}, {"Anna", "Berg", false, {"* 1800"}});
    ASSERT_GE(lines.size(), 2U);
    double height = 0;
    for (const PlacedFanLine& line : lines) {
        EXPECT_EQ(line.x, 10);
        EXPECT_EQ(line.turn, 0);
        height += line.y - 20;
    }
    EXPECT_NEAR(height, 0, 1e-9);
}

}  // namespace
}  // namespace olvane::draw
