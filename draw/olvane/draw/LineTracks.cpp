// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Gives families whose trunks would lie on top of each other a track each, as a switchboard does with its
// channels. Every gap between two rows (or columns) of boxes is one channel. Families whose spans touch there
// form a group; a group in which two share a track is ordered so that few lines cross, and set out evenly
// over the gap.

#include <olvane/draw/LineTracksInternal.h>

#include <algorithm>
#include <cstdlib>
#include <map>
#include <numeric>
#include <tuple>
#include <utility>

namespace olvane::draw {

namespace {

constexpr int kApart = 4;                  // points; nearer lines read as one
constexpr int kSameLane = 3;               // points; taps nearer than this would run into each other
constexpr int kLaneClash = 100;            // crossings that one such run counts for
constexpr std::size_t kMostOrdered = 512;  // larger groups keep their order

struct Gap {
    int from = 0;
    int to = 0;
    bool operator<(const Gap& other) const { return std::tie(from, to) < std::tie(other.from, other.to); }
};

// The edges of all boxes across the trunks, to find the gap that a trunk runs in.
class GapFinder {
public:
    GapFinder(const std::vector<LayoutRecord>& records, LineDirection direction, const BoxSize& box) {
        for (const LayoutRecord& record : records) {
            const bool downward = direction == LineDirection::downward;
            starts_.push_back(downward ? record.y : record.x);
            ends_.push_back(downward ? record.y + box.height : record.x + box.width);
        }
        for (std::vector<int>* edges : {&starts_, &ends_}) {
            std::sort(edges->begin(), edges->end());
            edges->erase(std::unique(edges->begin(), edges->end()), edges->end());
        }
    }

