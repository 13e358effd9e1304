// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines of families as path data, for screens and for files.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include <olvane/draw/LinePaths.h>
#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {
namespace {

using picture::Line;
using picture::LineRole;

// A divorced couple above two children, of whom the second is adopted; one piece jumps at the given places.
picture::Picture family(std::vector<double> bridges) {
    picture::Picture made;
    for (int i = 0; i < 4; ++i) {
        made.boxes.push_back({.id = i + 1, .x = 100.0F * static_cast<float>(i), .width = 55, .height = 80});
    }
    made.members = {0, 1, 2, 3};
    made.childKinds = {kin::ChildKind::birth, kin::ChildKind::birth, kin::ChildKind::birth,
                       kin::ChildKind::adopted};
    made.bridges = std::move(bridges);
    const auto jumps = static_cast<std::uint16_t>(made.bridges.size());
    made.lines.push_back({.x1 = 55, .y1 = 40, .x2 = 100, .y2 = 40, .role = LineRole::marriage});
    made.lines.push_back(
        {.x1 = 300, .y1 = 100, .x2 = 0, .y2 = 100, .bridgeCount = jumps, .role = LineRole::bar});
    made.lines.push_back({.x1 = 0, .y1 = 100, .x2 = 0, .y2 = 110, .child = 2, .role = LineRole::stem});
    made.lines.push_back({.x1 = 300, .y1 = 110, .x2 = 300, .y2 = 100, .child = 3, .role = LineRole::stem});
    picture::Family couple;
    couple.parentCount = 2;
    couple.childCount = 2;
    couple.lineCount = 4;
    couple.style = kin::UnionState::divorced;
    made.families.push_back(couple);
    return made;
}

std::string plainOf(const picture::Picture& picture) {
    return linePathsOf(picture, picture.families[0]).front().data;
}

TEST(LinePaths, eachStyleHasOnePathAndThePlainOneIsFirst) {
    const picture::Picture picture = family({});
    const std::vector<LinePath> paths = linePathsOf(picture, picture.families[0]);
    ASSERT_EQ(paths.size(), 3U);
    EXPECT_EQ(paths[0].style, LineStyle::plain);
    EXPECT_EQ(paths[0].data, "M0 100H300M0 100V110");
    EXPECT_EQ(paths[1].style, LineStyle::divorced);
    EXPECT_EQ(paths[1].data, "M55 40H100");
    EXPECT_EQ(paths[2].style, LineStyle::adopted);
    EXPECT_EQ(paths[2].data, "M300 100V110");
}

// Up in a quarter of a circle of 4 px, and down in another.
TEST(LinePaths, aJumpIsAnArcAroundItsPlace) {
    EXPECT_EQ(plainOf(family({50})), "M0 100H46a4 4 0 0 1 4 -4a4 4 0 0 1 4 4H300M0 100V110");
}

TEST(LinePaths, jumpsThatAreCloseAreOne) {
    EXPECT_EQ(plainOf(family({58, 50})), "M0 100H46a4 4 0 0 1 4 -4H58a4 4 0 0 1 4 4H300M0 100V110");
    EXPECT_EQ(plainOf(family({50, 58.2})),
              "M0 100H46a4 4 0 0 1 4 -4a4 4 0 0 1 4 4H54.2a4 4 0 0 1 4 -4a4 4 0 0 1 4 4H300M0 100V110");
}

TEST(LinePaths, everyStyleButThePlainOneHasDashesAndAMeaning) {
    for (std::size_t i = 0; i < kLineStyles; ++i) {
        const auto style = static_cast<LineStyle>(i);
        EXPECT_EQ(dashesOf(style).empty(), style == LineStyle::plain);
        EXPECT_EQ(meaningOf(style, kin::Language::german).empty(), style == LineStyle::plain);
    }
    EXPECT_EQ(meaningOf(LineStyle::divorced, kin::Language::english), "divorced");
}

// What a file has is the same path with two px for a point, from a corner that lies at 28 px.
TEST(LinePaths, aFileHasTheSamePieces) {
    DrawingContent content;
    content.picture = family({});
    content.labelOf = [](std::int64_t) { return kin::PersonLabel(); };
    DrawingOptions options;
    options.headline = false;
    const std::string svg = drawSvg(content, options).svg;
    EXPECT_NE(svg.find("<path d=\"M28 228H628M28 228V248\"/>"), std::string::npos);
    EXPECT_NE(svg.find(" stroke-dasharray=\"" + std::string(dashesOf(LineStyle::divorced)) +
                       "\" d=\"M138 108H228\"/>"),
              std::string::npos);
}

}  // namespace
}  // namespace olvane::draw
