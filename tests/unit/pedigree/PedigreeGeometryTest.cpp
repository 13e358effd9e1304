// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The slots of the chart: columns 80 apart, slots 110 apart in every column, each column centred on y 0.

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <utility>
#include <vector>

#include "HandMadePedigree.h"

namespace {

using views::Point;

class PedigreeGeometry : public views::HandMadePedigree {
protected:
    Point slot(int generation, int index) const {
        const TreePoint at = layouter.getCenterPointForGeneration(generation, index);
        return Point{at.x, at.y};
    }
};

TEST_F(PedigreeGeometry, heightOfAStackHasGapsBetweenItsBoxes) {
    const std::vector<std::pair<int, float>> rows{
        {0, 0.0f}, {1, 80.0f}, {2, 190.0f}, {3, 300.0f}, {4, 410.0f}};
    for (const auto& [count, height] : rows) {
        EXPECT_EQ(height, layouter.heightForNodeCount(count)) << count;
    }
}

TEST_F(PedigreeGeometry, emptyStackHasNoHeight) {
    EXPECT_EQ(0.0f, layouter.heightForNodeCount(0));
}

TEST_F(PedigreeGeometry, focusStandsInTheFirstSlot) {
    EXPECT_EQ((Point{27.5f, 0.0f}), slot(0, 0));
}

TEST_F(PedigreeGeometry, slotsOfAColumnStandOnePitchApartAroundZero) {
    EXPECT_EQ((Point{107.5f, -55.0f}), slot(1, 0));
    EXPECT_EQ((Point{107.5f, 55.0f}), slot(1, 1));
    const std::vector<float> third{-165, -55, 55, 165};
    for (int index = 0; index < 4; ++index) {
        EXPECT_EQ((Point{187.5f, third[static_cast<std::size_t>(index)]}), slot(2, index)) << index;
    }
    const std::vector<float> fourth{-385, -275, -165, -55, 55, 165, 275, 385};
    for (int index = 0; index < 8; ++index) {
        EXPECT_EQ((Point{267.5f, fourth[static_cast<std::size_t>(index)]}), slot(3, index)) << index;
    }
}

TEST_F(PedigreeGeometry, parentsAreCentredOnTheirChildInTheFirstColumnOnly) {
    EXPECT_EQ(slot(0, 0).y, (slot(1, 0).y + slot(1, 1).y) * 0.5f);
    EXPECT_EQ(-55.0f, slot(1, 0).y);
    EXPECT_EQ(-110.0f, (slot(2, 0).y + slot(2, 1).y) * 0.5f);
}

TEST_F(PedigreeGeometry, columnBeforeTheFirstHasNoSlotsAndNoHeight) {
    EXPECT_EQ((Point{-52.5f, 40.0f}), slot(-1, 0));
    EXPECT_EQ((Point{-52.5f, 150.0f}), slot(-1, 1));
}

// 2^30 slots still fit an int; beyond that the number of slots stays at the greatest int.
TEST_F(PedigreeGeometry, deepColumnsAreAsTallAsAnIntAllows) {
    EXPECT_TRUE(std::isfinite(slot(30, 0).y));
    EXPECT_LT(slot(31, 0).y, slot(30, 0).y);
    EXPECT_EQ(slot(31, 0).y, slot(32, 0).y);
    EXPECT_EQ(slot(31, 0).y, slot(40, 0).y);
    EXPECT_EQ(slot(31, 0).y, slot(2000, 0).y);
    EXPECT_EQ(27.5f + 40.0f * 55.0f + 40.0f * 25.0f, slot(40, 0).x);
}

TEST_F(PedigreeGeometry, slotNumbersAtTheEdgesOfAnIntHaveAPlace) {
    EXPECT_TRUE(std::isfinite(slot(40, std::numeric_limits<int>::max()).y));
    EXPECT_TRUE(std::isfinite(slot(40, std::numeric_limits<int>::min()).y));
}

TEST_F(PedigreeGeometry, slotsFollowTheSizesGiven) {
    layouter.treeSize = TreeSize{100.0f, 40.0f, 10.0f, 20.0f, 10.0f, 0.0f};
    EXPECT_EQ(100.0f, layouter.heightForNodeCount(2));
    EXPECT_EQ((Point{160.0f, -30.0f}), slot(1, 0));
    EXPECT_EQ((Point{160.0f, 30.0f}), slot(1, 1));
}

}  // namespace
