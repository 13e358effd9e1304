// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// For two bars that overlap, the crossings of either order are known: with a above b, those pieces that lead
// down from a within b's reach cross b, and those that lead up from b within a's reach cross a. The better
// order is a preference, as heavy as the difference. An order of all bars that violates little is found
// greedily, then improved by moving single bars to their best place.

#include <olvane/picture/ChannelTracksInternal.h>

#include <algorithm>
#include <numeric>
#include <queue>
#include <set>
#include <tuple>
#include <utility>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::picture {

namespace {

constexpr double kBarRoom = 3;           // points; bars nearer than this do not share a track
constexpr std::size_t kMostActive = 64;  // overlapping bars that are compared with a new one
constexpr int kRounds = 4;

using kin::at;

// Sorted places of verticals, by bar.
class BarEnds {
public:
    template <class BarOf>
    BarEnds(const RoutePlan& plan, BarOf barOf) : first_(plan.bars.size() + 1) {
        for (const Vertical& v : plan.verticals) {
            if (!v.isMerged && barOf(v) != kNone) ++first_[at(barOf(v)) + 1];
        }
        std::partial_sum(first_.begin(), first_.end(), first_.begin());
        places_.resize(first_.back());
        std::vector<std::size_t> next(first_.begin(), first_.end() - 1);
        for (const Vertical& v : plan.verticals) {
            if (!v.isMerged && barOf(v) != kNone) places_[next[at(barOf(v))]++] = v.x;
        }
        for (std::size_t b = 0; b + 1 < first_.size(); ++b) {
            kin::mergeSort(places_.begin() + static_cast<std::ptrdiff_t>(first_[b]),
                           places_.begin() + static_cast<std::ptrdiff_t>(first_[b + 1]));
        }
    }

    // How many ends of bar b lie inside (lo, hi).
    int countWithin(Index b, double lo, double hi) const {
        const auto begin = places_.begin() + static_cast<std::ptrdiff_t>(first_[at(b)]);
        const auto end = places_.begin() + static_cast<std::ptrdiff_t>(first_[at(b) + 1]);
        const auto from = std::upper_bound(begin, end, lo);
        return static_cast<int>(std::max<std::ptrdiff_t>(0, std::lower_bound(from, end, hi) - from));
    }

private:
    std::vector<std::size_t> first_;
    std::vector<double> places_;
};

// A neighbour of a bar in its channel; weight > 0 where it should be below, < 0 where above.
struct Neighbour {
    std::uint32_t bar = 0;
    int weight = 0;
};

// The bars of one channel.
class Channel {
public:
    Channel(const RoutePlan& plan, std::vector<Index> bars, const BarEnds& ups, const BarEnds& downs)
        : plan_(plan), bars_(std::move(bars)), ups_(ups), downs_(downs), neighbours_(bars_.size()) {
        kin::mergeSort(bars_.begin(), bars_.end(), [this](Index a, Index b) {
            return std::pair(bar(a).lo, a) < std::pair(bar(b).lo, b);
        });
        findNeighbours();
    }

    // The track of each bar, in the order of bars().
    std::vector<std::int32_t> tracks(std::int32_t most) {
        const std::vector<std::uint32_t> order = improvedOrder(greedyOrder());
        if (!isComplete_) return stackedTracks(order);
        std::vector<std::int32_t> tracks = firstFreeTracks(order, true);
        if (*std::max_element(tracks.begin(), tracks.end()) < most) return tracks;
        std::vector<std::uint32_t> byLeft(bars_.size());
        std::iota(byLeft.begin(), byLeft.end(), 0U);
        return firstFreeTracks(byLeft, false);
    }

    const std::vector<Index>& bars() const { return bars_; }

    // The number of tracks in each bar's cluster of overlapping bars.
    std::vector<std::int32_t> clusterTracks(const std::vector<std::int32_t>& tracks) const {
        std::vector<std::int32_t> counts(bars_.size());
        for (std::size_t first = 0, next = 0; first < bars_.size(); first = next) {
            double hi = bar(bars_[first]).hi;
            std::int32_t most = 0;
            for (next = first; next < bars_.size() && (next == first || bar(bars_[next]).lo < hi + kBarRoom);
                 ++next) {
                hi = std::max(hi, bar(bars_[next]).hi);
                most = std::max(most, tracks[next] + 1);
            }
            std::fill(counts.begin() + static_cast<std::ptrdiff_t>(first),
                      counts.begin() + static_cast<std::ptrdiff_t>(next), most);
        }
        return counts;
    }

private:
    const Bar& bar(Index b) const { return plan_.bars[at(b)]; }
    const Bar& barOf(std::uint32_t i) const { return bar(bars_[i]); }

    void findNeighbours() {
        std::vector<std::uint32_t> active;
        for (std::uint32_t i = 0; i < bars_.size(); ++i) {
            const double lo = barOf(i).lo - kBarRoom;
            std::erase_if(active, [&](std::uint32_t j) { return barOf(j).hi <= lo; });
            for (const std::uint32_t j : active) addNeighbours(j, i);
            active.push_back(i);
            if (active.size() > kMostActive) {
                active.erase(active.begin());
                isComplete_ = false;
            }
        }
    }

