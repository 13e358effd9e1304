// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The colours of lines of descent, as the legend of a fan has them.

#include <gtest/gtest.h>

#include <regex>
#include <set>
#include <string>
#include <vector>

#include <olvane/charts/Charts.h>
#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {
namespace {

// Of the fan of somebody with that many children, in the order of the children.
std::vector<std::string> coloursOfChildren(int children, const DrawingTheme& theme) {
    kin::KinGraphBuilder builder;
    const kin::Place focus = builder.addPerson(1, kin::Sex::female);
    const kin::UnionPlace u = builder.addUnion(kin::kNobody, focus, kin::UnionState::unknown);
    for (int i = 0; i < children; ++i) {
        builder.addChild(u, builder.addPerson(2 + i, kin::Sex::male), kin::ChildKind::birth);
    }
    charts::ChartRequest request;
    request.view = charts::View::fan;
    request.fanOf = charts::FanOf::descendants;
    request.focus = focus;
    DrawingContent content;
    content.picture = charts::chartOf(builder.build(), request);
    content.labelOf = [](std::int64_t) { return kin::PersonLabel(); };
    DrawingOptions options;
    options.theme = &theme;
    const std::string svg = drawSvg(content, options).svg;
    std::vector<std::string> colours;
    const std::regex row(R"re(width="28" height="14" fill="(#[0-9a-f]+)")re");
    for (std::sregex_iterator one(svg.begin(), svg.end(), row), end; one != end; ++one) {
        colours.push_back((*one)[1]);
    }
    return colours;
}

TEST(FanColours, twelveLinesOfDescentHaveOneEach) {
    for (const DrawingTheme* theme : {&lightTheme(), &darkTheme()}) {
        const std::vector<std::string> colours = coloursOfChildren(12, *theme);
        EXPECT_EQ(colours.size(), 12U);
        EXPECT_EQ(std::set<std::string>(colours.begin(), colours.end()).size(), 12U);
    }
}

// Around a whole circle the last line lies beside the first.
TEST(FanColours, neighboursDifferHoweverManyTheyAre) {
    for (int children = 2; children <= 50; ++children) {
        const std::vector<std::string> colours = coloursOfChildren(children, lightTheme());
        ASSERT_EQ(colours.size(), static_cast<std::size_t>(children));
        for (std::size_t i = 0; i < colours.size(); ++i) {
            EXPECT_NE(colours[i], colours[(i + 1) % colours.size()]) << i << " of " << children;
        }
    }
}

}  // namespace
}  // namespace olvane::draw
