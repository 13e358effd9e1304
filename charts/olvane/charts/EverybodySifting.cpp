// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Fewer crossings, node by node: each is moved along its row and stays where it crosses the fewest lines.

#include <olvane/charts/EverybodyOrderInternal.h>

#include <algorithm>
#include <span>
#include <utility>

#include <olvane/charts/EverybodyReachInternal.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

namespace {

using kin::at;

// Nodes are moved one by one along their row, over one neighbour at a time, and stay where the fewest crossings
// were (sifting: Rudell 1993; Matuszewski, Schönfeld and Molitor 1999).
class Sifting {
public:
    Sifting(const Rows& rows, RowOrder& order, std::int64_t effort)
        : rows_(rows),
          order_(order),
          places_(rows, order),
          given_(effort),
          effort_(effort),
          index_(at(rows.nodeCount())),
          stamps_(rows.strands.size(), 0) {
        reaches_.reserve(rows.strands.size());
        for (std::size_t s = 0; s < rows.strands.size(); ++s) {
            reaches_.push_back(places_.reach(static_cast<std::int32_t>(s)));
        }
        for (const auto& nodes : order.nodes) {
            for (std::size_t i = 0; i < nodes.size(); ++i)
                index_[at(nodes[i])] = static_cast<std::int32_t>(i);
        }
    }

    // One round over all nodes. With drift, a node goes to the last of equally good places that it meets: what was
    // in its way then may not be in another's.
    std::int64_t run(std::int32_t window, bool drift, const ShareDone& done) {
        window_ = window;
        drift_ = drift;
        std::int64_t gain = 0;
        for (std::size_t r = 0; r < order_.nodes.size(); ++r) {
            const std::vector<std::int32_t> nodes = order_.nodes[r];
            if (done) done(shareSpent());
            for (const std::int32_t node : nodes) {
                if (effort_ <= 0) return gain;
                gain += sift(node);
                if (!rows_.isPass(node) && rows_.size[at(node)] > 1) gain += turn(node);
            }
        }
        return gain;
    }
    void runOver(const std::vector<std::int32_t>& nodes, std::int32_t window) {
        window_ = window;
        drift_ = false;
        for (const std::int32_t node : nodes) sift(node);
    }
    std::int64_t effort() const { return effort_; }
    double shareSpent() const {
        if (effort_ <= 0) return 1;
        return 1 - static_cast<double>(effort_) / static_cast<double>(given_);
    }

    void finish() {
        for (std::size_t c = 0; c < order_.flipped.size(); ++c) {
            order_.flipped[c] = places_.flipped(static_cast<std::int32_t>(c));
        }
    }

private:
    std::int64_t crossingsBetween(std::span<const std::int32_t> a, std::span<const std::int32_t> b) {
        std::int64_t sum = 0;
        for (const std::int32_t s : a) {
            for (const std::int32_t t : b) {
                if (s != t) sum += cross(reaches_[at(s)], reaches_[at(t)]);
            }
        }
        effort_ -= static_cast<std::int64_t>(a.size() * b.size());
        return sum;
    }
    std::int64_t crossingsOf(std::int32_t a, std::int32_t b) {
        return crossingsBetween(rows_.strandsAbove[a], rows_.strandsAbove[b]) +
               crossingsBetween(rows_.strandsBelow[a], rows_.strandsBelow[b]);
    }
    void measure(std::int32_t node) {
        for (const std::int32_t s : rows_.strandsAbove[node]) measureStrand(s);
        for (const std::int32_t s : rows_.strandsBelow[node]) measureStrand(s);
    }
    void measureStrand(std::int32_t s) {
        reaches_[at(s)] = places_.reach(s);
        effort_ -= rows_.strands[at(s)].aboveCount + rows_.strands[at(s)].belowCount;
    }

    void swapWithNext(std::vector<std::int32_t>& nodes, std::size_t i) {
        const std::int32_t a = nodes[i];
        const std::int32_t b = nodes[i + 1];
        places_.first(b) = places_.first(a);
        places_.first(a) = places_.first(b) + rows_.size[at(b)];
        nodes[i] = b;
        nodes[i + 1] = a;
        index_[at(b)] = static_cast<std::int32_t>(i);
        index_[at(a)] = static_cast<std::int32_t>(i + 1);
        measure(a);
        measure(b);
    }

