// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/KinWaysInternal.h>

#include <algorithm>
#include <limits>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::kin {

namespace {

constexpr std::int32_t kFar = std::numeric_limits<std::int32_t>::max() / 4;
constexpr std::size_t kMostTies = 4096;
constexpr std::size_t kMostStates = 200'000;
// Steps of estimating what is left to climb: about 30 milliseconds.
constexpr std::uint64_t kMostWork = 20'000'000;

}  // namespace

std::vector<KinWay> KinWays::list(std::size_t limit, bool nearestAlone) {
    std::vector<KinWay> ways;
    if (!ancestry_.hasCommon() || ancestry_.spotOfA() == ancestry_.spotOfB()) return ways;
    if (sort_ == WaySort::otherBonds && !ancestry_.hasOtherBonds()) return ways;
    for (auto& distances : distances_) distances.assign(at(ancestry_.size()), kFar);
    const auto later = [](const Open& one, const Open& other) {
        return one.length != other.length ? one.length > other.length : one.state > other.state;
    };
    const Advance a = advance(ancestry_.spotOfA());
    const Advance b = advance(ancestry_.spotOfB());
    open({a.spot, ancestry_.spotOfB(), kNone, ancestry_.spotOfA(), a.climbed, a.bond, true});
    if (heap_.empty()) return ways;
    heap_.clear();
    open({a.spot, b.spot, 0, ancestry_.spotOfB(), a.climbed + b.climbed, std::max(a.bond, b.bond), false});
    std::int32_t lastLength = kFar;
    while (!heap_.empty() && states_.size() < kMostStates && work_ < kMostWork) {
        std::pop_heap(heap_.begin(), heap_.end(), later);
        const Open best = heap_.back();
        heap_.pop_back();
        if (best.length > lastLength || ways.size() >= limit + kMostTies) break;
        if (isWay(states_[at(best.state)]) && best.length == states_[at(best.state)].climbed) {
            ways.push_back(wayOf(best.state));
            if (nearestAlone || ways.size() >= limit) lastLength = best.length;
        }
        const std::size_t known = heap_.size();
        expand(best.state);
        for (std::size_t end = known + 1; end <= heap_.size(); ++end)
            std::push_heap(heap_.begin(), heap_.begin() + static_cast<std::ptrdiff_t>(end), later);
    }
    sortWays(ancestry_.links().graph(), ways, limit);
    return ways;
}

// The one link that leads on from a spot where the other chain cannot be.
bool KinWays::isOnlyLink(Spot spot, SpotLink& link) const {
    if (ancestry_.isCommon(spot)) return false;
    std::size_t count = 0;
    for (const SpotLink& each : ancestry_.up(spot)) {
        if (!ancestry_.isRelevant(each.to)) continue;
        ++count;
        link = each;
    }
    return count == 1;
}

// Up as long as there is nothing to choose, so that a line of any length is one step.
KinWays::Advance KinWays::advance(Spot spot) const {
    Advance advance{spot, 0, Bond::blood};
    SpotLink link{};
    while (isOnlyLink(advance.spot, link)) {
        advance.spot = link.to;
        advance.climbed += link.length;
        advance.bond = std::max(advance.bond, link.bond);
    }
    return advance;
}

bool KinWays::isWay(const State& state) const {
    return state.a == state.b && (sort_ == WaySort::blood || state.bond != Bond::blood);
}

// Where a couple has been met, the way there is listed by the state itself; farther ones leave it by both partners.
void KinWays::open(const State& state) {
    const bool needsOther = sort_ == WaySort::otherBonds && state.bond == Bond::blood;
    const std::int32_t left = isWay(state) ? 0 : leastLeft(state.a, state.b, needsOther);
    if (left >= kFar) return;
    states_.push_back(state);
    heap_.push_back({state.climbed + left, static_cast<std::int32_t>(states_.size() - 1)});
}

void KinWays::expand(std::int32_t index) {
    const State& state = states_[at(index)];
    if (state.a == state.b) {
        if (ancestry_.isCouple(state.a)) leaveCouple(index);
        return;
    }
    // Where the other chain cannot come, or else at the lower end, which nobody can climb to later.
    const bool aIsFree = !ancestry_.isCommon(state.a);
    const bool bIsFree = !ancestry_.isCommon(state.b);
    climb(index, aIsFree || (!bIsFree && state.a < state.b));
}

void KinWays::climb(std::int32_t index, bool movesA) {
    const State state = states_[at(index)];
    for (const SpotLink& link : ancestry_.up(movesA ? state.a : state.b)) {
        if (!ancestry_.isRelevant(link.to)) continue;
        const Advance next = advance(link.to);
        State moved = state;
        (movesA ? moved.a : moved.b) = next.spot;
        moved.before = index;
        moved.via = link.to;
        moved.climbed += link.length + next.climbed;
        moved.bond = std::max({state.bond, link.bond, next.bond});
        moved.movesA = movesA;
        open(moved);
    }
}

// One chain over each partner, and the other way round.
void KinWays::leaveCouple(std::int32_t index) {
    const State state = states_[at(index)];
    const auto partners = ancestry_.up(state.a);
    for (std::size_t slot = 0; slot < 2; ++slot) {
        State moved = state;
        moved.a = partners[slot].to;
        moved.b = partners[1 - slot].to;
        moved.before = index;
        moved.via = kNowhere;
        open(moved);
    }
}

