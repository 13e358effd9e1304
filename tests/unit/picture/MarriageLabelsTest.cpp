// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The years of marriages, read where they would be drawn.

#include <olvane/picture/MarriageLabels.h>

#include <algorithm>
#include <cmath>
#include <vector>

#include <gtest/gtest.h>

namespace {

using olvane::picture::Box;
using olvane::picture::Family;
using olvane::picture::Index;
using olvane::picture::LabelPlace;
using olvane::picture::LabelSide;
using olvane::picture::Line;
using olvane::picture::LineRole;
using olvane::picture::marriageLabelPlaces;
using olvane::picture::Picture;

constexpr double kSize = 4.75;  // points

Line line(double x1, double y1, double x2, double y2) {
    Line piece;
    piece.x1 = x1;
    piece.y1 = y1;
    piece.x2 = x2;
    piece.y2 = y2;
    piece.role = LineRole::marriage;
    return piece;
}

void addFamily(Picture& picture, Index husband, Index wife, const std::vector<Line>& lines) {
    Family family;
    family.firstMember = static_cast<std::uint32_t>(picture.members.size());
    family.parentCount = 2;
    family.firstLine = static_cast<std::uint32_t>(picture.lines.size());
    family.lineCount = static_cast<std::uint32_t>(lines.size());
    family.number = static_cast<std::uint32_t>(picture.families.size() + 1);
    picture.members.insert(picture.members.end(), {husband, wife});
    picture.lines.insert(picture.lines.end(), lines.begin(), lines.end());
    picture.families.push_back(family);
}

Index addBox(Picture& picture, double x, double y) {
    Box box;
    box.id = static_cast<std::int64_t>(picture.boxes.size() + 1);
    box.x = x;
    box.y = y;
    box.width = 55;
    box.height = 80;
    picture.boxes.push_back(box);
    return static_cast<Index>(picture.boxes.size() - 1);
}

//  [husband]=[wife 0]   [wife 1]   [wife 2]     the first beside him, the line of each other one over those before
Picture husbandOf(int wives) {
    Picture picture;
    const Index husband = addBox(picture, 27, 0);
    for (int i = 0; i < wives; ++i) {
        const double left = 107 + 160.0 * i;
        const Index wife = addBox(picture, left, 0);
        if (i == 0) {
            addFamily(picture, husband, wife, {line(82, 40, left, 40)});
            continue;
        }
        const double out = 102 - 3.0 * i;
        const double in = left - 12.5;
        const double from = 40 - 6.0 * i;
        const double top = -5.0 * i;
        addFamily(picture, husband, wife,
                  {line(82, from, out, from), line(out, from, out, top), line(out, top, in, top),
                   line(in, top, in, 40), line(in, 40, left, 40)});
    }
    return picture;
}

struct Area {
    double left, top, right, bottom;
};

// Four digits of the font that pictures ask for, as wide and as high as they are drawn.
Area inkOf(const LabelPlace& place) {
    constexpr double kInkWidth = 4 * 0.636 * kSize;
    constexpr double kInkHeight = 0.73 * kSize;
    constexpr double kGap = 0.4 * kSize;
    if (place.side == LabelSide::right) {
        return {place.x + kGap, place.y - kInkHeight / 2, place.x + kGap + kInkWidth,
                place.y + kInkHeight / 2};
    }
    const double bottom = place.side == LabelSide::above ? place.y - kGap : place.y + kGap + kInkHeight;
    return {place.x - kInkWidth / 2, bottom - kInkHeight, place.x + kInkWidth / 2, bottom};
}

bool overlap(const Area& a, const Area& b) {
    return a.left < b.right && b.left < a.right && a.top < b.bottom && b.top < a.bottom;
}

Area areaOf(const Line& piece) {
    return {std::min(piece.x1, piece.x2), std::min(piece.y1, piece.y2), std::max(piece.x1, piece.x2),
            std::max(piece.y1, piece.y2)};
}

bool isOn(const LabelPlace& place, const Line& piece) {
    const Area area = areaOf(piece);
    return place.x >= area.left && place.x <= area.right && place.y >= area.top && place.y <= area.bottom;
}

void expectNothingCovered(const Picture& picture) {
    const auto places = marriageLabelPlaces(picture, kSize);
    ASSERT_EQ(places.size(), picture.families.size());
    for (std::size_t i = 0; i < places.size(); ++i) {
        ASSERT_NE(places[i].side, LabelSide::none);
        const auto own = picture.linesOf(picture.families[i]);
        EXPECT_TRUE(
            std::any_of(own.begin(), own.end(), [&](const Line& piece) { return isOn(places[i], piece); }));
        const Area ink = inkOf(places[i]);
        for (std::size_t j = 0; j < i; ++j) EXPECT_FALSE(overlap(ink, inkOf(places[j]))) << i << " and " << j;
        for (const Line& piece : picture.lines) {
            EXPECT_FALSE(overlap(ink, areaOf(piece)))
                << i << ": " << piece.x1 << "," << piece.y1 << " " << piece.x2 << "," << piece.y2;
        }
        for (const Box& box : picture.boxes)
            EXPECT_FALSE(overlap(ink, {box.x, box.y, box.x + 55, box.y + 80})) << i;
    }
}

// The same turned by a quarter, as charts that lie sideways have it.
Picture turned(Picture picture) {
    for (Box& box : picture.boxes) {
        std::swap(box.x, box.y);
        std::swap(box.width, box.height);
    }
    for (Line& piece : picture.lines) {
        std::swap(piece.x1, piece.y1);
        std::swap(piece.x2, piece.y2);
    }
    return picture;
}

TEST(MarriageLabels, ofSeveralMarriagesCoverNothing) {
    for (int wives = 1; wives <= 8; ++wives) {
        SCOPED_TRACE(wives);
        expectNothingCovered(husbandOf(wives));
    }
}

TEST(MarriageLabels, ofOneMarriageStandOverItsLongestLevelPiece) {
    Picture picture;
    const Index husband = addBox(picture, 0, 0);
    const Index wife = addBox(picture, 200, 0);
    addFamily(picture, husband, wife,
              {line(55, 40, 60, 40), line(60, 40, 60, 90), line(60, 90, 190, 90), line(190, 90, 190, 40)});
    const auto places = marriageLabelPlaces(picture, kSize);
    EXPECT_EQ(places[0].x, 125);
    EXPECT_EQ(places[0].y, 90);
    EXPECT_EQ(places[0].side, LabelSide::above);
}

TEST(MarriageLabels, standBesideALineThatIsUprightAlone) {
    const auto places = marriageLabelPlaces(turned(husbandOf(1)), kSize);
    EXPECT_EQ(places[0].side, LabelSide::right);
    EXPECT_EQ(places[0].x, 40);
    EXPECT_EQ(places[0].y, 94.5);
}

TEST(MarriageLabels, haveNoPlaceWithoutAMarriageLine) {
    Picture picture = husbandOf(1);
    picture.lines[0].role = LineRole::stem;
    EXPECT_EQ(marriageLabelPlaces(picture, kSize)[0].side, LabelSide::none);
    EXPECT_TRUE(marriageLabelPlaces(Picture(), kSize).empty());
}

// No room anywhere: the years still do not lie on each other.
TEST(MarriageLabels, coverALineRatherThanAnotherYear) {
    Picture picture = husbandOf(3);
    for (Line& piece : picture.lines) {
        if (piece.y1 == piece.y2 && piece.x2 - piece.x1 > 30) piece.y1 = piece.y2 = piece.y1 / 5;
    }
    const auto places = marriageLabelPlaces(picture, kSize);
    for (std::size_t i = 0; i < places.size(); ++i) {
        for (std::size_t j = 0; j < i; ++j) EXPECT_FALSE(overlap(inkOf(places[i]), inkOf(places[j])));
    }
}

// Digits of 10 are 7.5 high and stay 4 away from their line; beside one, their middle is about at its place.
TEST(MarriageLabels, haveABaselineThatLeavesAGapToTheLine) {
    using olvane::picture::labelOffsetOf;
    EXPECT_EQ(labelOffsetOf(LabelSide::above, 10).x, 0);
    EXPECT_DOUBLE_EQ(labelOffsetOf(LabelSide::above, 10).y, -4);
    EXPECT_EQ(labelOffsetOf(LabelSide::below, 10).x, 0);
    EXPECT_DOUBLE_EQ(labelOffsetOf(LabelSide::below, 10).y, 11.5);
    EXPECT_DOUBLE_EQ(labelOffsetOf(LabelSide::right, 10).x, 4);
    EXPECT_DOUBLE_EQ(labelOffsetOf(LabelSide::right, 10).y, 10.0 / 3);
}

}  // namespace
