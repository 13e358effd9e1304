// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/Extent.h>

#include <gtest/gtest.h>

namespace olvane::picture {
namespace {

TEST(Extent, isAroundBoxesAndLines) {
    Picture picture;
    Box& box = picture.boxes.emplace_back();
    box.x = -10;
    box.y = 5;
    box.width = 55;
    box.height = 80;
    Line& line = picture.lines.emplace_back();
    line.x1 = 200;
    line.x2 = 40;  // from right to left
    line.y1 = line.y2 = -3;
    const Extent extent = extentOf(picture);
    EXPECT_EQ(extent.left, -10);
    EXPECT_EQ(extent.right, 200);
    EXPECT_EQ(extent.top, -3);
    EXPECT_EQ(extent.bottom, 85);
    EXPECT_EQ(extent.width(), 210);
    EXPECT_EQ(extent.height(), 88);
}

TEST(Extent, ofNothingIsNothing) {
    const Extent extent = extentOf(Picture());
    EXPECT_EQ(extent.left, 0);
    EXPECT_EQ(extent.width(), 0);
    EXPECT_EQ(extent.height(), 0);
}

TEST(Sides, standOppositeInPairs) {
    EXPECT_EQ(opposite(Side::top), Side::bottom);
    EXPECT_EQ(opposite(Side::bottom), Side::top);
    EXPECT_EQ(opposite(Side::left), Side::right);
    EXPECT_EQ(opposite(Side::right), Side::left);
}

}  // namespace
}  // namespace olvane::picture