    Gap gapAround(int trunk) const {
        const auto after = std::lower_bound(starts_.begin(), starts_.end(), trunk);
        const auto before = std::upper_bound(ends_.begin(), ends_.end(), trunk);
        Gap gap;
        gap.from = before == ends_.begin() ? trunk - 2 * kApart : *(before - 1);
        gap.to = after == starts_.end() ? trunk + 2 * kApart : *after;
        return gap;
    }

private:
    std::vector<int> starts_;
    std::vector<int> ends_;
};

bool spansTouch(const FamilyLine& a, const FamilyLine& b) {
    return a.first() <= b.last() + kApart && b.first() <= a.last() + kApart;
}

bool shareTrack(const FamilyLine& a, const FamilyLine& b) {
    return std::abs(a.trunk - b.trunk) < kApart && spansTouch(a, b);
}

bool isWithin(int at, const FamilyLine& family) {
    return at >= family.first() && at <= family.last();
}

// What it costs when a's track lies before b's: a's taps that come from behind cross b's trunk, and the
// reverse.
int costOfOrder(const FamilyLine& a, const FamilyLine& b) {
    int cost = 0;
    for (const FamilyTap& tap : a.taps) {
        if (tap.end >= a.trunk && isWithin(tap.at, b)) ++cost;
    }
    for (const FamilyTap& tap : b.taps) {
        if (tap.end < b.trunk && isWithin(tap.at, a)) ++cost;
    }
    for (const FamilyTap& behind : a.taps) {
        for (const FamilyTap& before : b.taps) {
            const bool overlap = behind.end >= a.trunk && before.end < b.trunk;
            if (overlap && std::abs(behind.at - before.at) < kSameLane) cost += kLaneClash;
        }
    }
    return cost;
}

using Group = std::vector<std::size_t>;

// Families of one gap, cut into groups whose spans hang together.
std::vector<Group> connectedGroups(const std::vector<FamilyLine>& families, Group members) {
    std::stable_sort(members.begin(), members.end(),
                     [&](std::size_t a, std::size_t b) { return families[a].first() < families[b].first(); });
    std::vector<Group> groups;
    int reach = 0;
    for (const std::size_t member : members) {
        if (groups.empty() || families[member].first() > reach + kApart) {
            groups.emplace_back();
            reach = families[member].last();
        }
        groups.back().push_back(member);
        reach = std::max(reach, families[member].last());
    }
    return groups;
}

bool needsSeparating(const std::vector<FamilyLine>& families, const Group& group) {
    for (std::size_t i = 0; i < group.size(); ++i) {
        for (std::size_t j = i + 1; j < group.size(); ++j) {
            if (shareTrack(families[group[i]], families[group[j]])) return true;
        }
    }
    return false;
}

// Every cost between two members: costs[i][j] for i before j.
std::vector<std::vector<int>> costsWithin(const std::vector<FamilyLine>& families, const Group& group) {
    std::vector<std::vector<int>> costs(group.size(), std::vector<int>(group.size(), 0));
    for (std::size_t i = 0; i < group.size(); ++i) {
        for (std::size_t j = 0; j < group.size(); ++j) {
            if (i != j) costs[i][j] = costOfOrder(families[group[i]], families[group[j]]);
        }
    }
    return costs;
}

// The place among the others where a member costs least, by walking it past them one by one; its own place
// where no other is better.
std::size_t bestPlace(const std::vector<std::size_t>& order, std::size_t from,
                      const std::vector<std::vector<int>>& costs) {
    std::size_t best = from;
    int bestSaving = 0;
    for (const int direction : {-1, 1}) {
        int saving = 0;
        for (std::size_t to = from; direction < 0 ? to > 0 : to + 1 < order.size();) {
            to = direction < 0 ? to - 1 : to + 1;
            const std::size_t self = order[from];
            const std::size_t other = order[to];
            const int change = costs[other][self] - costs[self][other];  // what putting self ahead would save
            saving += direction < 0 ? change : -change;
            if (saving > bestSaving) {
                bestSaving = saving;
                best = to;
            }
        }
    }
    return best;
}

void moveWithin(std::vector<std::size_t>& order, std::size_t from, std::size_t to) {
    const auto at = [&order](std::size_t i) { return order.begin() + static_cast<std::ptrdiff_t>(i); };
    if (from < to) std::rotate(at(from), at(from + 1), at(to + 1));
    if (to < from) std::rotate(at(to), at(from), at(from + 1));
}

// Moves members to better places as long as that saves crossings. Every move lowers the sum, so it ends.
void orderByCrossings(const std::vector<FamilyLine>& families, Group& group) {
    if (group.size() > kMostOrdered) return;
    const auto costs = costsWithin(families, group);
    std::vector<std::size_t> order(group.size());
    std::iota(order.begin(), order.end(), std::size_t{0});
    for (bool improved = true; improved;) {
        improved = false;
        for (std::size_t from = 0; from < order.size(); ++from) {
            const std::size_t to = bestPlace(order, from, costs);
            if (to == from) continue;
            moveWithin(order, from, to);
            improved = true;
        }
    }
    Group ordered;
    for (const std::size_t member : order) ordered.push_back(group[member]);
    group = std::move(ordered);
}

// The track of each member: one behind every earlier member that its span touches.
std::vector<int> tracksInOrder(const std::vector<FamilyLine>& families, const Group& group) {
    std::vector<int> tracks(group.size(), 0);
    for (std::size_t i = 0; i < group.size(); ++i) {
        for (std::size_t j = 0; j < i; ++j) {
            if (spansTouch(families[group[i]], families[group[j]]))
                tracks[i] = std::max(tracks[i], tracks[j] + 1);
        }
    }
    return tracks;
}

void spreadOverGap(const Group& group, const std::vector<int>& tracks, const Gap& gap,
                   std::vector<double>& places) {
    const int count = 1 + *std::max_element(tracks.begin(), tracks.end());
    const double step = static_cast<double>(gap.to - gap.from) / (count + 1);
    for (std::size_t i = 0; i < group.size(); ++i) places[group[i]] = gap.from + step * (tracks[i] + 1);
}

}  // namespace

std::vector<double> separateTracks(const std::vector<FamilyLine>& families,
                                   const std::vector<LayoutRecord>& records, LineDirection direction,
                                   const BoxSize& box) {
    std::vector<double> places;
    std::map<Gap, Group> channels;
    const GapFinder finder(records, direction, box);
    for (std::size_t i = 0; i < families.size(); ++i) {
        places.push_back(families[i].trunk);
        channels[finder.gapAround(families[i].trunk)].push_back(i);
    }
    for (const auto& [gap, members] : channels) {
        for (Group& group : connectedGroups(families, members)) {
            if (!needsSeparating(families, group)) continue;
            orderByCrossings(families, group);
            spreadOverGap(group, tracksInOrder(families, group), gap, places);
        }
    }
    return places;
}

}  // namespace olvane::draw
