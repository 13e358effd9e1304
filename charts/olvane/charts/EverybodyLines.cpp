// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Channel routing, one gap at a time (after the left-edge algorithm with vertical constraints of Deutsch 1976):
// ends are moved off one another first; then, of any two bars that overlap, the one goes above that so crosses
// the fewer uprights; last, bars take the highest tracks that this leaves.

#include <olvane/charts/EverybodyLinesInternal.h>

#include <algorithm>
#include <array>
#include <queue>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

// Two uprights that would lie on one another cost more than any number of crossings.
constexpr std::int32_t kCollision = 1 << 20;
// Beyond this many overlapping pairs in one gap, bars are only kept apart.
constexpr std::size_t kMostPairs = std::size_t{1} << 21;

class GapRouting {
public:
    GapRouting(const Rows& rows, std::vector<EndRange>& ranges, GapLines& lines)
        : rows_(rows), ranges_(ranges), lines_(lines), nextInCell_(rows.ends.size(), -1) {}

    void route(std::int32_t gap) {
        const auto strands = rows_.strandsInGap[gap + 1];
        placeEnds(strands);
        collectBars(strands);
        std::int32_t tracks = 0;
        if (findPairs()) {
            sortBars();
            tracks = takeTracks();
        } else {
            tracks = takeTracksByLeftEdge();
        }
        for (const Bar& bar : bars_) lines_.track[at(bar.strand)] = bar.track;
        lines_.tracks[at(gap + 1)] = tracks;
    }

private:
    struct Bar {
        std::int32_t strand;
        double low;
        double high;
        std::int32_t track = -1;
    };
    // Two bars that overlap: what it costs to have one above the other.
    struct Pair {
        std::int32_t one;
        std::int32_t other;
        std::int32_t oneAbove;
        std::int32_t otherAbove;
    };

    // The ends with the least room first.
    void placeEnds(std::span<const std::int32_t> strands) {
        order_.clear();
        for (const std::int32_t s : strands) {
            const Rows::Strand& strand = rows_.strands[at(s)];
            for (std::uint32_t e = strand.firstEnd;
                 e < strand.firstEnd + strand.aboveCount + strand.belowCount; ++e) {
                order_.push_back(static_cast<std::int32_t>(e));
            }
        }
        const auto room = [this](std::int32_t e) { return ranges_[at(e)].high - ranges_[at(e)].low; };
        kin::mergeSort(order_.begin(), order_.end(), [&](std::int32_t a, std::int32_t b) {
            if (room(a) != room(b)) return room(a) < room(b);
            return ranges_[at(a)].wanted < ranges_[at(b)].wanted;
        });
        clearCells();
        for (const std::int32_t e : order_) placeEnd(e);
    }

    void placeEnd(std::int32_t e) {
        const EndRange& range = ranges_[at(e)];
        double x = range.wanted;
        if (range.high > range.low) {
            const double straight = placeOfSameStrand(e, range);
            if (straight == straight && isFree(e, straight)) {
                x = straight;
            } else if (!isFree(e, x)) {
                x = freePlaceNear(e, range);
            }
        }
        lines_.endX[at(e)] = x;
        if (rows_.isPass(rows_.ends[at(e)].node)) fixPass(rows_.ends[at(e)].node, x);
        std::int32_t& first = firstInCell_[cellOf(x)];
        nextInCell_[at(e)] = first;
        first = e;
    }

    // A pass runs straight through its row.
    void fixPass(std::int32_t pass, double x) {
        for (const std::int32_t e : rows_.endsAt[pass]) ranges_[at(e)] = {x, x, x};
    }

    // Ends that have a place are found by cells, each at least as wide as ends must be apart.
    void clearCells() {
        double low = 0;
        double high = 0;
        for (const std::int32_t e : order_) {
            if (e == order_.front() || ranges_[at(e)].low < low) low = ranges_[at(e)].low;
            if (e == order_.front() || ranges_[at(e)].high > high) high = ranges_[at(e)].high;
        }
        const double cells = static_cast<double>(8 * order_.size() + 8);
        cellsFrom_ = low;
        cellWidth_ = std::max(16.0, (high - low) / cells);
        firstInCell_.assign(static_cast<std::size_t>((high - low) / cellWidth_) + 1, -1);
    }

    std::size_t cellOf(double x) const {
        const double cell = (x - cellsFrom_) / cellWidth_;
        if (!(cell > 0)) return 0;
        return std::min(static_cast<std::size_t>(cell), firstInCell_.size() - 1);
    }

    // Calls visit for the placed ends between two places, and some beside them, until it returns false.
    template <class Visit>
    void forPlacedEnds(double from, double to, const Visit& visit) const {
        for (std::size_t cell = cellOf(from); cell <= cellOf(to); ++cell) {
            for (std::int32_t e = firstInCell_[cell]; e >= 0; e = nextInCell_[at(e)]) {
                if (!visit(e, lines_.endX[at(e)])) return;
            }
        }
    }

