// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/EverybodyOrderInternal.h>

#include <algorithm>
#include <array>
#include <utility>

#include <olvane/charts/EverybodyReachInternal.h>
#include <olvane/kin/Index.h>
#include <olvane/kin/MergeSort.h>

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

// The walk keeps what is still to be done on a stack of its own. Entered by one of its ends, a node has what hangs
// above its other ends on that side of it where they are.
class Walk {
public:
    explicit Walk(const Rows& rows)
        : rows_(rows), nodeMet_(at(rows.nodeCount()), 0), strandMet_(rows.strands.size(), 0) {
        order_.nodes.resize(at(rows.rowCount));
        order_.flipped.assign(at(rows.chainCount), 0);
    }

    RowOrder run() {
        for (std::int32_t node = 0; node < rows_.chainCount; ++node) {
            if (rows_.strandsAbove[node].empty()) walk(node);
        }
        for (std::int32_t node = 0; node < rows_.chainCount; ++node) walk(node);
        return std::move(order_);
    }

private:
    enum class Step : std::uint8_t { meetNode, placeNode, meetStrand };
    struct Task {
        Step step;
        std::int32_t what;
        std::int32_t sub;  // of a node: where it is entered from above; -1 for from below
    };

    void walk(std::int32_t first) {
        tasks_.push_back({Step::meetNode, first, -1});
        while (!tasks_.empty()) {
            const Task task = tasks_.back();
            tasks_.pop_back();
            later_.clear();
            switch (task.step) {
                case Step::meetNode:
                    meetNode(task.what, task.sub);
                    break;
                case Step::placeNode:
                    order_.nodes[at(rows_.row[at(task.what)])].push_back(task.what);
                    break;
                case Step::meetStrand:
                    meetStrand(task.what);
                    break;
            }
            tasks_.insert(tasks_.end(), later_.rbegin(), later_.rend());
        }
    }

    void meetNode(std::int32_t node, std::int32_t entered) {
        if (nodeMet_[at(node)] != 0) return;
        nodeMet_[at(node)] = 1;
        const auto all = rows_.endsAt[node];
        ends_.assign(all.begin(), all.end());
        kin::mergeSort(ends_.begin(), ends_.end(), [this](std::int32_t a, std::int32_t b) {
            return rows_.ends[at(a)].sub < rows_.ends[at(b)].sub;
        });
        const auto addStrands = [&](bool above, bool left) {
            for (const std::int32_t e : ends_) {
                if (rows_.isBelow(e) != above) continue;
                if (above && (rows_.ends[at(e)].sub < entered) != left) continue;
                later_.push_back({Step::meetStrand, rows_.strandOfEnd[at(e)], -1});
            }
        };
        addStrands(true, true);
        later_.push_back({Step::placeNode, node, -1});
        addStrands(false, false);
        addStrands(true, false);
    }

    void meetStrand(std::int32_t s) {
        if (strandMet_[at(s)] != 0) return;
        strandMet_[at(s)] = 1;
        const Rows::Strand& strand = rows_.strands[at(s)];
        for (const Rows::End& end : rows_.endsAbove(strand)) later_.push_back({Step::meetNode, end.node, -1});
        for (const Rows::End& end : rows_.endsBelow(strand))
            later_.push_back({Step::meetNode, end.node, end.sub});
    }

    const Rows& rows_;
    std::vector<std::uint8_t> nodeMet_;
    std::vector<std::uint8_t> strandMet_;
    std::vector<std::int32_t> ends_;
    std::vector<Task> tasks_;
    std::vector<Task> later_;
    RowOrder order_;
};

// One-dimensional drawing by the second eigenvector of the Laplacian, by power iteration (Fiedler 1973; Carmel,
// Harel and Koren 2002, for graphs in rows). A strand is a hyperedge: a star around its middle.
class Straightening {
public:
    Straightening(const Rows& rows, const RowOrder& order)
        : rows_(rows), x_(at(rows.nodeCount())), next_(x_.size()), middle_(rows.strands.size()) {
        for (const auto& nodes : order.nodes) {
            double left = 0;
            for (const std::int32_t node : nodes) left -= rows.size[at(node)];
            for (const std::int32_t node : nodes) {
                x_[at(node)] = left + rows.size[at(node)];
                left += 2 * rows.size[at(node)];
            }
        }
    }

    // Everybody as far right as the number of strands from one end of the family to them. The end is the last
    // that a first such walk meets (George and Liu 1979).
    void startFromOneEnd() {
        std::vector<std::int32_t> met(x_.size(), -1);
        std::vector<std::int32_t> queue;
        walkInBreadth(0, met, queue);
        const std::int32_t end = queue.back();
        std::fill(met.begin(), met.end(), -1);
        queue.clear();
        walkInBreadth(end, met, queue);
        for (std::size_t i = 0; i < x_.size(); ++i) x_[i] = met[i];
    }

