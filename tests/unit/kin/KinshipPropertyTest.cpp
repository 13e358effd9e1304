// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Kinship in random families beside a plain second implementation. OLVANE_KINSHIP_RUNS sets how many families.

#include <olvane/kin/KinSumsInternal.h>
#include <olvane/kin/Kinship.h>
#include <olvane/kin/KinshipText.h>

#include <gtest/gtest.h>

#include <cstdlib>
#include <random>
#include <sstream>
#include <string>

#include "PlainKinship.h"

using namespace olvane::kin;

namespace {

struct Recipe {
    int persons;
    bool loops;
    bool otherBonds;
};

// Everybody but the first few is a child somewhere, mostly of older persons of few families, so that ways are many.
KinGraph randomGraph(std::mt19937& random, const Recipe& recipe) {
    const auto pick = [&random](int count) {
        return static_cast<int>(random() % static_cast<unsigned>(count));
    };
    KinGraphBuilder builder;
    std::vector<std::int64_t> ids;
    ids.reserve(static_cast<std::size_t>(recipe.persons));
    for (int i = 0; i < recipe.persons; ++i) ids.push_back(100 + i);
    std::shuffle(ids.begin(), ids.end(), random);
    for (const std::int64_t id : ids) builder.addPerson(id, static_cast<Sex>(pick(3)));
    for (int child = 2; child < recipe.persons; ++child) {
        const int families = pick(8) == 0 ? 2 : 1;
        for (int i = 0; i < families; ++i) {
            const int older = recipe.loops && pick(4) == 0 ? recipe.persons : child;
            const int near = std::min(older, 5);
            const Place one = older - 1 - pick(near);
            Place other = older - 1 - pick(near);
            if (pick(6) == 0) other = kNobody;
            const bool swaps = pick(2) == 0;
            const UnionPlace u =
                builder.addUnion(swaps ? other : one, swaps ? one : other, UnionState::married);
            const ChildKind kind =
                recipe.otherBonds && pick(3) == 0 ? static_cast<ChildKind>(pick(6)) : ChildKind::birth;
            builder.addChild(u, child, kind);
        }
    }
    return builder.build();
}

std::string text(const KinGraph& graph) {
    std::ostringstream out;
    for (UnionPlace u = 0; u < graph.unionCount(); ++u) {
        out << graph.partners(u)[0] << "+" << graph.partners(u)[1] << ":";
        for (std::size_t i = 0; i < graph.children(u).size(); ++i)
            out << " " << graph.children(u)[i] << "/" << static_cast<int>(graph.childKinds(u)[i]);
        out << "\n";
    }
    return out.str();
}

std::string text(const std::vector<KinWay>& ways) {
    std::ostringstream out;
    for (const KinWay& way : ways) {
        out << way.up << " " << way.down << " bond " << static_cast<int>(way.bond) << ":";
        for (const Place person : way.persons) out << " " << person;
        out << " over";
        for (const Place person : way.ancestors) out << " " << person;
        out << "\n";
    }
    return out.str();
}

int runs() {
    const char* asked = std::getenv("OLVANE_KINSHIP_RUNS");
    return asked != nullptr ? std::atoi(asked) : 80;
}

void compareWays(const KinGraph& graph, const Kinship& found, const plain::Kinship& judge, bool byBlood) {
    const auto expected = judge.ways(found.a, found.b, byBlood);
    EXPECT_EQ(text(byBlood ? found.blood : found.legal), text(expected))
        << found.a << " and " << found.b << " in\n"
        << text(graph);
    const auto& count = byBlood ? found.bloodCount : found.legalCount;
    const bool loops = byBlood ? found.bloodLoop : found.legalLoop;
    EXPECT_EQ(count, loops ? std::nullopt : std::optional<std::uint64_t>(expected.size())) << text(graph);
}

void compareMarriages(const KinGraph& graph, const Kinship& found, const plain::Kinship& judge) {
    const int distance = judge.distance(found.a, found.b);
    auto expected = judge.marriageWays(found.a, found.b, false);
    if (expected.empty() || static_cast<int>(expected.begin()->size()) - 1 > distance) {
        expected = judge.marriageWays(found.a, found.b, true);
        if (!found.marriageCount) {
            EXPECT_TRUE(found.marriage.empty());
            return;  // given up: the shortest walks pass somebody twice
        }
    }
    EXPECT_EQ(found.marriageCount, expected.size()) << found.a << " and " << found.b << " in\n"
                                                    << text(graph);
    std::set<std::vector<Place>> listed;
    for (const MarriageWay& way : found.marriage) listed.insert(way.persons);
    EXPECT_EQ(listed, expected) << found.a << " and " << found.b << " in\n" << text(graph);
}

void compare(const Recipe& recipe, unsigned seed, bool marriages) {
    std::mt19937 random(seed);
    for (int run = 0; run < runs(); ++run) {
        const KinGraph graph = randomGraph(random, recipe);
        const plain::Kinship judge(graph);
        const auto phi = judge.coefficients();
        KinshipFinder finder(graph);
        for (Place a = 0; a < graph.personCount(); ++a) {
            for (Place b = 0; b < graph.personCount(); ++b) {
                const Kinship found = finder.between(a, b, {2000});
                compareWays(graph, found, judge, true);
                compareWays(graph, found, judge, false);
                if (marriages && a != b) compareMarriages(graph, found, judge);
                if (phi) {
                    ASSERT_TRUE(found.phi.has_value());
                    EXPECT_NEAR(*found.phi, (*phi)[static_cast<std::size_t>(a)][static_cast<std::size_t>(b)],
                                1e-12);
                }
                if (testing::Test::HasFailure()) return;
            }
        }
    }
}

}  // namespace