    // What swapping places i and i + 1 adds to the crossings. Done, not tried.
    std::int64_t swapped(std::vector<std::int32_t>& nodes, std::size_t i) {
        const std::int32_t a = nodes[i];
        const std::int32_t b = nodes[i + 1];
        const std::int64_t before = crossingsOf(a, b);
        swapWithNext(nodes, i);
        return crossingsOf(a, b) - before;
    }

    // To the left as far as it may go, then to the right of where it was, then to the best place met. Without
    // effort it goes no further, but still to that place.
    std::int64_t sift(std::int32_t node) {
        auto& nodes = order_.nodes[at(rows_.row[at(node)])];
        const std::int32_t start = index_[at(node)];
        const auto last = static_cast<std::int32_t>(nodes.size()) - 1;
        std::int64_t best = 0;
        std::int32_t bestPlace = start;
        std::int64_t now = 0;
        std::int32_t place = start;
        const auto keepBest = [&] {
            if (now > best || (now == best && !drift_)) return;
            best = now;
            bestPlace = place;
        };
        while (place > 0 && start - place < window_ && effort_ > 0) {
            now += swapped(nodes, at(--place));
            keepBest();
        }
        moveTo(nodes, place, start);
        now = 0;
        place = start;
        while (place < last && place - start < window_ && effort_ > 0) {
            now += swapped(nodes, at(place++));
            keepBest();
        }
        moveTo(nodes, place, bestPlace);
        return -best;
    }

    // A node from one place of its row to another, the nodes between by one place the other way.
    void moveTo(std::vector<std::int32_t>& nodes, std::int32_t from, std::int32_t to) {
        if (from == to) return;
        const auto first = nodes.begin() + std::min(from, to);
        const auto last = nodes.begin() + std::max(from, to) + 1;
        std::int32_t next = places_.first(*first);
        std::rotate(first, from < to ? first + 1 : last - 1, last);
        for (auto it = first; it != last; ++it) {
            places_.first(*it) = next;
            next += rows_.size[at(*it)];
            index_[at(*it)] = static_cast<std::int32_t>(it - nodes.begin());
        }
        ++stamp_;
        for (auto it = first; it != last; ++it) measureOnce(*it);
    }

    // Like measure, but a strand that was measured since the stamp changed is left out.
    void measureOnce(std::int32_t node) {
        const auto once = [this](std::int32_t s) {
            if (stamps_[at(s)] == stamp_) return;
            stamps_[at(s)] = stamp_;
            measureStrand(s);
        };
        for (const std::int32_t s : rows_.strandsAbove[node]) once(s);
        for (const std::int32_t s : rows_.strandsBelow[node]) once(s);
    }

    std::int64_t turn(std::int32_t node) {
        const std::int64_t before = crossingsOf(node, node);
        if (before == 0) return 0;
        places_.flipped(node) ^= 1;
        measure(node);
        const std::int64_t after = crossingsOf(node, node);
        if (after < before) return (before - after) / 2;
        places_.flipped(node) ^= 1;
        measure(node);
        return 0;
    }

    const Rows& rows_;
    RowOrder& order_;
    Places places_;
    std::int64_t given_;
    std::int64_t effort_;  // what is left of it
    std::int32_t window_ = 0;
    bool drift_ = false;
    std::vector<std::int32_t> index_;
    std::vector<Reach> reaches_;
    std::uint32_t stamp_ = 0;
    std::vector<std::uint32_t> stamps_;  // by strand: when it was last measured in a move
};

}  // namespace

std::int64_t reduceCrossings(const Rows& rows, RowOrder& order, std::int64_t effort, const ShareDone& done) {
    constexpr int kDriftsInVain = 1;
    Sifting sifting(rows, order, effort);
    const std::int32_t window = 1 << 20;
    for (int inVain = 0; inVain < kDriftsInVain && sifting.effort() > 0; ++inVain) {
        while (sifting.effort() > 0 && sifting.run(window, false, done) > 0) inVain = 0;
        if (sifting.run(window, true, done) > 0) inVain = 0;
    }
    sifting.finish();
    return sifting.effort();
}

void siftNodes(const Rows& rows, RowOrder& order, const std::vector<std::int32_t>& nodes) {
    constexpr std::int32_t kWindow = 60;
    constexpr std::int64_t kEffort = 20'000'000;
    Sifting sifting(rows, order, kEffort);
    sifting.runOver(nodes, kWindow);
    sifting.finish();
}

}  // namespace olvane::charts
