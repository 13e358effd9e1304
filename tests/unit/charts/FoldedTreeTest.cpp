// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Charts in rows for paper: wide generations in two or three rows.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <olvane/charts/BoxForm.h>
#include <olvane/charts/Charts.h>
#include <olvane/picture/Judge.h>

#include <algorithm>
#include <cstdint>
#include <map>
#include <set>
#include <tuple>
#include <vector>

#include <RandomKin.h>

using namespace olvane::charts;
using olvane::kin::ChildKind;
using olvane::kin::KinGraph;
using olvane::kin::KinGraphBuilder;
using olvane::kin::Place;
using olvane::kin::Sex;
using olvane::kin::UnionState;
using olvane::picture::Box;
using olvane::picture::Judgement;
using olvane::picture::Picture;

namespace {

constexpr double kUpright = 210.0 / 297;
const std::vector<View> kRowViews{View::near, View::ancestors, View::descendants, View::hourglass,
                                  View::relatives};

// A couple with that many children, each with a spouse if they are married. Persons 1 and 2 are the couple; of child n,
// from 0, the id is 10 + n, and the spouse's is 1000 more.
KinGraph couplesChildren(int count, bool married) {
    KinGraphBuilder builder;
    const Place father = builder.addPerson(1, Sex::male);
    const Place mother = builder.addPerson(2, Sex::female);
    const auto parents = builder.addUnion(father, mother, UnionState::married);
    for (int i = 0; i < count; ++i) {
        const Place child = builder.addPerson(10 + i, Sex::male);
        builder.addChild(parents, child, ChildKind::birth);
        if (married) builder.addUnion(child, builder.addPerson(1010 + i, Sex::female), UnionState::married);
    }
    return builder.build();
}

Picture drawn(const KinGraph& graph, View view, double aspect, Direction direction = Direction::down) {
    ChartRequest request;
    request.view = view;
    request.aspect = aspect;
    request.direction = direction;
    return chartOf(graph, request);
}

// How high paper of that shape is that the picture just fits on.
double paperHeight(const Picture& picture, double aspect) {
    double width = 0;
    double height = 0;
    for (const Box& box : picture.boxes) {
        width = std::max(width, box.x + double{box.width});
        height = std::max(height, box.y + double{box.height});
    }
    return std::max(height, width / aspect);
}

std::map<std::int64_t, const Box*> boxesById(const Picture& picture) {
    std::map<std::int64_t, const Box*> boxes;
    for (const Box& box : picture.boxes) boxes[box.id] = &box;
    return boxes;
}

std::set<double> rowsOfChildren(const Picture& picture, int count) {
    const auto boxes = boxesById(picture);
    std::set<double> rows;
    for (int i = 0; i < count; ++i) rows.insert(boxes.at(10 + i)->y);
    return rows;
}

void expectNothingMisleads(const Picture& picture, const KinGraph& graph) {
    const Judgement j = olvane::picture::judge(picture, &graph);
    EXPECT_EQ(std::tuple(j.overlaps, j.hits, j.crossings, j.tracks, j.touches, j.unjoined, *j.untold),
              std::tuple(0U, 0U, 0U, 0U, 0U, 0U, 0U));
    EXPECT_EQ(j.slanted, 0U);
}

}  // namespace

// Unfolded they are 30 boxes of 55 and gaps of 25 wide; in three rows, ten.
TEST(FoldedTree, putsManyChildrenInThreeRows) {
    const KinGraph graph = couplesChildren(30, false);
    for (const View view : {View::near, View::descendants, View::hourglass, View::relatives}) {
        SCOPED_TRACE(nameOf(view));
        const Picture folded = drawn(graph, view, kUpright);
        EXPECT_EQ(rowsOfChildren(folded, 30).size(), 3U);
        EXPECT_LE(paperHeight(folded, kUpright), 0.45 * paperHeight(drawn(graph, view, 0), kUpright));
        EXPECT_THAT(folded.marks, testing::IsEmpty());
        EXPECT_EQ(folded.view, nameOf(view));
        EXPECT_EQ(folded.boxes[static_cast<std::size_t>(folded.focus)].id, 1);
        expectNothingMisleads(folded, graph);
    }
}

TEST(FoldedTree, leavesSpousesBesideOneAnother) {
    const KinGraph graph = couplesChildren(14, true);
    const Picture folded = drawn(graph, View::descendants, kUpright);
    EXPECT_EQ(rowsOfChildren(folded, 14).size(), 3U);
    EXPECT_EQ(olvane::picture::judge(folded, &graph).sideBySide, 15U);
    expectNothingMisleads(folded, graph);
}

TEST(FoldedTree, keepsChildrenInTheOrderOfTheDataInEachRow) {
    const Picture folded = drawn(couplesChildren(30, false), View::descendants, kUpright);
    const auto boxes = boxesById(folded);
    std::map<double, double> lastOfRow;
    for (int i = 0; i < 30; ++i) {
        const Box& box = *boxes.at(10 + i);
        const auto found = lastOfRow.find(box.y);
        if (found != lastOfRow.end()) {
            EXPECT_GT(box.x, found->second) << i;
        }
        lastOfRow[box.y] = box.x;
    }
}