    void addNeighbours(std::uint32_t a, std::uint32_t b) {
        const int weight = crossings(b, a) - crossings(a, b);
        neighbours_[a].push_back({b, weight});
        neighbours_[b].push_back({a, -weight});
    }

    // With bar a above bar b.
    int crossings(std::uint32_t a, std::uint32_t b) const {
        return downs_.countWithin(bars_[a], barOf(b).lo, barOf(b).hi) +
               ups_.countWithin(bars_[b], barOf(a).lo, barOf(a).hi);
    }

    // Takes what nothing needs to be below, or above, as long as there is any; else what gains most by
    // standing above the rest.
    std::vector<std::uint32_t> greedyOrder() const {
        std::vector<int> out(bars_.size());
        std::vector<int> in(bars_.size());
        for (std::size_t i = 0; i < bars_.size(); ++i) {
            for (const Neighbour& n : neighbours_[i]) (n.weight > 0 ? out : in)[i] += std::abs(n.weight);
        }
        using Key = std::tuple<int, int, std::uint32_t>;
        const auto keyOf = [&](std::uint32_t i) {
            return in[i] == 0 ? Key{0, 0, i} : out[i] == 0 ? Key{1, 0, i} : Key{2, in[i] - out[i], i};
        };
        std::set<Key> open;
        for (std::uint32_t i = 0; i < bars_.size(); ++i) open.insert(keyOf(i));
        std::vector<std::uint32_t> front;
        std::vector<std::uint32_t> back;
        std::vector<bool> isDone(bars_.size());
        while (!open.empty()) {
            const auto [kind, gain, i] = *open.begin();
            open.erase(open.begin());
            isDone[i] = true;
            (kind == 1 ? back : front).push_back(i);
            for (const Neighbour& n : neighbours_[i]) {
                if (isDone[n.bar] || n.weight == 0) continue;
                open.erase(keyOf(n.bar));
                (n.weight > 0 ? in : out)[n.bar] -= std::abs(n.weight);
                open.insert(keyOf(n.bar));
            }
        }
        front.insert(front.end(), back.rbegin(), back.rend());
        return front;
    }

    // Moves each bar to the place among its neighbours that violates least.
    std::vector<std::uint32_t> improvedOrder(std::vector<std::uint32_t> order) const {
        std::vector<double> rank(order.size());
        for (int round = 0; round < kRounds; ++round) {
            for (std::size_t i = 0; i < order.size(); ++i) rank[order[i]] = static_cast<double>(i);
            bool moved = false;
            for (const std::uint32_t i : order) moved = moveToBestRank(i, rank) || moved;
            if (!moved) break;
            kin::mergeSort(order.begin(), order.end(),
                           [&](std::uint32_t a, std::uint32_t b) { return rank[a] < rank[b]; });
        }
        return order;
    }

    bool moveToBestRank(std::uint32_t i, std::vector<double>& rank) const {
        std::vector<std::pair<double, int>> places;
        for (const Neighbour& n : neighbours_[i]) {
            if (n.weight != 0) places.emplace_back(rank[n.bar], n.weight);
        }
        if (places.empty()) return false;
        kin::mergeSort(places.begin(), places.end());
        int cost = 0;  // above all: neighbours that should be above are violated
        int present = 0;
        for (const auto& [place, weight] : places) cost += std::max(0, -weight);
        int best = cost;
        double bestRank = places.front().first - 0.5;
        bool isPast = false;
        present = cost;
        for (std::size_t k = 0; k < places.size(); ++k) {
            if (!isPast && places[k].first > rank[i]) {
                present = cost;
                isPast = true;
            }
            cost += places[k].second;
            if (cost >= best) continue;
            best = cost;
            bestRank =
                k + 1 < places.size() ? (places[k].first + places[k + 1].first) / 2 : places[k].first + 0.5;
        }
        if (!isPast) present = cost;
        if (best >= present) return false;
        rank[i] = bestRank;
        return true;
    }

    // The first track that no overlapping bar has, below those that should be above.
    std::vector<std::int32_t> firstFreeTracks(const std::vector<std::uint32_t>& order,
                                              bool keepsOrder) const {
        std::vector<std::int32_t> tracks(bars_.size(), -1);
        std::vector<std::int32_t> used;
        for (const std::uint32_t i : order) {
            used.clear();
            std::int32_t track = 0;
            for (const Neighbour& n : neighbours_[i]) {
                if (tracks[n.bar] < 0) continue;
                used.push_back(tracks[n.bar]);
                if (keepsOrder && n.weight < 0) track = std::max(track, tracks[n.bar] + 1);
            }
            kin::mergeSort(used.begin(), used.end());
            for (const std::int32_t u : used) {
                if (u == track) ++track;
            }
            tracks[i] = track;
        }
        return tracks;
    }