    // An end of the same strand that lies so near that one upright can serve both; not a number without one.
    double placeOfSameStrand(std::int32_t e, const EndRange& range) const {
        constexpr double kNear = 9;
        double best = std::numeric_limits<double>::quiet_NaN();
        double distance = kNear;
        forPlacedEnds(range.wanted - kNear, range.wanted + kNear, [&](std::int32_t other, double x) {
            if (rows_.strandOfEnd[at(other)] != rows_.strandOfEnd[at(e)]) return true;
            const double apart = x < range.wanted ? range.wanted - x : x - range.wanted;
            if (rows_.isBelow(other) == rows_.isBelow(e) || apart >= distance) return true;
            if (x < range.low || x > range.high) return true;
            distance = apart;
            best = x;
            return true;
        });
        return best;
    }

    bool isFree(std::int32_t e, double x) const {
        bool free = true;
        forPlacedEnds(x - GapLines::kApart, x + GapLines::kApart, [&](std::int32_t other, double otherX) {
            if (rows_.strandOfEnd[at(other)] == rows_.strandOfEnd[at(e)]) return true;
            free = otherX <= x - GapLines::kApart || otherX >= x + GapLines::kApart;
            return free;
        });
        return free;
    }

    double freePlaceNear(std::int32_t e, const EndRange& range) const {
        for (double away = GapLines::kApart; away <= range.high - range.low; away += 1) {
            if (range.wanted + away <= range.high && isFree(e, range.wanted + away))
                return range.wanted + away;
            if (range.wanted - away >= range.low && isFree(e, range.wanted - away))
                return range.wanted - away;
        }
        return range.wanted;
    }

    void collectBars(std::span<const std::int32_t> strands) {
        bars_.clear();
        for (const std::int32_t s : strands) {
            const Rows::Strand& strand = rows_.strands[at(s)];
            Bar bar{s, lines_.endX[strand.firstEnd], lines_.endX[strand.firstEnd]};
            for (std::uint32_t i = 1; i < strand.aboveCount + strand.belowCount; ++i) {
                bar.low = std::min(bar.low, lines_.endX[strand.firstEnd + i]);
                bar.high = std::max(bar.high, lines_.endX[strand.firstEnd + i]);
            }
            if (bar.low < bar.high) bars_.push_back(bar);
        }
        kin::mergeSort(bars_.begin(), bars_.end(), [](const Bar& a, const Bar& b) { return a.low < b.low; });
    }

    // False where there are too many.
    bool findPairs() {
        pairs_.clear();
        for (std::size_t i = 0; i < bars_.size(); ++i) {
            for (std::size_t j = i + 1; j < bars_.size() && bars_[j].low < bars_[i].high + GapLines::kApart;
                 ++j) {
                if (pairs_.size() == kMostPairs) return false;
                const Pair pair{static_cast<std::int32_t>(i), static_cast<std::int32_t>(j),
                                costAbove(bars_[i], bars_[j]), costAbove(bars_[j], bars_[i])};
                pairs_.push_back(pair);
            }
        }
        return true;
    }

    // What it costs to have one bar above the other: its uprights down to the row below cross the other bar where they
    // are in its reach, and the other's uprights up to the row above cross it.
    std::int32_t costAbove(const Bar& one, const Bar& other) const {
        const Rows::Strand& upper = rows_.strands[at(one.strand)];
        const Rows::Strand& lower = rows_.strands[at(other.strand)];
        std::int32_t cost = 0;
        const std::uint32_t firstDown = upper.firstEnd + upper.aboveCount;
        for (std::uint32_t e = firstDown; e < firstDown + upper.belowCount; ++e) {
            const double x = lines_.endX[e];
            if (x <= other.low - 2 || x >= other.high + 2) continue;
            ++cost;
            for (std::uint32_t f = lower.firstEnd; f < lower.firstEnd + lower.aboveCount; ++f) {
                if (lines_.endX[f] > x - 2.25 && lines_.endX[f] < x + 2.25) cost += kCollision;
            }
        }
        for (std::uint32_t e = lower.firstEnd; e < lower.firstEnd + lower.aboveCount; ++e) {
            if (lines_.endX[e] > one.low - 2 && lines_.endX[e] < one.high + 2) ++cost;
        }
        return cost;
    }