    const std::vector<double>& run(int rounds) {
        normalise();
        for (int i = 0; i < rounds; ++i) {
            for (std::size_t s = 0; s < middle_.size(); ++s) middle_[s] = middleOf(rows_.strands[s]);
            for (std::int32_t node = 0; node < rows_.nodeCount(); ++node) averageNode(node);
            x_.swap(next_);
            normalise();
        }
        return x_;
    }

private:
    void walkInBreadth(std::int32_t first, std::vector<std::int32_t>& met,
                       std::vector<std::int32_t>& queue) const {
        std::vector<std::uint8_t> strandMet(rows_.strands.size(), 0);
        met[at(first)] = 0;
        queue.push_back(first);
        for (std::size_t next = 0; next < queue.size(); ++next) {
            const std::int32_t node = queue[next];
            for (const std::int32_t e : rows_.endsAt[node]) {
                const std::int32_t s = rows_.strandOfEnd[at(e)];
                if (strandMet[at(s)] != 0) continue;
                strandMet[at(s)] = 1;
                const Rows::Strand& strand = rows_.strands[at(s)];
                const std::uint32_t count = strand.aboveCount + strand.belowCount;
                for (std::uint32_t i = strand.firstEnd; i < strand.firstEnd + count; ++i) {
                    const std::int32_t other = rows_.ends[i].node;
                    if (met[at(other)] >= 0) continue;
                    met[at(other)] = met[at(node)] + 1;
                    queue.push_back(other);
                }
            }
        }
    }

    double middleOf(const Rows::Strand& strand) const {
        const std::uint32_t count = strand.aboveCount + strand.belowCount;
        double sum = 0;
        for (std::uint32_t e = strand.firstEnd; e < strand.firstEnd + count; ++e)
            sum += x_[at(rows_.ends[e].node)];
        return sum / count;
    }

    void averageNode(std::int32_t node) {
        double sum = 0;
        for (const std::int32_t s : rows_.strandsAbove[node]) sum += middle_[at(s)];
        for (const std::int32_t s : rows_.strandsBelow[node]) sum += middle_[at(s)];
        const std::size_t count = rows_.strandsAbove[node].size() + rows_.strandsBelow[node].size();
        const double x = x_[at(node)];
        next_[at(node)] = count > 0 ? (x + sum / static_cast<double>(count)) / 2 : x;
    }

    // Mean 0 and greatest distance 1: without it everything ends in one point.
    void normalise() {
        double sum = 0;
        for (const double x : x_) sum += x;
        const double mean = sum / static_cast<double>(x_.size());
        double most = 0;
        for (double& x : x_) {
            x -= mean;
            most = std::max(most, x < 0 ? -x : x);
        }
        if (most == 0) return;
        for (double& x : x_) x /= most;
    }

    const Rows& rows_;
    std::vector<double> x_;
    std::vector<double> next_;
    std::vector<double> middle_;
};

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

RowOrder walkOrder(const Rows& rows) {
    return Walk(rows).run();
}

// Beyond this, so many rounds as would straighten a walk are too many, and distances are a better start.
constexpr std::int32_t kMostNodesOfAWalk = 5'000;

void straightenOrder(const Rows& rows, RowOrder& order, int rounds) {
    Straightening straightening(rows, order);
    if (rows.nodeCount() > kMostNodesOfAWalk) straightening.startFromOneEnd();
    const std::vector<double>& x = straightening.run(rounds);
    for (auto& nodes : order.nodes) {
        kin::mergeSort(nodes.begin(), nodes.end(),
                       [&x](std::int32_t a, std::int32_t b) { return x[at(a)] < x[at(b)]; });
    }
}

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

// So few nodes are sifted so fast that they can also start from any order.
constexpr std::int32_t kMostNodesToShuffle = 100;
constexpr std::uint32_t kShuffles = 16;

RowOrder findOrder(const Rows& rows, std::int64_t effort, int starts, const ShareDone& done) {
    // After a few rounds of straightening, parts of the picture are straight; after many, all of it is.
    constexpr std::array<int, 4> kShares = {1, 0, 30, 6};
    constexpr std::int64_t kStepsOfRounds = 40'000'000;
    const std::int64_t most = std::clamp<std::int64_t>(kStepsOfRounds / (rows.nodeCount() + 1), 60, 1500);
    RowOrder walk = walkOrder(rows);
    if (isForest(rows)) return walk;
    RowOrder best;
    std::int64_t fewest = -1;
    for (int i = 0; i < starts && i < static_cast<int>(kShares.size()) && fewest != 0; ++i) {
        RowOrder order = walk;
        const int share = kShares[at(i)];
        if (share > 0) straightenOrder(rows, order, static_cast<int>(most / share));
        const auto doneOfAll = [&](double ofStart) { done((i + ofStart) / starts); };
        reduceCrossings(rows, order, effort / starts, done ? ShareDone(doneOfAll) : ShareDone());
        const std::int64_t crossings = starts > 1 ? countCrossings(rows, order) : 0;
        if (fewest >= 0 && crossings >= fewest) continue;
        fewest = crossings;
        best = std::move(order);
    }
    const bool shuffles = starts > 1 && rows.nodeCount() <= kMostNodesToShuffle;
    for (std::uint32_t number = 1; shuffles && number <= kShuffles && fewest > 0; ++number) {
        RowOrder order = walk;
        shuffle(order, number);
        reduceCrossings(rows, order, effort / starts);
        const std::int64_t crossings = countCrossings(rows, order);
        if (crossings >= fewest) continue;
        fewest = crossings;
        best = std::move(order);
    }
    return best;
}

}  // namespace olvane::charts
