// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Everybody on paper: generations folded for the sheet.

#include <olvane/charts/Charts.h>
#include <olvane/charts/Everybody.h>
#include <olvane/picture/Judge.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <limits>
#include <stdexcept>
#include <tuple>

#include <RandomKin.h>

namespace {

using olvane::charts::Direction;
using olvane::charts::everybodyChart;
using olvane::charts::EverybodyOptions;
using olvane::picture::Judgement;
using olvane::picture::Picture;

struct Extent {
    double width = 0;
    double height = 0;
};

Extent extentOf(const Picture& picture) {
    Extent extent;
    for (const auto& box : picture.boxes) {
        extent.width = std::max(extent.width, box.x + double{box.width});
        extent.height = std::max(extent.height, box.y + double{box.height});
    }
    return extent;
}

// The area of the smallest paper of that shape that the picture fits on.
double paperFor(const Picture& picture, double aspect) {
    const Extent extent = extentOf(picture);
    const double width = std::max(extent.width, extent.height * aspect);
    return width * width / aspect;
}

// A couple with eight married children, each with eight children: 64 in the last generation.
olvane::kin::KinGraph wideFamily() {
    using olvane::kin::Sex;
    olvane::kin::KinGraphBuilder builder;
    std::int64_t last = 0;
    const auto couple = [&](olvane::kin::Place one) {
        return builder.addUnion(one, builder.addPerson(++last, Sex::female),
                                olvane::kin::UnionState::married);
    };
    const auto top = couple(builder.addPerson(++last, Sex::male));
    for (int i = 0; i < 8; ++i) {
        const auto child = builder.addPerson(++last, Sex::male);
        builder.addChild(top, child, olvane::kin::ChildKind::birth);
        const auto below = couple(child);
        for (int k = 0; k < 8; ++k) {
            builder.addChild(below, builder.addPerson(++last, Sex::male), olvane::kin::ChildKind::birth);
        }
    }
    return builder.build();
}

// Unfolded it is about twenty times as wide as high.
TEST(EverybodyPaper, takesLessPaperWhenFoldedForIt) {
    const auto graph = wideFamily();
    EverybodyOptions folded;
    EverybodyOptions unfolded;
    unfolded.foldAspect = 0;
    folded.aspect = 1.4;
    EXPECT_LT(paperFor(everybodyChart(graph, folded), 1.4),
              0.5 * paperFor(everybodyChart(graph, unfolded), 1.4));
    folded.aspect = 18;
    EXPECT_LT(paperFor(everybodyChart(graph, folded), 18),
              0.7 * paperFor(everybodyChart(graph, EverybodyOptions{}), 18));
}

TEST(EverybodyPaper, foldsSidewaysChartsForThePaperAsItLies) {
    const auto graph = wideFamily();
    EverybodyOptions options;
    options.direction = Direction::right;
    options.aspect = 1.0 / 18;
    const double right = paperFor(everybodyChart(graph, options), 1.0 / 18);
    options.aspect = 18;
    const double wrong = paperFor(everybodyChart(graph, options), 1.0 / 18);
    EXPECT_LT(right, 0.7 * wrong);
}

TEST(EverybodyPaper, compactLinesAreLowerAndStayReadable) {
    for (std::uint64_t seed = 0; seed < 4; ++seed) {
        const auto graph = olvane::test::soundKin(seed, 120);
        EverybodyOptions options;
        options.onePart = false;
        const double usual = extentOf(everybodyChart(graph, options)).height;
        options.compact = true;
        const Picture picture = everybodyChart(graph, options);
        const Judgement j = olvane::picture::judge(picture, &graph);
        EXPECT_EQ(std::tuple(j.overlaps, j.hits, j.tracks, j.touches, j.unjoined, *j.untold),
                  std::tuple(0U, 0U, 0U, 0U, 0U, 0U))
            << seed;
        EXPECT_LE(extentOf(picture).height, usual) << seed;
    }
}

TEST(EverybodyPaper, refusesAnAspectThatIsNone) {
    const auto graph = olvane::test::soundKin(1, 20);
    olvane::charts::ChartRequest request;
    request.view = olvane::charts::View::everybody;
    for (const double aspect : {-1.0, std::numeric_limits<double>::quiet_NaN()}) {
        request.aspect = aspect;
        EXPECT_THROW((void)olvane::charts::chartOf(graph, request), std::invalid_argument);
    }
}

}  // namespace
