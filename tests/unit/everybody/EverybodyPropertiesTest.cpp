// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What holds of the chart of everybody for any family: sound ones, and ones that contradict themselves.

#include <olvane/charts/Everybody.h>
#include <olvane/picture/Judge.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <numeric>
#include <random>
#include <set>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include <PlainJudge.h>
#include <RandomKin.h>

namespace {

using olvane::charts::ChartStep;
using olvane::charts::Direction;
using olvane::charts::everybodyChart;
using olvane::charts::EverybodyOptions;
using olvane::kin::KinGraph;
using olvane::picture::Judgement;
using olvane::picture::Picture;

struct Made {
    std::string name;
    KinGraph graph;
};

std::vector<Made> families(int count) {
    std::vector<Made> made;
    for (int seed = 0; seed < count; ++seed) {
        const auto number = static_cast<std::uint64_t>(seed);
        const int persons = 1 + seed % 60;
        made.push_back({"sound " + std::to_string(seed), olvane::test::soundKin(number, persons)});
        made.push_back({"hostile " + std::to_string(seed),
                        olvane::test::hostileKin(number, persons, 1 + seed * 7 % 50)});
    }
    return made;
}

Picture chart(const KinGraph& graph, int marks, bool onePart = false) {
    EverybodyOptions options;
    options.marks = marks;
    options.onePart = onePart;
    return everybodyChart(graph, options);
}

// By repeated looking, until nobody is added: slow and plain.
std::set<std::int64_t> connectedWith(const KinGraph& graph, olvane::kin::Place first) {
    std::set<olvane::kin::Place> in = {first};
    for (bool grown = true; grown;) {
        grown = false;
        for (olvane::kin::UnionPlace u = 0; u < graph.unionCount(); ++u) {
            std::vector<olvane::kin::Place> members(graph.children(u).begin(), graph.children(u).end());
            for (const olvane::kin::Place partner : graph.partners(u)) {
                if (partner != olvane::kin::kNobody) members.push_back(partner);
            }
            const bool touches =
                std::any_of(members.begin(), members.end(), [&](auto m) { return in.count(m) > 0; });
            for (const olvane::kin::Place member : members) grown |= touches && in.insert(member).second;
        }
    }
    std::set<std::int64_t> ids;
    for (const olvane::kin::Place place : in) ids.insert(graph.id(place));
    return ids;
}

TEST(Everybody, showsEachPersonOfTheFamilyOfTheFocusOnce) {
    for (const Made& made : families(40)) {
        const Picture picture = chart(made.graph, 0, true);
        std::multiset<std::int64_t> shown;
        for (const auto& box : picture.boxes) shown.insert(box.id);
        const std::set<std::int64_t> expected = connectedWith(made.graph, 0);
        EXPECT_EQ(std::vector(shown.begin(), shown.end()), std::vector(expected.begin(), expected.end()))
            << made.name;
        ASSERT_GE(picture.focus, 0) << made.name;
        EXPECT_EQ(picture.boxes[static_cast<std::size_t>(picture.focus)].id, made.graph.id(0)) << made.name;
    }
}

TEST(Everybody, drawsEveryLinkAndNothingThatCanBeMisread) {
    for (const Made& made : families(40)) {
        for (const int marks : {0, 3, -1}) {
            const Judgement j = olvane::picture::judge(chart(made.graph, marks), &made.graph);
            const std::vector<std::size_t> counts = {j.overlaps, j.hits,    j.tracks,  j.touches,
                                                     j.unjoined, *j.untold, j.slanted, j.repeats};
            EXPECT_EQ(counts, std::vector<std::size_t>(8, 0)) << made.name << ", marks " << marks;
            EXPECT_EQ(j.persons, static_cast<std::size_t>(made.graph.personCount())) << made.name;
        }
    }
}

TEST(Everybody, isJudgedAlikeByThePlainCounts) {
    for (const Made& made : families(30)) {
        const Picture picture = chart(made.graph, 0);
        const Judgement fast = olvane::picture::judge(picture, &made.graph);
        const Judgement plain = olvane::test::plainJudgement(picture, &made.graph);
        EXPECT_EQ(
            std::tie(fast.overlaps, fast.hits, fast.crossings, fast.tracks, fast.touches, fast.unjoined),
            std::tie(plain.overlaps, plain.hits, plain.crossings, plain.tracks, plain.touches,
                     plain.unjoined))
            << made.name;
    }
}

TEST(Everybody, crossesNoLinesWhenEverySecondLinkIsAMark) {
    for (const Made& made : families(40)) {
        const Picture picture = chart(made.graph, -1);
        EXPECT_EQ(olvane::picture::judge(picture).crossings, 0U) << made.name;
    }
}

TEST(Everybody, makesNoMoreMarksThanAreAskedFor) {
    for (const Made& made : families(40)) {
        if (made.name[0] == 'h') continue;  // in these, boxes may have no room for all of their lines
        EXPECT_EQ(chart(made.graph, 0).marks.size(), 0U) << made.name;
        EXPECT_LE(chart(made.graph, 2).marks.size(), 2U) << made.name;
    }
}

TEST(Everybody, crossesNoLinesWithAtLeastAsManyMarksAsThereAreSecondLinks) {
    for (const Made& made : families(40)) {
        EXPECT_EQ(olvane::picture::judge(chart(made.graph, 1000)).crossings, 0U) << made.name;
    }
}

// From an order that is best with all lines, marking one after the other leaves 573 crossings here.
TEST(Everybody, crossesLittleWithNearlyAllSecondLinksAsMarks) {
    std::size_t crossings = 0;
    for (std::uint64_t seed = 0; seed < 6; ++seed) {
        const KinGraph graph = olvane::test::soundKin(seed, 400);
        const std::size_t all = chart(graph, -1).marks.size();
        const Picture picture = chart(graph, static_cast<int>(all * 9 / 10));
        EXPECT_LE(picture.marks.size(), all * 9 / 10) << "seed " << seed;
        crossings += olvane::picture::judge(picture).crossings;
    }
    EXPECT_LE(crossings, 190U);
}

// The middle of each box down the picture: rows have one middle.
std::map<std::int64_t, double> middles(const Picture& picture) {
    std::map<std::int64_t, double> middles;
    for (const auto& box : picture.boxes) middles[box.id] = box.y + static_cast<double>(box.height) / 2;
    return middles;
}

// Without contradictions between couples and generations, parents stand above their children; whether there are such is
// found by pushing children down, couples side by side together, until nothing moves or a row below all is reached.
TEST(Everybody, putsParentsAboveTheirChildren) {
    int tried = 0;
    for (const Made& made : families(60)) {
        const Picture picture = chart(made.graph, 0);
        const std::map<std::int64_t, double> y = middles(picture);
        std::map<std::int64_t, int> row;
        bool moved = true;
        int rounds = 0;
        for (; moved && rounds <= made.graph.personCount(); ++rounds) {
            moved = false;
            for (olvane::kin::UnionPlace u = 0; u < made.graph.unionCount(); ++u) {
                for (const auto partner : made.graph.partners(u)) {
                    if (partner == olvane::kin::kNobody) continue;
                    for (const auto other : made.graph.partners(u)) {
                        if (other == olvane::kin::kNobody) continue;
                        int& mine = row[made.graph.id(partner)];
                        if (mine < row[made.graph.id(other)]) mine = row[made.graph.id(other)], moved = true;
                    }
                    for (const auto child : made.graph.children(u)) {
                        int& below = row[made.graph.id(child)];
                        if (below < row[made.graph.id(partner)] + 1)
                            below = row[made.graph.id(partner)] + 1, moved = true;
                    }
                }
            }
        }
        if (moved) continue;
        ++tried;
        for (olvane::kin::UnionPlace u = 0; u < made.graph.unionCount(); ++u) {
            for (const auto partner : made.graph.partners(u)) {
                if (partner == olvane::kin::kNobody) continue;
                for (const auto child : made.graph.children(u)) {
                    EXPECT_LT(y.at(made.graph.id(partner)), y.at(made.graph.id(child))) << made.name;
                }
            }
        }
    }
    EXPECT_GT(tried, 40);
}

TEST(Everybody, isTheSameForTheSameFamily) {
    for (const Made& made : families(20)) {
        const Picture one = chart(made.graph, 2);
        const Picture other = chart(made.graph, 2);
        ASSERT_EQ(one.lines.size(), other.lines.size()) << made.name;
        for (std::size_t i = 0; i < one.lines.size(); ++i) {
            EXPECT_EQ(std::tie(one.lines[i].x1, one.lines[i].y1, one.lines[i].x2, one.lines[i].y2),
                      std::tie(other.lines[i].x1, other.lines[i].y1, other.lines[i].x2, other.lines[i].y2));
        }
    }
}

// The steps in their order, shares that do not shrink, and the same boxes and lines as without anybody to report to.
TEST(Everybody, reportsItsProgressAndIsTheSameForIt) {
    const KinGraph graph = olvane::test::hostileKin(5, 1500, 1500);
    EverybodyOptions options;
    options.onePart = false;
    const Picture plain = everybodyChart(graph, options);
    std::vector<std::pair<ChartStep, double>> reports;
    const olvane::charts::ChartProgress progress = [&reports](ChartStep step, double share) {
        reports.emplace_back(step, share);
    };
    options.progress = &progress;
    const Picture reported = everybodyChart(graph, options);
    EXPECT_TRUE(std::is_sorted(reports.begin(), reports.end()));
    for (const ChartStep step : {ChartStep::rows, ChartStep::order, ChartStep::places, ChartStep::lines}) {
        EXPECT_TRUE(
            std::any_of(reports.begin(), reports.end(), [&](const auto& r) { return r.first == step; }));
    }
    ASSERT_FALSE(reports.empty());
    EXPECT_TRUE(std::all_of(reports.begin(), reports.end(),
                            [](const auto& r) { return r.second >= 0 && r.second <= 1; }));
    ASSERT_EQ(reported.boxes.size(), plain.boxes.size());
    for (std::size_t i = 0; i < plain.boxes.size(); ++i) {
        EXPECT_EQ(std::tie(reported.boxes[i].x, reported.boxes[i].y),
                  std::tie(plain.boxes[i].x, plain.boxes[i].y));
    }
    EXPECT_EQ(reported.lines.size(), plain.lines.size());
}

TEST(Everybody, endsWhereItsProgressThrows) {
    struct GivenUp {};
    const KinGraph graph = olvane::test::hostileKin(5, 1500, 1500);
    EverybodyOptions options;
    options.onePart = false;
    const olvane::charts::ChartProgress progress = [](ChartStep step, double) {
        if (step == ChartStep::places) throw GivenUp();
    };
    options.progress = &progress;
    EXPECT_THROW(everybodyChart(graph, options), GivenUp);
}

TEST(Everybody, runsInFourDirectionsAlike) {
    for (const Made& made : families(20)) {
        EverybodyOptions options;
        options.onePart = false;
        const Judgement down = olvane::picture::judge(everybodyChart(made.graph, options), &made.graph);
        for (const Direction direction : {Direction::up, Direction::left, Direction::right}) {
            options.direction = direction;
            const Judgement j = olvane::picture::judge(everybodyChart(made.graph, options), &made.graph);
            EXPECT_EQ(
                std::tuple(j.overlaps, j.hits, j.tracks, j.touches, j.unjoined, *j.untold),
                std::tuple(down.overlaps, down.hits, down.tracks, down.touches, down.unjoined, *down.untold))
                << made.name;
            if (direction == Direction::up) {
                EXPECT_EQ(j.crossings, down.crossings) << made.name;
            }
        }
    }
}

TEST(Everybody, takesBoxesOfAnySize) {
    for (const Made& made : families(20)) {
        std::vector<olvane::charts::BoxSize> sizes;
        sizes.reserve(static_cast<std::size_t>(made.graph.personCount()));
        for (int i = 0; i < made.graph.personCount(); ++i) {
            sizes.push_back({static_cast<float>(30 + i * 37 % 90), static_cast<float>(20 + i * 53 % 70)});
        }
        EverybodyOptions options;
        options.onePart = false;
        options.boxSizes = sizes;
        const Picture picture = everybodyChart(made.graph, options);
        const Judgement j = olvane::picture::judge(picture, &made.graph);
        EXPECT_EQ(std::tuple(j.overlaps, j.hits, j.tracks, j.touches, j.unjoined, *j.untold),
                  std::tuple(0U, 0U, 0U, 0U, 0U, 0U))
            << made.name;
        for (std::size_t i = 0; i < sizes.size(); ++i)
            EXPECT_EQ(picture.boxes[i].width, sizes[i].width) << made.name;
    }
}

// What a host may ask for with a family: lines are never one on another, whatever room there is for them.
EverybodyOptions anyOptions(std::uint64_t seed, int persons, std::vector<olvane::charts::BoxSize>& sizes) {
    std::mt19937_64 random(seed + 1000);
    const auto below = [&random](int count) {
        return static_cast<int>(random() % static_cast<std::uint64_t>(count));
    };
    EverybodyOptions options;
    options.onePart = false;
    options.marks = below(6) - 1;
    options.effort = below(2);
    options.direction = static_cast<Direction>(below(4));
    options.compact = below(2) == 0;
    if (below(4) == 0) options.foldAspect = 0;
    if (below(6) == 0) options.aspect = 0.5 + below(4);
    if (below(2) == 0) {
        options.sizes.gapX = static_cast<float>(1 + below(30));
        options.sizes.gapY = static_cast<float>(below(40));
    }
    for (int i = 0; i < persons && seed % 2 == 0; ++i) {
        const int width = 4 + below(100);
        sizes.push_back({static_cast<float>(width), static_cast<float>(4 + below(100))});
    }
    options.boxSizes = sizes;
    return options;
}

// In the last one a union hangs from its second partner, below a child of it who is an ancestor of hers.
TEST(Everybody, keepsLinesApartWhereMoreMeetThanThereIsRoomFor) {
    std::vector<std::uint64_t> seeds(300);
    std::iota(seeds.begin(), seeds.end(), std::uint64_t{0});
    seeds.push_back(1282);
    for (const std::uint64_t seed : seeds) {
        const KinGraph graph = olvane::test::denseKin(seed);
        std::vector<olvane::charts::BoxSize> sizes;
        const EverybodyOptions options = anyOptions(seed, graph.personCount(), sizes);
        const Judgement j = olvane::picture::judge(everybodyChart(graph, options), &graph);
        EXPECT_EQ(std::tuple(j.overlaps, j.hits, j.tracks, j.touches, j.unjoined, *j.untold, j.slanted),
                  std::tuple(0U, 0U, 0U, 0U, 0U, 0U, 0U))
            << "seed " << seed;
        if (options.marks < 0) {
            EXPECT_EQ(j.crossings, 0U) << "seed " << seed;
        }
    }
}

// Boxes of any width that touch: what sums of their places are rounded by is no overlap. The seeds are those of which boxes
// overlapped by a part of a billionth of a point.
TEST(Everybody, overlapsNoBoxesWhereNeighboursHaveNoGap) {
    for (const std::uint64_t seed : {1U, 2U, 3U, 380U, 451U, 1218U}) {
        const KinGraph graph = olvane::test::denseKin(seed);
        std::vector<olvane::charts::BoxSize> sizes;
        std::uint64_t random = seed * 7919 + 1;
        for (olvane::kin::Place p = 0; p < graph.personCount(); ++p) {
            random = random * 6364136223846793005U + 1442695040888963407U;
            sizes.push_back({static_cast<float>(4 + (random >> 33U) % 100),
                             static_cast<float>(4 + (random >> 40U) % 100)});
        }
        EverybodyOptions options;
        options.onePart = false;
        options.effort = 0;
        options.sizes.gapX = 0;
        options.boxSizes = sizes;
        const Picture picture = everybodyChart(graph, options);
        EXPECT_EQ(olvane::picture::judge(picture, &graph).overlaps, 0U) << "seed " << seed;
        options.earlier = &picture;
        EXPECT_EQ(olvane::picture::judge(everybodyChart(graph, options), &graph).overlaps, 0U)
            << "seed " << seed << ", places kept";
    }
}

}  // namespace