// Climbs from both ends in order, until nothing of one of the two is left that could be better.
std::int32_t KinWays::leastLeft(Spot a, Spot b, bool needsOther) {
    const std::uint64_t key = (static_cast<std::uint64_t>(a) << 33U) | (static_cast<std::uint64_t>(b) << 1U) |
                              (needsOther ? 1U : 0U);
    const auto found = leastLeft_.find(key);
    if (found != leastLeft_.end()) return found->second;
    auto& [fromA, fromAOther, fromB, fromBOther] = distances_;
    std::int64_t pendingA = 1;
    std::int64_t pendingB = 1;
    fromA[at(a)] = fromB[at(b)] = 0;
    touched_.assign({a, b});
    std::int32_t best = kFar;
    for (Spot spot = std::min(a, b); spot < ancestry_.size() && pendingA > 0 && pendingB > 0; ++spot) {
        ++work_;
        const std::size_t i = at(spot);
        best = std::min(best, needsOther ? std::min(fromAOther[i] + fromB[i], fromA[i] + fromBOther[i])
                                         : fromA[i] + fromB[i]);
        if (fromA[i] < kFar) {
            --pendingA;
            pushDistances(spot, fromA, fromAOther, pendingA, best);
        }
        if (fromB[i] < kFar) {
            --pendingB;
            pushDistances(spot, fromB, fromBOther, pendingB, best);
        }
    }
    for (const Spot spot : touched_) {
        for (auto& distances : distances_) distances[at(spot)] = kFar;
    }
    best = std::min(best, kFar);
    leastLeft_.emplace(key, best);
    return best;
}

void KinWays::pushDistances(Spot from, std::vector<std::int32_t>& distances,
                            std::vector<std::int32_t>& withOther, std::int64_t& pending, std::int32_t best) {
    if (distances[at(from)] >= best) return;
    for (const SpotLink& link : ancestry_.up(from)) {
        if (!ancestry_.isRelevant(link.to)) continue;
        ++work_;
        if (distances[at(link.to)] == kFar) {
            ++pending;
            touched_.push_back(link.to);
        }
        const std::int32_t direct = distances[at(from)] + link.length;
        const std::int32_t other =
            link.bond == Bond::blood ? std::min(withOther[at(from)] + link.length, kFar) : direct;
        distances[at(link.to)] = std::min(distances[at(link.to)], direct);
        withOther[at(link.to)] = std::min(withOther[at(link.to)], other);
    }
}

// Persons from A or B up to the top, which is left out where it is a couple.
std::vector<Place> KinWays::chainOf(std::int32_t index, bool ofA) const {
    std::vector<std::int32_t> moves;
    for (std::int32_t i = index; i != kNone; i = states_[at(i)].before) {
        if (states_[at(i)].movesA == ofA || states_[at(i)].via == kNowhere) moves.push_back(i);
    }
    std::vector<Place> chain;
    const auto add = [this, &chain](Spot spot) {
        if (!ancestry_.isCouple(spot)) chain.push_back(ancestry_.node(spot));
    };
    for (auto i = moves.rbegin(); i != moves.rend(); ++i) {
        const State& state = states_[at(*i)];
        const Spot end = ofA ? state.a : state.b;
        Spot spot = state.via == kNowhere ? end : state.via;
        add(spot);
        SpotLink link{};
        while (spot != end && isOnlyLink(spot, link)) {
            spot = link.to;
            add(spot);
        }
    }
    return chain;
}

KinWay KinWays::wayOf(std::int32_t index) const {
    const State& state = states_[at(index)];
    const std::vector<Place> down = chainOf(index, false);
    KinWay way;
    way.persons = chainOf(index, true);
    way.bond = state.bond;
    if (ancestry_.isCouple(state.a)) {
        const auto& partners = ancestry_.links().partnersOf(ancestry_.node(state.a));
        way.ancestors.assign(partners.begin(), partners.end());
        way.up = static_cast<int>(way.persons.size());
        way.down = static_cast<int>(down.size());
        way.persons.push_back(partners[0]);
        way.persons.insert(way.persons.end(), down.rbegin(), down.rend());
    } else {
        way.ancestors = {ancestry_.node(state.a)};
        way.up = static_cast<int>(way.persons.size()) - 1;
        way.down = static_cast<int>(down.size()) - 1;
        way.persons.insert(way.persons.end(), down.rbegin() + 1, down.rend());
    }
    way.half = isHalfWay(ancestry_.links(), way);
    return way;
}

bool isHalfWay(const KinLinks& links, const KinWay& way) {
    if (way.ancestors.size() != 1 || way.up == 0 || way.down == 0) return false;
    const auto top = static_cast<std::size_t>(way.up);
    const auto hasAnother = [&links, &way](Place child) {
        const auto up = links.upByBlood(child);
        if (!links.hasTwoParents(child)) return false;
        const auto& parents = links.partnersOf(up.front().to);
        return parents[0] == way.ancestors[0] || parents[1] == way.ancestors[0];
    };
    return hasAnother(way.persons[top - 1]) && hasAnother(way.persons[top + 1]);
}

void sortWays(const KinGraph& graph, std::vector<KinWay>& ways, std::size_t limit) {
    const auto byId = [&graph](Place one, Place other) { return graph.id(one) < graph.id(other); };
    mergeSort(ways.begin(), ways.end(), [&byId](const KinWay& one, const KinWay& other) {
        if (one.length() != other.length()) return one.length() < other.length();
        // In loops one line of persons can be read in several ways.
        if (one.persons == other.persons) return one.up < other.up;
        return std::lexicographical_compare(one.persons.begin(), one.persons.end(), other.persons.begin(),
                                            other.persons.end(), byId);
    });
    if (ways.size() > limit) ways.erase(ways.begin() + static_cast<std::ptrdiff_t>(limit), ways.end());
}

}  // namespace olvane::kin
