// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Charts of everybody that keep the places of an earlier one.

#include <olvane/charts/Everybody.h>
#include <olvane/picture/Judge.h>

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <limits>
#include <map>
#include <string>
#include <tuple>
#include <vector>

#include <RandomKin.h>

namespace {

using olvane::charts::Direction;
using olvane::charts::everybodyChart;
using olvane::charts::EverybodyOptions;
using olvane::kin::KinGraph;
using olvane::kin::kNobody;
using olvane::kin::Place;
using olvane::picture::Box;
using olvane::picture::Judgement;
using olvane::picture::Picture;

constexpr std::int64_t kAdded = 1'000'000;

KinGraph copyOf(const KinGraph& graph, Place without, int addedAt) {
    olvane::kin::KinGraphBuilder builder;
    std::vector<Place> place;
    place.reserve(static_cast<std::size_t>(graph.personCount()));
    for (Place p = 0; p < graph.personCount(); ++p) {
        place.push_back(p == without ? kNobody : builder.addPerson(graph.id(p), graph.sex(p)));
    }
    const auto to = [&](Place p) { return p == kNobody ? kNobody : place[static_cast<std::size_t>(p)]; };
    for (olvane::kin::UnionPlace u = 0; u < graph.unionCount(); ++u) {
        const Place one = to(graph.partners(u)[0]);
        const Place other = to(graph.partners(u)[1]);
        if (one == kNobody && other == kNobody) continue;
        const auto copy = builder.addUnion(one, other, graph.state(u), graph.family(u));
        for (std::size_t i = 0; i < graph.children(u).size(); ++i) {
            if (to(graph.children(u)[i]) != kNobody) {
                builder.addChild(copy, to(graph.children(u)[i]), graph.childKinds(u)[i]);
            }
        }
    }
    if (addedAt < 0) return builder.build();
    const Place added = builder.addPerson(kAdded, olvane::kin::Sex::female);
    const Place beside = to(addedAt / 3 % graph.personCount());
    if (addedAt % 3 == 0) {
        builder.addUnion(beside, added, olvane::kin::UnionState::married);
    } else {
        const auto u =
            builder.addUnion(addedAt % 3 == 1 ? beside : added, kNobody, olvane::kin::UnionState::unknown);
        builder.addChild(u, addedAt % 3 == 1 ? added : beside, olvane::kin::ChildKind::birth);
    }
    return builder.build();
}

void expectReadable(const Picture& picture, const KinGraph& graph, const std::string& what) {
    const Judgement j = olvane::picture::judge(picture, &graph);
    EXPECT_EQ(std::tuple(j.overlaps, j.hits, j.tracks, j.touches, j.unjoined, *j.untold, j.repeats),
              std::tuple(0U, 0U, 0U, 0U, 0U, 0U, 0U))
        << what;
}

TEST(EverybodyAsBefore, theSameFamilyIsTheSamePicture) {
    for (std::uint64_t seed = 0; seed < 20; ++seed) {
        const KinGraph graph = olvane::test::soundKin(seed, 60);
        EverybodyOptions options;
        const Picture before = everybodyChart(graph, options);
        options.earlier = &before;
        EXPECT_EQ(olvane::picture::movedShare(before, everybodyChart(graph, options)), 0) << seed;
    }
}

// A spouse, a child or a parent more: all keep their row, and nine in ten their place.
TEST(EverybodyAsBefore, oneMorePersonLeavesOthersWhereTheyAre) {
    double moved = 0;
    int tries = 0;
    for (std::uint64_t seed = 0; seed < 5; ++seed) {
        const KinGraph graph = olvane::test::soundKin(seed, 150);
        for (const int marks : {0, -1}) {
            for (int i = 0; i < 3; ++i) {
                EverybodyOptions options;
                options.marks = marks;
                options.focus = graph.personCount() / 2;
                const Picture before = everybodyChart(graph, options);
                const KinGraph larger = copyOf(graph, kNobody, static_cast<int>(seed) * 31 + i * 7);
                options.earlier = &before;
                const Picture after = everybodyChart(larger, options);
                expectReadable(after, larger, std::to_string(seed) + ", " + std::to_string(i));
                if (before.boxes.size() < 20) continue;
                moved += olvane::picture::movedShare(before, after);
                ++tries;
            }
        }
    }
    ASSERT_GT(tries, 5);
    EXPECT_LT(moved / tries, 0.1);
}

TEST(EverybodyAsBefore, stayInOneRowWithWhomTheyWereInOne) {
    for (std::uint64_t seed = 0; seed < 10; ++seed) {
        const KinGraph graph = olvane::test::soundKin(seed, 100);
        EverybodyOptions options;
        const Picture before = everybodyChart(graph, options);
        const KinGraph larger = copyOf(graph, kNobody, static_cast<int>(seed));
        options.earlier = &before;
        const Picture after = everybodyChart(larger, options);
        std::map<std::int64_t, double> rows;
        for (const Box& box : after.boxes) rows[box.id] = box.y;
        std::map<double, double> rowOf;
        for (const Box& box : before.boxes) {
            const auto [found, isFirst] = rowOf.emplace(box.y, rows[box.id]);
            EXPECT_EQ(found->second, rows[box.id]) << seed << ": " << box.id;
        }
    }
}

TEST(EverybodyAsBefore, runInFourDirectionsAlike) {
    const KinGraph graph = olvane::test::soundKin(3, 120);
    const KinGraph larger = copyOf(graph, kNobody, 5);
    for (const Direction direction : {Direction::down, Direction::up, Direction::left, Direction::right}) {
        EverybodyOptions options;
        options.direction = direction;
        const Picture before = everybodyChart(graph, options);
        options.earlier = &before;
        const Picture after = everybodyChart(larger, options);
        expectReadable(after, larger, "direction");
        EXPECT_LT(olvane::picture::movedShare(before, after), 0.2);
    }
}

TEST(EverybodyAsBefore, aPersonMayGo) {
    for (std::uint64_t seed = 0; seed < 20; ++seed) {
        const KinGraph graph = olvane::test::soundKin(seed, 60);
        EverybodyOptions options;
        options.onePart = false;
        const Picture before = everybodyChart(graph, options);
        options.earlier = &before;
        const KinGraph smaller = copyOf(graph, graph.personCount() - 1, -1);
        expectReadable(everybodyChart(smaller, options), smaller, std::to_string(seed));
    }
}

TEST(EverybodyAsBefore, marksStayMarks) {
    std::size_t marks = 0;
    for (std::uint64_t seed = 0; seed < 6; ++seed) {
        const KinGraph graph = olvane::test::soundKin(seed, 100);
        EverybodyOptions options;
        options.onePart = false;
        options.marks = 3;
        const Picture before = everybodyChart(graph, options);
        options.earlier = &before;
        EXPECT_EQ(everybodyChart(graph, options).marks.size(), before.marks.size()) << seed;
        marks += before.marks.size();
    }
    EXPECT_GT(marks, 0U);
}

// Pictures of other families, of other sizes, or with places that are none, are no reason for a worse picture.
TEST(EverybodyAsBefore, hostilePicturesDoNoHarm) {
    for (std::uint64_t seed = 0; seed < 10; ++seed) {
        const int persons = 5 + static_cast<int>(seed);
        const KinGraph graph = olvane::test::hostileKin(seed, persons, persons);
        const KinGraph other = olvane::test::hostileKin(seed + 100, persons, persons / 2);
        EverybodyOptions options;
        options.onePart = false;
        Picture before = everybodyChart(other, options);
        options.earlier = &before;
        expectReadable(everybodyChart(graph, options), graph, "another family " + std::to_string(seed));
        for (Box& box : before.boxes) box.x = 0;
        expectReadable(everybodyChart(graph, options), graph, "one column " + std::to_string(seed));
        for (std::size_t i = 0; i < before.boxes.size(); i += 2) {
            before.boxes[i].x = std::numeric_limits<double>::quiet_NaN();
            before.boxes[i].y = std::numeric_limits<double>::infinity();
        }
        expectReadable(everybodyChart(graph, options), graph, "no places " + std::to_string(seed));
        for (Box& box : before.boxes) box.width = 1;
        expectReadable(everybodyChart(graph, options), graph, "other sizes " + std::to_string(seed));
    }
}

}  // namespace
