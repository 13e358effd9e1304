// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <unordered_map>
#include <vector>

#include <olvane/kin/AncestryInternal.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::kin {

// Which ways of an ancestry are listed.
enum class WaySort : std::uint8_t { blood, otherBonds };

// Lists the ways of an ancestry without a loop, nearest first: a best-first search over pairs of chains that climb
// in step (Hart, Nilsson, Raphael, "A formal basis for the heuristic determination of minimum cost paths", 1968).
// Two chains that have not met are a state; what is left to climb at least is known exactly, since the shortest pair
// of chains to a common ancestor never meets earlier. So every state that is looked at is on a way to be listed.
//
// Holds: ways of equal length stand by the ids of their persons. Where more than kMostTies are equally long, those
//        found first are ordered.
class KinWays {
public:
    KinWays(const Ancestry& ancestry, WaySort sort) : ancestry_(ancestry), sort_(sort) {}

    // The ways up to a length, at least `limit` of them if that many exist; or the nearest alone.
    std::vector<KinWay> list(std::size_t limit, bool nearestAlone);

private:
    static constexpr std::int32_t kNone = -1;

    // One of the two chains goes up by one link, and on to where it can go several ways or meet the other.
    struct State {
        Spot a;
        Spot b;
        std::int32_t before;  // in states_; kNone for the first
        Spot via;             // where the link led to; kNowhere where both went up from their couple
        std::int32_t climbed;
        Bond bond;
        bool movesA;
    };
    struct Open {
        std::int32_t length;  // of the shortest way through the state
        std::int32_t state;
    };

    struct Advance {
        Spot spot;
        std::int32_t climbed;
        Bond bond;
    };

    Advance advance(Spot spot) const;
    bool isOnlyLink(Spot spot, SpotLink& link) const;
    void open(const State& state);
    void expand(std::int32_t index);
    void climb(std::int32_t index, bool movesA);
    void leaveCouple(std::int32_t index);
    bool isWay(const State& state) const;
    std::int32_t leastLeft(Spot a, Spot b, bool needsOther);
    void pushDistances(Spot from, std::vector<std::int32_t>& distances, std::vector<std::int32_t>& withOther,
                       std::int64_t& pending, std::int32_t best);
    KinWay wayOf(std::int32_t index) const;
    std::vector<Place> chainOf(std::int32_t index, bool ofA) const;

    const Ancestry& ancestry_;
    WaySort sort_;
    std::vector<State> states_;
    std::vector<Open> heap_;
    std::unordered_map<std::uint64_t, std::int32_t> leastLeft_;
    // Shortest climbs from the two ends to a spot: at all, and with a link that is not by blood.
    std::vector<std::int32_t> distances_[4];
    std::vector<Spot> touched_;
    std::uint64_t work_ = 0;
};

// Lists ways where somebody is their own ancestor and there is no order: partial ways, nearest first, each looked
// at for persons that come twice. Gives up after a fixed number of partial ways, so more may exist than are listed.
std::vector<KinWay> listWaysInLoops(const KinLinks& links, Place a, Place b, WaySort sort, std::size_t limit,
                                    bool nearestAlone);

// Whether the way at its top is half: the two children on the way are of blood and have another known parent each.
bool isHalfWay(const KinLinks& links, const KinWay& way);

// Nearest first, then by ids, at most limit.
void sortWays(const KinGraph& graph, std::vector<KinWay>& ways, std::size_t limit);

}  // namespace olvane::kin
