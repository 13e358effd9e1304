// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The steps of the chart of everybody, against plain versions of what they promise.

#include <olvane/charts/EverybodyLevelsInternal.h>
#include <olvane/charts/EverybodyMarksInternal.h>
#include <olvane/charts/EverybodyOrderInternal.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <numeric>
#include <set>
#include <vector>

#include <RandomKin.h>

namespace {

using namespace olvane::charts;

std::size_t at(std::int32_t place) {
    return static_cast<std::size_t>(place);
}

std::set<std::pair<std::int32_t, std::int32_t>> couplesOf(const Component& part) {
    std::set<std::pair<std::int32_t, std::int32_t>> couples;
    for (const auto& two : part.partners) {
        if (two[0] >= 0 && two[1] >= 0) couples.insert(std::minmax(two[0], two[1]));
    }
    return couples;
}

// The most couples that can stand side by side: the best of all choices that leave nobody with three neighbours and
// close no ring.
int mostSideBySide(const Component& part) {
    const auto set = couplesOf(part);
    const std::vector couples(set.begin(), set.end());
    int most = 0;
    for (std::uint32_t chosen = 0; chosen < (1U << couples.size()); ++chosen) {
        std::vector<int> neighbours(part.persons.size(), 0);
        std::vector<std::size_t> path(part.persons.size());
        std::iota(path.begin(), path.end(), std::size_t{0});
        int count = 0;
        bool possible = true;
        for (std::size_t i = 0; i < couples.size() && possible; ++i) {
            if ((chosen >> i & 1U) == 0) continue;
            const auto [a, b] = couples[i];
            const std::size_t from = path[at(a)], to = path[at(b)];
            possible = ++neighbours[at(a)] <= 2 && ++neighbours[at(b)] <= 2 && from != to;
            std::replace(path.begin(), path.end(), from, to);
            ++count;
        }
        if (possible) most = std::max(most, count);
    }
    return most;
}

int sideBySide(const Component& part, const Chains& chains) {
    int count = 0;
    for (const auto& [a, b] : couplesOf(part)) count += chains.areNeighbours(a, b) ? 1 : 0;
    return count;
}

TEST(EverybodyChains, putAsManyCouplesSideBySideAsCanBe) {
    int tried = 0;
    for (std::uint64_t seed = 0; seed < 150; ++seed) {
        for (const Component& part :
             componentsOf(olvane::test::soundKin(seed, 5 + static_cast<int>(seed % 24)))) {
            const auto couples = couplesOf(part);
            if (couples.size() > 12) continue;
            const bool isTree = [&] {
                std::set<std::int32_t> persons;
                for (const auto& [a, b] : couples) persons.insert({a, b});
                return couples.size() < persons.size();
            }();
            if (!isTree) continue;
            ++tried;
            EXPECT_EQ(sideBySide(part, weldCouples(part)), mostSideBySide(part)) << "seed " << seed;
        }
    }
    EXPECT_GT(tried, 100);
}

TEST(EverybodyChains, holdEverybodyOnce) {
    for (std::uint64_t seed = 0; seed < 100; ++seed) {
        for (const Component& part : componentsOf(olvane::test::hostileKin(seed, 20, 25))) {
            const Chains chains = weldCouples(part);
            std::vector<int> seen(part.persons.size(), 0);
            for (std::int32_t c = 0; c < chains.count(); ++c) {
                for (std::size_t i = 0; i < chains.persons[c].size(); ++i) {
                    const std::int32_t person = chains.persons[c][i];
                    ++seen[at(person)];
                    EXPECT_EQ(chains.chain[at(person)], c);
                    EXPECT_EQ(chains.slot[at(person)], static_cast<std::int32_t>(i));
                }
            }
            EXPECT_EQ(seen, std::vector<int>(part.persons.size(), 1)) << "seed " << seed;
        }
    }
}

struct Laid {
    Component part;
    Chains chains;
    MarkedLinks marked;
    Rows rows;
};

std::vector<Laid> layRows(const olvane::kin::KinGraph& graph, std::int64_t effort) {
    std::vector<Laid> laid;
    for (Component& part : componentsOf(graph)) {
        Laid one;
        one.part = std::move(part);
        one.chains = weldCouples(one.part);
        one.marked =
            marksForWantOfRoom(one.part, one.chains, olvane::charts::LineRoom(one.part.persons.size()));
        one.rows = makeRows(one.part, one.chains, chooseRows(one.part, one.chains, effort), one.marked);
        laid.push_back(std::move(one));
    }
    return laid;
}

// Sum over the links of parents and children of how many rows each runs down.
std::int64_t lengthOf(const Laid& laid) {
    std::int64_t sum = 0;
    for (std::int32_t u = 0; u < laid.part.unionCount(); ++u) {
        const auto& two = laid.part.partners[at(u)];
        const std::int32_t from = laid.rows.row[at(laid.chains.chain[at(two[0] >= 0 ? two[0] : two[1])])];
        for (const std::int32_t child : laid.part.children[u]) {
            sum += laid.rows.row[at(laid.chains.chain[at(child)])] - from;
        }
    }
    return sum;
}

// The least sum of lengths over all rows up to a few more than there need be, by trying them all.
std::int64_t leastLength(const Laid& laid, std::int32_t rowCount) {
    const std::int32_t n = laid.chains.count();
    std::vector<std::int32_t> row(at(n), 0);
    std::int64_t least = std::numeric_limits<std::int64_t>::max();
    while (true) {
        std::int64_t sum = 0;
        bool possible = true;
        for (std::int32_t u = 0; u < laid.part.unionCount(); ++u) {
            const auto& two = laid.part.partners[at(u)];
            const std::int32_t from = row[at(laid.chains.chain[at(two[0] >= 0 ? two[0] : two[1])])];
            for (const std::int32_t child : laid.part.children[u]) {
                const std::int32_t length = row[at(laid.chains.chain[at(child)])] - from;
                possible = possible && length >= 1;
                sum += length;
            }
        }
        if (possible) least = std::min(least, sum);
        std::int32_t next = 0;
        while (next < n && ++row[at(next)] == rowCount) row[at(next++)] = 0;
        if (next == n) return least;
    }
}

TEST(EverybodyRows, keepLinksAsShortAsCanBe) {
    int tried = 0;
    for (std::uint64_t seed = 0; seed < 300; ++seed) {
        for (const Laid& laid :
             layRows(olvane::test::soundKin(seed, 5 + static_cast<int>(seed % 9)), 1'000'000)) {
            const bool allTogether =
                std::all_of(laid.part.partners.begin(), laid.part.partners.end(), [&](const auto& two) {
                    return two[0] < 0 || two[1] < 0 || laid.chains.areNeighbours(two[0], two[1]);
                });
            if (laid.chains.count() > 7 || laid.chains.count() < 4 || !allTogether) continue;
            ++tried;
            EXPECT_EQ(lengthOf(laid), leastLength(laid, laid.rows.rowCount + 1)) << "seed " << seed;
        }
    }
    EXPECT_GT(tried, 30);
}

TEST(EverybodyRows, areRightWithNoEffortAtAll) {
    for (std::uint64_t seed = 0; seed < 60; ++seed) {
        for (const Laid& laid : layRows(olvane::test::soundKin(seed, 60), 0)) {
            for (std::int32_t u = 0; u < laid.part.unionCount(); ++u) {
                for (const std::int32_t partner : laid.part.partners[at(u)]) {
                    if (partner < 0) continue;
                    for (const std::int32_t child : laid.part.children[u]) {
                        EXPECT_LT(laid.rows.row[at(laid.chains.chain[at(partner)])],
                                  laid.rows.row[at(laid.chains.chain[at(child)])])
                            << "seed " << seed;
                    }
                }
            }
        }
    }
}

// Every pair of strands of a gap, end by end, from the definition of crossing.
std::int64_t plainCrossings(const Rows& rows, const RowOrder& order) {
    std::vector<std::int64_t> index(at(rows.nodeCount()));
    for (const auto& nodes : order.nodes) {
        for (std::size_t i = 0; i < nodes.size(); ++i)
            index[at(nodes[i])] = static_cast<std::int64_t>(i) * 100'000;
    }
    const auto place = [&](const Rows::End& end) {
        const bool flipped = !rows.isPass(end.node) && order.flipped[at(end.node)] != 0;
        return index[at(end.node)] + (flipped ? -end.sub : end.sub);
    };
    const auto isLeft = [&](const Rows::Strand& a, const Rows::Strand& b) {
        bool left = true;
        for (const auto& x : rows.endsAbove(a)) {
            for (const auto& y : rows.endsAbove(b)) left = left && place(x) <= place(y);
        }
        for (const auto& x : rows.endsBelow(a)) {
            for (const auto& y : rows.endsBelow(b)) left = left && place(x) <= place(y);
        }
        return left;
    };
    std::int64_t sum = 0;
    for (std::size_t i = 0; i < rows.strands.size(); ++i) {
        for (std::size_t j = 0; j < i; ++j) {
            const auto& a = rows.strands[i];
            const auto& b = rows.strands[j];
            if (a.gap == b.gap && !isLeft(a, b) && !isLeft(b, a)) ++sum;
        }
    }
    return sum;
}

TEST(EverybodyOrder, countsCrossingsAsTheirDefinitionDoes) {
    for (std::uint64_t seed = 0; seed < 60; ++seed) {
        for (const Laid& laid : layRows(olvane::test::hostileKin(seed, 25, 20), 1'000'000)) {
            RowOrder order = walkOrder(laid.rows);
            EXPECT_EQ(countCrossings(laid.rows, order), plainCrossings(laid.rows, order)) << "seed " << seed;
            straightenOrder(laid.rows, order, 50);
            reduceCrossings(laid.rows, order, 1'000'000);
            EXPECT_EQ(countCrossings(laid.rows, order), plainCrossings(laid.rows, order)) << "seed " << seed;
        }
    }
}

TEST(EverybodyOrder, neverAddsCrossingsByReducingThem) {
    for (std::uint64_t seed = 0; seed < 60; ++seed) {
        for (const Laid& laid : layRows(olvane::test::hostileKin(seed, 30, 25), 1'000'000)) {
            RowOrder order = walkOrder(laid.rows);
            const std::int64_t before = countCrossings(laid.rows, order);
            for (const std::int64_t effort : {0, 100, 1'000'000}) {
                RowOrder reduced = order;
                reduceCrossings(laid.rows, reduced, effort);
                EXPECT_LE(countCrossings(laid.rows, reduced), before) << "seed " << seed;
                for (std::size_t r = 0; r < order.nodes.size(); ++r) {
                    EXPECT_TRUE(std::is_permutation(order.nodes[r].begin(), order.nodes[r].end(),
                                                    reduced.nodes[r].begin(), reduced.nodes[r].end()));
                }
            }
        }
    }
}

// All orders of all rows, and all ways round of all chains.
std::int64_t fewestCrossings(const Rows& rows, RowOrder order, std::size_t row, std::int64_t best) {
    if (best == 0) return 0;
    if (row == order.nodes.size()) {
        std::vector<std::int32_t> turnable;
        for (std::int32_t c = 0; c < rows.chainCount; ++c) {
            if (rows.size[at(c)] > 1) turnable.push_back(c);
        }
        for (std::uint32_t turned = 0; turned < (1U << turnable.size()) && best > 0; ++turned) {
            for (std::size_t i = 0; i < turnable.size(); ++i) {
                order.flipped[at(turnable[i])] = static_cast<std::uint8_t>(turned >> i & 1U);
            }
            best = std::min(best, plainCrossings(rows, order));
        }
        return best;
    }
    std::sort(order.nodes[row].begin(), order.nodes[row].end());
    do {
        best = fewestCrossings(rows, order, row + 1, best);
    } while (best > 0 && std::next_permutation(order.nodes[row].begin(), order.nodes[row].end()));
    return best;
}

// Tens of small families exactly: in all of them together at most one crossing in ten is one too many.
TEST(EverybodyOrder, isNearlyTheBestForSmallFamilies) {
    std::int64_t ours = 0;
    std::int64_t least = 0;
    int tried = 0;
    for (std::uint64_t seed = 0; seed < 400; ++seed) {
        for (const Laid& laid : layRows(olvane::test::hostileKin(seed, 9, 5), 1'000'000)) {
            const RowOrder order = walkOrder(laid.rows);
            double choices = 1;
            for (const auto& nodes : order.nodes) {
                for (std::size_t i = 2; i <= nodes.size(); ++i) choices *= static_cast<double>(i);
            }
            for (std::int32_t c = 0; c < laid.chains.count(); ++c)
                choices *= laid.chains.length(c) > 1 ? 2 : 1;
            const std::int64_t crossings = countCrossings(laid.rows, findOrder(laid.rows, 4'000'000, 4));
            if (crossings == 0 || choices > 20'000) continue;
            ++tried;
            ours += crossings;
            least += fewestCrossings(laid.rows, order, 0, crossings);
        }
    }
    EXPECT_GT(tried, 30);
    EXPECT_LE(10 * ours, 11 * least) << ours << " crossings where " << least << " are the fewest, in "
                                     << tried;
}

}  // namespace
