// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Branches that are left out of a chart, and how many persons that hides.

#include <gtest/gtest.h>

#include <AnyKin.h>

#include <algorithm>
#include <array>
#include <random>
#include <set>
#include <string>
#include <vector>

#include <olvane/charts/Charts.h>
#include <olvane/charts/Folding.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/PictureJson.h>

#include "PlainCharts.h"

namespace olvane::charts {
namespace {

using kin::KinGraph;
using kin::Place;
using kin::Sex;
using kin::UnionState;
using picture::Branch;
using picture::Side;

constexpr std::array kBranches{Branch::up, Branch::down, Branch::beside};
constexpr std::array kFoldingViews{View::near, View::ancestors, View::descendants, View::hourglass,
                                   View::relatives};

// 1 and 2 have 3 and 4; 3 and 5 have 6 and 7; 6 and 8 have 9; 10 and 11 are the parents of 5.
KinGraph threeGenerations() {
    kin::KinGraphBuilder builder;
    for (std::int64_t id = 1; id <= 11; ++id) builder.addPerson(id, id % 2 == 0 ? Sex::female : Sex::male);
    const auto family = [&builder](Place father, Place mother, std::initializer_list<Place> children) {
        const kin::UnionPlace u = builder.addUnion(father - 1, mother - 1, UnionState::married);
        for (const Place child : children) builder.addChild(u, child - 1, kin::ChildKind::birth);
    };
    family(1, 2, {3, 4});
    family(3, 5, {6, 7});
    family(6, 8, {9});
    family(10, 11, {5});
    return builder.build();
}

ChartRequest requestFor(View view, std::int64_t focus) {
    ChartRequest request;
    request.view = view;
    request.focus = static_cast<Place>(focus - 1);
    request.siblings = true;
    return request;
}

std::set<std::int64_t> idsIn(const picture::Picture& picture) {
    std::set<std::int64_t> ids;
    for (const picture::Box& box : picture.boxes) ids.insert(box.id);
    return ids;
}

using Ids = std::set<std::int64_t>;

TEST(Folding, leavesOutThoseToWhomOnlyTheBranchLeads) {
    const KinGraph graph = threeGenerations();
    struct Case {
        View view;
        std::int64_t focus;
        Fold fold;
        Ids left;
    };
    const std::vector<Case> cases{
        {View::descendants, 1, {3, Branch::down}, {1, 2, 3, 4, 5}},
        {View::descendants, 1, {6, Branch::beside}, {1, 2, 3, 4, 5, 6, 7, 9}},
        {View::ancestors, 6, {5, Branch::up}, {1, 2, 3, 4, 5, 6, 7}},
        {View::ancestors, 6, {6, Branch::beside}, {1, 2, 3, 4, 5, 6, 10, 11}},
        {View::hourglass, 6, {6, Branch::down}, {1, 2, 3, 4, 5, 6, 7, 8, 10, 11}},
        {View::relatives, 6, {3, Branch::beside}, {1, 2, 3, 5, 6, 7, 8, 9, 10, 11}},
        {View::relatives, 9, {6, Branch::up}, {6, 8, 9}},
        {View::near, 6, {3, Branch::up}, {3, 5, 6, 7, 8, 9, 10, 11}},
    };
    for (const Case& one : cases) {
        SCOPED_TRACE(std::string(nameOf(one.view)) + " of " + std::to_string(one.focus));
        ChartRequest request = requestFor(one.view, one.focus);
        const std::size_t all = chartOf(graph, request).boxes.size();
        request.folded = {&one.fold, 1};
        const picture::Picture picture = chartOf(graph, request);
        EXPECT_EQ(idsIn(picture), one.left);
        ASSERT_EQ(picture.folded.size(), 1U);
        EXPECT_EQ(picture.boxes[static_cast<std::size_t>(picture.folded[0].box)].id, one.fold.person);
        EXPECT_EQ(picture.folded[0].branch, one.fold.branch);
        EXPECT_EQ(static_cast<std::size_t>(picture.folded[0].count), all - one.left.size());
    }
}

TEST(Folding, passesOverWhomItCannotFold) {
    const KinGraph graph = threeGenerations();
    ChartRequest request = requestFor(View::descendants, 1);
    const std::string whole = picture::pictureJson(chartOf(graph, request));
    // A leaf, a person who is not shown, and one who is not in the family.
    const std::vector<Fold> folds{{9, Branch::down}, {10, Branch::down}, {99, Branch::up}};
    request.folded = folds;
    EXPECT_EQ(picture::pictureJson(chartOf(graph, request)), whole);
    for (const View view : {View::fan, View::kinship, View::everybody}) {
        EXPECT_EQ(branchSizes(graph, requestFor(view, 1), 1), (std::array<std::int32_t, 3>{}));
    }
}

TEST(Folding, standsWhereTheBranchWould) {
    const auto sides = [](Direction direction, bool mirrored) {
        ChartRequest request;
        request.direction = direction;
        request.mirrored = mirrored;
        std::vector<Side> found;
        for (const Branch branch : kBranches) found.push_back(sideOf(branch, request));
        return found;
    };
    EXPECT_EQ(sides(Direction::down, false), (std::vector{Side::top, Side::bottom, Side::right}));
    EXPECT_EQ(sides(Direction::up, false), (std::vector{Side::bottom, Side::top, Side::right}));
    EXPECT_EQ(sides(Direction::right, false), (std::vector{Side::left, Side::right, Side::bottom}));
    EXPECT_EQ(sides(Direction::left, false), (std::vector{Side::right, Side::left, Side::bottom}));
    EXPECT_EQ(sides(Direction::down, true), (std::vector{Side::top, Side::bottom, Side::left}));
    EXPECT_EQ(sides(Direction::right, true), (std::vector{Side::right, Side::left, Side::bottom}));
}

// Calls check with many families, views and folds; families also have cycles and second ways.
template <class Check>
void forRandomFolds(const Check& check) {
    for (unsigned seed = 1; seed <= 60; ++seed) {
        std::mt19937 random(seed);
        const auto choose = [&random](int count) {
            return static_cast<int>(random() % static_cast<unsigned>(count));
        };
        const int persons = 2 + choose(30);
        const int unions = choose(persons);
        const bool isOrderly = choose(3) != 0;
        const KinGraph graph = AnyKin::make(persons, unions, isOrderly, choose).graph();
        for (const View view : kFoldingViews) {
            ChartRequest request;
            request.view = view;
            request.focus = choose(graph.personCount());
            request.up = choose(4);
            request.down = choose(4);
            request.spouses = choose(4) != 0;
            request.direction = static_cast<Direction>(choose(4));
            request.mirrored = choose(2) == 0;
            const picture::Picture whole = chartOf(graph, request);
            std::vector<Fold> folds;
            for (int i = choose(5); i >= 0; --i) {
                const auto box = static_cast<std::size_t>(choose(static_cast<int>(whole.boxes.size())));
                folds.push_back({whole.boxes[box].id, kBranches.at(static_cast<std::size_t>(choose(3)))});
            }
            SCOPED_TRACE("family " + std::to_string(seed) + ", " + nameOf(view));
            check(graph, request, folds);
            if (testing::Test::HasFailure()) return;
        }
    }
}

TEST(Folding, showsTheVeryPersonsThatThePlainRulesName) {
    std::size_t folded = 0;
    forRandomFolds([&folded](const KinGraph& graph, ChartRequest request, const std::vector<Fold>& folds) {
        if (request.view == View::near) return;
        request.folded = folds;
        const picture::Picture picture = chartOf(graph, request);
        std::set<Place> shown;
        for (const picture::Box& box : picture.boxes) shown.insert(graph.placeOf(box.id));
        EXPECT_EQ(shown, plain::personsOf(graph, request));
        folded += picture.folded.size();
    });
    EXPECT_GT(folded, 30U);
}

TEST(Folding, countsWhomItHidesAndUnfoldsToTheSameBytes) {
    std::size_t compared = 0;
    forRandomFolds([&compared](const KinGraph& graph, ChartRequest request, const std::vector<Fold>& folds) {
        const std::vector<Fold> others(folds.begin() + 1, folds.end());
        const bool isThereTwice = std::find(others.begin(), others.end(), folds[0]) != others.end();
        request.folded = others;
        const picture::Picture before = chartOf(graph, request);
        const auto sizes = branchSizes(graph, request, folds[0].person);
        request.folded = folds;
        const picture::Picture after = chartOf(graph, request);
        EXPECT_EQ(
            branchSizes(graph, request, folds[0].person)[static_cast<std::size_t>(folds[0].branch)],
            idsIn(after).contains(folds[0].person) ? sizes[static_cast<std::size_t>(folds[0].branch)] : 0);
        for (const picture::FoldedBranch& one : after.folded) {
            if (isThereTwice || one.branch != folds[0].branch) continue;
            if (after.boxes[static_cast<std::size_t>(one.box)].id != folds[0].person) continue;
            EXPECT_EQ(static_cast<std::size_t>(one.count), before.boxes.size() - after.boxes.size());
            EXPECT_EQ(one.count, sizes[static_cast<std::size_t>(one.branch)]);
            ++compared;
        }
        request.folded = others;
        EXPECT_EQ(picture::pictureJson(chartOf(graph, request)), picture::pictureJson(before));
    });
    EXPECT_GT(compared, 20U);
}

TEST(Folding, leavesPicturesThatMisleadNobody) {
    forRandomFolds([](const KinGraph& graph, ChartRequest request, const std::vector<Fold>& folds) {
        request.folded = folds;
        const picture::Judgement judged = picture::judge(chartOf(graph, request), &graph);
        EXPECT_EQ(judged.overlaps + judged.hits + judged.crossings + judged.unjoined, 0U);
        EXPECT_EQ(judged.untold, 0U);
    });
}

}  // namespace
}  // namespace olvane::charts