// Grandparents of grandparents: five generations of ancestors, 16 in the last one, which stand over their children.
TEST(FoldedTree, putsManyAncestorsInTwoRows) {
    KinGraphBuilder builder;
    for (int i = 1; i < 64; ++i) builder.addPerson(i, i % 2 == 0 ? Sex::male : Sex::female);
    for (Place child = 0; 2 * child + 2 < 63; ++child) {
        builder.addChild(builder.addUnion(2 * child + 1, 2 * child + 2, UnionState::married), child,
                         ChildKind::birth);
    }
    const KinGraph graph = builder.build();
    const Picture folded = drawn(graph, View::ancestors, kUpright);
    EXPECT_LE(paperHeight(folded, kUpright), 0.7 * paperHeight(drawn(graph, View::ancestors, 0), kUpright));
    expectNothingMisleads(folded, graph);
}

TEST(FoldedTree, isTheTreeWhereFoldingGainsNothing) {
    const KinGraph graph = couplesChildren(3, true);
    const Picture tree = drawn(graph, View::descendants, 0);
    const Picture onPaper = drawn(graph, View::descendants, 297.0 / 210);
    ASSERT_EQ(tree.boxes.size(), onPaper.boxes.size());
    for (std::size_t i = 0; i < tree.boxes.size(); ++i) {
        EXPECT_EQ(std::pair(tree.boxes[i].x, tree.boxes[i].y),
                  std::pair(onPaper.boxes[i].x, onPaper.boxes[i].y));
    }
}

TEST(FoldedTree, foldsSidewaysChartsForThePaperAsItLies) {
    const KinGraph graph = couplesChildren(30, false);
    const double across = 1 / kUpright;
    const Picture folded = drawn(graph, View::descendants, across, Direction::right);
    EXPECT_LE(paperHeight(folded, across),
              0.7 * paperHeight(drawn(graph, View::descendants, 0, Direction::right), across));
    expectNothingMisleads(folded, graph);
}

TEST(FoldedTree, takesBoxesOfAnySize) {
    const KinGraph graph = couplesChildren(20, false);
    std::vector<BoxSize> sizes;
    for (Place p = 0; p < graph.personCount(); ++p) {
        sizes.push_back({static_cast<float>(30 + 5 * (p % 7)), static_cast<float>(40 + 8 * (p % 5))});
    }
    ChartRequest request;
    request.aspect = kUpright;
    request.boxSizes = sizes;
    const Picture folded = chartOf(graph, request);
    for (const Box& box : folded.boxes) {
        const auto place = static_cast<std::size_t>(graph.placeOf(box.id));
        EXPECT_EQ(std::pair(box.width, box.height), std::pair(sizes[place].width, sizes[place].height));
    }
    EXPECT_GT(rowsOfChildren(folded, 20).size(), 1U);
    expectNothingMisleads(folded, graph);
}

// Who is hidden is hidden in a folded chart as well, and nobody is lost or moved to another generation's parents.
TEST(FoldedTree, showsWhomTheTreeShowsInAnyFamily) {
    int folded = 0;
    for (std::uint64_t seed = 1; seed <= 24; ++seed) {
        const KinGraph graph =
            seed % 3 == 0 ? olvane::test::hostileKin(seed, 30, 22) : olvane::test::soundKin(seed, 45);
        for (const View view : kRowViews) {
            SCOPED_TRACE(std::to_string(seed) + ", " + nameOf(view));
            ChartRequest request;
            request.view = view;
            request.focus = static_cast<Place>(seed * 7 % static_cast<std::uint64_t>(graph.personCount()));
            request.up = static_cast<int>(seed % 4);
            request.down = static_cast<int>(seed / 2 % 4);
            request.direction = static_cast<Direction>(seed % 4);
            request.siblings = seed % 2 == 0;
            request.spouses = seed % 5 != 0;
            request.compact = seed % 7 == 0;
            const Picture tree = chartOf(graph, request);
            request.aspect = 0.3 + static_cast<double>(seed % 5) * 0.4;
            const Picture onPaper = chartOf(graph, request);
            const auto before = boxesById(tree);
            ASSERT_EQ(before.size(), onPaper.boxes.size());
            for (const Box& box : onPaper.boxes) {
                ASSERT_TRUE(before.contains(box.id));
                const Box& same = *before.at(box.id);
                EXPECT_EQ(std::tuple(box.hiddenParents, box.hiddenPartners, box.hiddenChildren,
                                     box.furtherParents, box.sex),
                          std::tuple(same.hiddenParents, same.hiddenPartners, same.hiddenChildren,
                                     same.furtherParents, same.sex));
            }
            EXPECT_EQ(onPaper.families.size(), tree.families.size());
            EXPECT_EQ(onPaper.boxes[static_cast<std::size_t>(onPaper.focus)].id, graph.id(request.focus));
            EXPECT_LE(paperHeight(onPaper, request.aspect), paperHeight(tree, request.aspect) + 0.01);
            expectNothingMisleads(onPaper, graph);
            folded += paperHeight(onPaper, request.aspect) < paperHeight(tree, request.aspect) ? 1 : 0;
            if (HasFailure()) return;
        }
    }
    EXPECT_GT(folded, 15);
}

TEST(FoldedTree, isMadeForTheViewsThatHaveRows) {
    for (int view = 0; view <= static_cast<int>(View::everybody); ++view) {
        const View one = static_cast<View>(view);
        const bool hasRows = std::find(kRowViews.begin(), kRowViews.end(), one) != kRowViews.end();
        EXPECT_EQ(foldsForPaper(one), hasRows || one == View::everybody) << nameOf(one);
    }
}
