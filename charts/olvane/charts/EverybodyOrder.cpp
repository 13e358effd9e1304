// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order in the rows, which decides over crossings: several starts are improved, and the best end is taken.

#include <olvane/charts/EverybodyOrderInternal.h>

#include <algorithm>
#include <array>
#include <utility>

#include <olvane/charts/EverybodyReachInternal.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

namespace {

using kin::at;

std::int64_t crossingPairs(const std::vector<Reach>& reaches) {
    std::int64_t crossings = 0;
    for (std::size_t i = 0; i < reaches.size(); ++i) {
        for (std::size_t j = 0; j < i; ++j) crossings += cross(reaches[i], reaches[j]);
    }
    return crossings;
}

}  // namespace

// By comparing all pairs of a gap: it is asked for where rows are short.
std::int64_t countCrossings(const Rows& rows, const RowOrder& order) {
    const Places places(rows, order);
    std::int64_t crossings = 0;
    std::vector<Reach> reaches;
    for (std::int32_t gap = -1; gap < rows.rowCount; ++gap) {
        reaches.clear();
        for (const std::int32_t s : rows.strandsInGap[gap + 1]) reaches.push_back(places.reach(s));
        crossings += crossingPairs(reaches);
    }
    return crossings;
}

namespace {

// Whether every chain hangs from one strand at most, and every strand from one end: a walk then crosses nothing.
bool isForest(const Rows& rows) {
    for (std::int32_t node = 0; node < rows.nodeCount(); ++node) {
        if (rows.strandsAbove[node].size() > 1) return false;
    }
    return std::all_of(rows.strands.begin(), rows.strands.end(),
                       [](const Rows::Strand& strand) { return strand.aboveCount == 1; });
}

// Every row in any order, the same for the same number.
void shuffle(RowOrder& order, std::uint32_t number) {
    std::uint64_t random = number;
    for (auto& nodes : order.nodes) {
        for (std::size_t i = nodes.size(); i > 1; --i) {
            random = random * 6364136223846793005U + 1442695040888963407U;
            std::swap(nodes[i - 1], nodes[(random >> 33U) % i]);
        }
    }
}

// Up to here, sifting is fast enough to start from random orders as well.
constexpr std::int32_t kMostNodesToShuffle = 100;
constexpr std::uint32_t kShuffles = 16;

// The best order so far; fewer than 0 crossings before the first one.
struct BestOrder {
    RowOrder order;
    std::int64_t crossings = -1;

    void offer(RowOrder other, std::int64_t itsCrossings) {
        if (crossings >= 0 && itsCrossings >= crossings) return;
        order = std::move(other);
        crossings = itsCrossings;
    }
};

void tryRandomOrders(const Rows& rows, const RowOrder& walk, std::int64_t effort, BestOrder& best) {
    for (std::uint32_t number = 1; number <= kShuffles && best.crossings > 0; ++number) {
        RowOrder order = walk;
        shuffle(order, number);
        reduceCrossings(rows, order, effort);
        const std::int64_t crossings = countCrossings(rows, order);
        best.offer(std::move(order), crossings);
    }
}

}  // namespace

RowOrder findOrder(const Rows& rows, std::int64_t effort, int starts, const ShareDone& done) {
    // After a few rounds of straightening, parts of the picture are straight; after many, all of it is.
    constexpr std::array<int, 4> kShares = {1, 0, 30, 6};
    constexpr std::int64_t kStepsOfRounds = 40'000'000;
    const std::int64_t most = std::clamp<std::int64_t>(kStepsOfRounds / (rows.nodeCount() + 1), 60, 1500);
    RowOrder walk = walkOrder(rows);
    if (isForest(rows)) return walk;
    BestOrder best;
    for (int i = 0; i < starts && i < static_cast<int>(kShares.size()) && best.crossings != 0; ++i) {
        RowOrder order = walk;
        const int share = kShares[at(i)];
        if (share > 0) straightenOrder(rows, order, static_cast<int>(most / share));
        const auto doneOfAll = [&](double ofStart) { done((i + ofStart) / starts); };
        reduceCrossings(rows, order, effort / starts, done ? ShareDone(doneOfAll) : ShareDone());
        const std::int64_t crossings = starts > 1 ? countCrossings(rows, order) : 0;
        best.offer(std::move(order), crossings);
    }
    if (starts > 1 && rows.nodeCount() <= kMostNodesToShuffle) {
        tryRandomOrders(rows, walk, effort / starts, best);
    }
    return std::move(best.order);
}

}  // namespace olvane::charts