    // The bars from top to bottom: always one that no other should be above; where they wait for one another in a
    // ring, one of those that the fewest should be above.
    void sortBars() {
        const auto n = bars_.size();
        later_.fill(n, [this](const auto& visit) {
            for (std::size_t p = 0; p < pairs_.size(); ++p) {
                if (isImportant(pairs_[p])) visit(upperOf(pairs_[p]), static_cast<std::int32_t>(p));
            }
        });
        waiting_.assign(n, 0);
        for (const Pair& pair : pairs_) {
            if (isImportant(pair)) waiting_[at(lowerOf(pair))] += weight(pair);
        }
        std::priority_queue<std::int32_t, std::vector<std::int32_t>, std::greater<>> ready;
        for (std::size_t i = 0; i < n; ++i) {
            if (waiting_[i] == 0) ready.push(static_cast<std::int32_t>(i));
        }
        std::vector<std::uint8_t> taken(n, 0);
        byOrder_.clear();
        while (byOrder_.size() < n) {
            if (ready.empty()) ready.push(leastWaiting(taken));
            const std::int32_t bar = ready.top();
            ready.pop();
            taken[at(bar)] = 1;
            byOrder_.push_back(bar);
            for (const std::int32_t p : later_[bar]) {
                const std::int32_t below = lowerOf(pairs_[at(p)]);
                if (taken[at(below)] != 0) continue;
                waiting_[at(below)] -= weight(pairs_[at(p)]);
                if (waiting_[at(below)] == 0) ready.push(below);
            }
        }
    }

    std::int32_t leastWaiting(const std::vector<std::uint8_t>& taken) const {
        std::int32_t least = -1;
        for (std::size_t i = 0; i < waiting_.size(); ++i) {
            if (taken[i] == 0 && (least < 0 || waiting_[i] < waiting_[at(least)]))
                least = static_cast<std::int32_t>(i);
        }
        return least;
    }

    static std::int32_t upperOf(const Pair& pair) {
        return pair.oneAbove < pair.otherAbove ? pair.one : pair.other;
    }
    static std::int32_t lowerOf(const Pair& pair) {
        return pair.oneAbove < pair.otherAbove ? pair.other : pair.one;
    }

    // A pair that need not cross, or whose uprights would lie on one another; which of two that cross either way is
    // above does not matter.
    static bool isImportant(const Pair& pair) {
        const std::int32_t least = std::min(pair.oneAbove, pair.otherAbove);
        return pair.oneAbove != pair.otherAbove && (least == 0 || collides(pair));
    }
    static bool collides(const Pair& pair) { return std::max(pair.oneAbove, pair.otherAbove) >= kCollision; }
    static std::int64_t weight(const Pair& pair) { return collides(pair) ? std::int64_t{1} << 30 : 1; }

    std::int32_t takeTracks() {
        around_.fill(bars_.size(), [this](const auto& visit) {
            for (std::size_t p = 0; p < pairs_.size(); ++p) {
                visit(pairs_[p].one, static_cast<std::int32_t>(p));
                visit(pairs_[p].other, static_cast<std::int32_t>(p));
            }
        });
        std::int32_t tracks = 0;
        std::vector<std::int32_t> used;
        for (const std::int32_t bar : byOrder_) {
            std::int32_t first = 0;
            used.clear();
            for (const std::int32_t p : around_[bar]) {
                const Pair& pair = pairs_[at(p)];
                const Bar& other = bars_[at(pair.one == bar ? pair.other : pair.one)];
                if (other.track < 0) continue;
                used.push_back(other.track);
                if (isImportant(pair)) first = std::max(first, other.track + 1);
            }
            kin::mergeSort(used.begin(), used.end());
            for (const std::int32_t track : used) {
                if (track == first) ++first;
            }
            bars_[at(bar)].track = first;
            tracks = std::max(tracks, first + 1);
        }
        return tracks;
    }

    std::int32_t takeTracksByLeftEdge() {
        using Entry = std::pair<double, std::int32_t>;
        std::priority_queue<Entry, std::vector<Entry>, std::greater<>> busy;
        std::int32_t tracks = 0;
        for (Bar& bar : bars_) {
            if (!busy.empty() && busy.top().first + GapLines::kApart <= bar.low) {
                bar.track = busy.top().second;
                busy.pop();
            } else {
                bar.track = tracks++;
            }
            busy.push({bar.high, bar.track});
        }
        return tracks;
    }

    const Rows& rows_;
    std::vector<EndRange>& ranges_;
    GapLines& lines_;
    std::vector<std::int32_t> order_;
    std::vector<std::int32_t> firstInCell_;
    std::vector<std::int32_t> nextInCell_;  // by end
    double cellsFrom_ = 0;
    double cellWidth_ = 16;
    std::vector<Bar> bars_;
    std::vector<Pair> pairs_;
    NumberLists later_;
    NumberLists around_;
    std::vector<std::int32_t> byOrder_;
    std::vector<std::int64_t> waiting_;  // by bar: for those that should be above it
};

}  // namespace

GapLines routeGaps(const Rows& rows, std::vector<EndRange> ends) {
    GapLines lines;
    lines.endX.resize(rows.ends.size());
    lines.track.assign(rows.strands.size(), -1);
    lines.tracks.assign(at(rows.rowCount + 1), 0);
    GapRouting routing(rows, ends, lines);
    for (std::int32_t gap = -1; gap < rows.rowCount; ++gap) routing.route(gap);
    return lines;
}

}  // namespace olvane::charts