    // Each bar below all earlier ones that it overlaps: a tree of the greatest tracks over stretches of the
    // channel, for channels where not all overlaps are listed.
    std::vector<std::int32_t> stackedTracks(const std::vector<std::uint32_t>& order) const {
        std::vector<double> places;
        for (const Index b : bars_) {
            places.push_back(bar(b).lo - kBarRoom / 2);
            places.push_back(bar(b).hi + kBarRoom / 2);
        }
        kin::mergeSort(places.begin(), places.end());
        places.erase(std::unique(places.begin(), places.end()), places.end());
        const auto indexOf = [&places](double place) {
            return static_cast<std::size_t>(std::lower_bound(places.begin(), places.end(), place) -
                                            places.begin());
        };
        StretchTree tree(places.size());
        std::vector<std::int32_t> tracks(bars_.size());
        for (const std::uint32_t i : order) {
            const std::size_t from = indexOf(barOf(i).lo - kBarRoom / 2);
            const std::size_t to = indexOf(barOf(i).hi + kBarRoom / 2);
            tracks[i] = tree.greatest(from, to) + 1;
            tree.raise(from, to, tracks[i]);
        }
        return tracks;
    }

    // The greatest value over a range, and raising a range to a value: a segment tree whose marks stay where
    // they were set. Values only grow.
    class StretchTree {
    public:
        explicit StretchTree(std::size_t count) {
            while (size_ < count) size_ *= 2;
            greatest_.assign(2 * size_, -1);
            raised_.assign(2 * size_, -1);
        }
        // Both ends included.
        std::int32_t greatest(std::size_t from, std::size_t to) const {
            std::int32_t found = -1;
            std::size_t l = from + size_;
            std::size_t r = to + size_ + 1;
            for (std::size_t node = l; node > 0; node /= 2) found = std::max(found, raised_[node]);
            for (std::size_t node = r - 1; node > 0; node /= 2) found = std::max(found, raised_[node]);
            for (; l < r; l /= 2, r /= 2) {
                if (l % 2 == 1) found = std::max(found, lookUp(l++));
                if (r % 2 == 1) found = std::max(found, lookUp(--r));
            }
            return found;
        }
        void raise(std::size_t from, std::size_t to, std::int32_t value) {
            std::size_t l = from + size_;
            std::size_t r = to + size_ + 1;
            const std::size_t first = l;
            const std::size_t last = r - 1;
            for (; l < r; l /= 2, r /= 2) {
                if (l % 2 == 1) set(l++, value);
                if (r % 2 == 1) set(--r, value);
            }
            for (std::size_t node = first / 2; node > 0; node /= 2) pull(node);
            for (std::size_t node = last / 2; node > 0; node /= 2) pull(node);
        }

    private:
        // With what was raised on a node above.
        std::int32_t lookUp(std::size_t node) const {
            std::int32_t found = greatest_[node];
            for (node /= 2; node > 0; node /= 2) found = std::max(found, raised_[node]);
            return found;
        }
        void set(std::size_t node, std::int32_t value) {
            raised_[node] = std::max(raised_[node], value);
            greatest_[node] = std::max(greatest_[node], value);
        }
        void pull(std::size_t node) {
            greatest_[node] = std::max({greatest_[2 * node], greatest_[2 * node + 1], raised_[node]});
        }
        std::size_t size_ = 1;
        std::vector<std::int32_t> greatest_;
        std::vector<std::int32_t> raised_;
    };

    const RoutePlan& plan_;
    std::vector<Index> bars_;  // by their left ends
    const BarEnds& ups_;
    const BarEnds& downs_;
    std::vector<std::vector<Neighbour>> neighbours_;
    bool isComplete_ = true;
};

}  // namespace

TrackUse assignTracks(RoutePlan& plan, const std::vector<std::int32_t>& most) {
    const BarEnds ups(plan, [](const Vertical& v) { return v.bottom.bar; });
    const BarEnds downs(plan, [](const Vertical& v) { return v.top.bar; });
    std::vector<std::vector<Index>> channels(most.size());
    for (std::size_t b = 0; b < plan.bars.size(); ++b) {
        if (plan.bars[b].hasTrack()) channels[at(plan.bars[b].channel)].push_back(static_cast<Index>(b));
    }
    TrackUse use;
    use.tracks.assign(plan.bars.size(), 1);
    for (std::size_t c = 0; c < channels.size(); ++c) {
        if (channels[c].empty()) continue;
        Channel channel(plan, std::move(channels[c]), ups, downs);
        const std::vector<std::int32_t> tracks = channel.tracks(most[c]);
        const std::vector<std::int32_t> counts = channel.clusterTracks(tracks);
        for (std::size_t i = 0; i < tracks.size(); ++i) {
            plan.bars[at(channel.bars()[i])].track = tracks[i];
            use.tracks[at(channel.bars()[i])] = counts[i];
        }
    }
    return use;
}

}  // namespace olvane::picture