TEST(KinshipProperties, waysAndNumbersEqualAPlainList) {
    compare({9, false, false}, 1, false);
}

TEST(KinshipProperties, adoptiveWaysEqualAPlainList) {
    compare({9, false, true}, 2, false);
}

TEST(KinshipProperties, waysInLoopsEqualAPlainList) {
    compare({7, true, true}, 3, false);
}

TEST(KinshipProperties, waysOverMarriagesEqualAPlainList) {
    compare({7, false, true}, 4, true);
}

TEST(KinshipProperties, aLimitKeepsTheNearestWays) {
    std::mt19937 random(5);
    for (int run = 0; run < runs(); ++run) {
        const KinGraph graph = randomGraph(random, {10, false, true});
        KinshipFinder finder(graph);
        for (Place b = 0; b < graph.personCount(); ++b) {
            const Kinship all = finder.between(9, b, {2000});
            Kinship few = finder.between(9, b, {3});
            std::vector<KinWay> nearest = all.blood;
            if (nearest.size() > 3) nearest.resize(3);
            EXPECT_EQ(text(few.blood), text(nearest)) << text(graph);
            EXPECT_EQ(few.bloodCount, all.bloodCount);
        }
    }
}

// Also in loops and over other bonds; and the words are those of the whole search, without how many ways there are.
TEST(KinshipProperties, theNearestAloneAreTheNearestOfAllAndHaveTheSameWords) {
    const auto nearest = [](std::vector<KinWay> ways) {
        while (!ways.empty() && ways.back().length() > ways.front().length()) ways.pop_back();
        return ways;
    };
    std::mt19937 random(7);
    for (int run = 0; run < runs(); ++run) {
        const KinGraph graph = randomGraph(random, {10, run % 4 == 0, run % 2 == 0});
        KinshipFinder finder(graph);
        for (Place b = 0; b < graph.personCount(); ++b) {
            Kinship all = finder.between(9, b, {2000});
            const Kinship few = finder.between(9, b, {2000, true});
            EXPECT_EQ(text(few.blood), text(nearest(all.blood))) << text(graph);
            EXPECT_EQ(text(few.legal), text(nearest(all.legal))) << text(graph);
            EXPECT_EQ(few.degree, all.degree);
            EXPECT_FALSE(few.bloodCount || few.legalCount || few.marriageCount || few.phi);
            all.bloodCount = all.legalCount = std::nullopt;
            EXPECT_EQ(kinshipText(graph, few, Language::english), kinshipText(graph, all, Language::english))
                << text(graph);
            EXPECT_EQ(shortKinshipText(graph, few, Language::german),
                      shortKinshipText(graph, all, Language::german));
        }
    }
}

TEST(KinshipProperties, countsByPairsEqualCountsBySums) {
    std::mt19937 random(6);
    for (int run = 0; run < runs(); ++run) {
        const KinGraph graph = randomGraph(random, {40, false, false});
        const KinLinks links(graph);
        Ancestry ancestry(links);
        for (Place a = 0; a < graph.personCount(); a += 3) {
            for (Place b = a + 1; b < graph.personCount(); b += 2) {
                ancestry.gather(a, b, Links::blood);
                ASSERT_FALSE(ancestry.hasLoop());
                const KinSums sums(ancestry);
                EXPECT_FALSE(sums.countNeedsPairs());
                EXPECT_EQ(sums.count(), countByPairs(ancestry, false)) << text(graph);
            }
        }
    }
}
