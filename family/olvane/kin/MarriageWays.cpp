// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/MarriageWaysInternal.h>

#include <algorithm>
#include <limits>

#include <olvane/kin/KinSumsInternal.h>

namespace olvane::kin {

namespace {

std::uint64_t boundedSum(std::uint64_t one, std::uint64_t other) {
    return std::min(one + other, kLargestCount + 1);
}

}  // namespace

Readings readingsAfter(Readings readings, std::uint8_t kinds) {
    unsigned next = 0;
    if ((kinds & kIsParent) != 0) {
        if ((readings & kReadsUp) != 0) next |= kReadsUp;
        if ((readings & kReadsUpAndDown) != 0) next |= kReadsMore;
    }
    if ((kinds & kIsChild) != 0 && (readings & (kReadsUp | kReadsUpAndDown)) != 0) next |= kReadsUpAndDown;
    if ((kinds & kIsPartner) != 0 || (readings & kReadsMore) != 0) next |= kReadsMore;
    return static_cast<Readings>(next);
}

MarriageSearch::MarriageSearch(const KinLinks& links) : links_(links) {
    const std::size_t persons = at(links.graph().personCount());
    for (Side* side : {&sideA_, &sideB_}) {
        side->stamps.assign(persons, 0);
        side->distances.assign(persons, 0);
    }
    layerStamps_.assign(persons, 0);
    layerOf_.assign(persons, 0);
    indexInLayer_.assign(persons, 0);
}

MarriageWays MarriageSearch::find(Place a, Place b, std::size_t limit, MarriageReach reach) {
    MarriageWays result;
    if (a == b) return result;
    const std::int32_t total = meet(a, b);
    if (total < 0) return result;
    layShortest(total);
    result.count = countShortest();
    if (result.count == std::uint64_t{0} && reach == MarriageReach::shortestWay) return result;
    if (result.count == std::uint64_t{0}) return findFartherMarriageWays(links_, a, b, limit);
    listShortest(limit, result.ways);
    return result;
}

std::int32_t MarriageSearch::distance(const Side& side, Place person) const {
    return side.stamps[at(person)] == stamp_ ? side.distances[at(person)] : -1;
}

void MarriageSearch::start(Side& side, Place person) {
    side.rings.assign(1, {person});
    side.stamps[at(person)] = stamp_;
    side.distances[at(person)] = 0;
}

// One ring farther. Answers the shortest way between the sides over somebody new, or a very large number.
std::int32_t MarriageSearch::widen(Side& side, const Side& other) {
    std::int32_t shortest = std::numeric_limits<std::int32_t>::max();
    std::vector<Place> ring;
    const std::int32_t reach = side.radius() + 1;
    for (const Place person : side.rings.back()) {
        for (const Neighbor& neighbor : links_.neighbors(person)) {
            if (side.stamps[at(neighbor.person)] == stamp_) continue;
            side.stamps[at(neighbor.person)] = stamp_;
            side.distances[at(neighbor.person)] = reach;
            ring.push_back(neighbor.person);
            const std::int32_t rest = distance(other, neighbor.person);
            if (rest >= 0) shortest = std::min(shortest, reach + rest);
        }
    }
    side.rings.push_back(std::move(ring));
    return shortest;
}

// Answers how far the two are apart; -1 where nothing joins them.
std::int32_t MarriageSearch::meet(Place a, Place b) {
    if (++stamp_ == 0) {
        for (auto* stamps : {&sideA_.stamps, &sideB_.stamps, &layerStamps_})
            std::fill(stamps->begin(), stamps->end(), 0);
        stamp_ = 1;
    }
    start(sideA_, a);
    start(sideB_, b);
    std::int32_t shortest = std::numeric_limits<std::int32_t>::max();
    while (sideA_.radius() + sideB_.radius() < shortest) {
        const bool widensA = sideA_.rings.back().size() <= sideB_.rings.back().size();
        Side& side = widensA ? sideA_ : sideB_;
        if (side.rings.back().empty()) return -1;
        shortest = std::min(shortest, widen(side, widensA ? sideB_ : sideA_));
    }
    return shortest;
}

// The neighbors of one layer at that distance from a side's beginning, each once.
void MarriageSearch::addLayer(const std::vector<Place>& beside, const Side& side, std::int32_t distanceFrom,
                              std::vector<Place>& layer) {
    for (const Place person : beside) {
        for (const Neighbor& neighbor : links_.neighbors(person)) {
            if (layerStamps_[at(neighbor.person)] == stamp_) continue;
            if (distance(side, neighbor.person) != distanceFrom) continue;
            layerStamps_[at(neighbor.person)] = stamp_;
            layer.push_back(neighbor.person);
        }
    }
}

// From the ring of A that all ways pass, back to A and on to B.
void MarriageSearch::layShortest(std::int32_t total) {
    layers_.assign(at(total) + 1, {});
    const std::int32_t middle = std::min(sideA_.radius(), total);
    for (const Place person : sideA_.rings[at(middle)]) {
        if (distance(sideB_, person) != total - middle) continue;
        layerStamps_[at(person)] = stamp_;
        layers_[at(middle)].push_back(person);
    }
    for (std::int32_t i = middle; i > 0; --i) addLayer(layers_[at(i)], sideA_, i - 1, layers_[at(i - 1)]);
    for (std::int32_t i = middle; i < total; ++i)
        addLayer(layers_[at(i)], sideB_, total - i - 1, layers_[at(i + 1)]);
    for (std::size_t layer = 0; layer < layers_.size(); ++layer) {
        for (std::size_t i = 0; i < layers_[layer].size(); ++i) {
            layerOf_[at(layers_[layer][i])] = static_cast<std::int32_t>(layer);
            indexInLayer_[at(layers_[layer][i])] = static_cast<std::int32_t>(i);
        }
    }
}

// Backwards from B: how many ways on there are from each person for each set of readings of the way so far.
std::optional<std::uint64_t> MarriageSearch::countShortest() {
    hopes_.assign(layers_.size(), {});
    std::vector<CountsByReadings> next(1);
    for (std::size_t readings = 0; readings < kReadingSets; ++readings)
        next[0][readings] = (readings & kReadsMore) != 0 ? 1 : 0;
    for (std::size_t layer = layers_.size(); layer-- > 0;) {
        std::vector<CountsByReadings> counts(layers_[layer].size(), CountsByReadings{});
        if (layer + 1 == layers_.size()) counts = next;
        for (std::size_t i = 0; i < layers_[layer].size() && layer + 1 < layers_.size(); ++i) {
            for (const Neighbor& neighbor : links_.neighbors(layers_[layer][i])) {
                if (layerStamps_[at(neighbor.person)] != stamp_) continue;
                if (at(layerOf_[at(neighbor.person)]) != layer + 1) continue;
                const CountsByReadings& onward = next[at(indexInLayer_[at(neighbor.person)])];
                for (Readings readings = 1; readings < kReadingSets; ++readings) {
                    std::uint64_t& count = counts[i][readings];
                    count = boundedSum(count, onward[readingsAfter(readings, neighbor.kinds)]);
                }
            }
        }
        for (const CountsByReadings& each : counts) {
            unsigned hopes = 0;
            for (std::size_t readings = 0; readings < kReadingSets; ++readings)
                hopes |= (each[readings] > 0 ? 1U : 0U) << readings;
            hopes_[layer].push_back(static_cast<std::uint8_t>(hopes));
        }
        next = std::move(counts);
    }
    const std::uint64_t count = next[0][kReadsUp];
    return count > kLargestCount ? std::nullopt : std::optional(count);
}

// In the order of ids, since neighbors stand so. A way is begun only where it can be finished.
void MarriageSearch::listShortest(std::size_t limit, std::vector<MarriageWay>& ways) const {
    struct Level {
        Place person;
        Readings readings;
        std::size_t nextNeighbor;
    };
    std::vector<Level> path{{layers_[0][0], kReadsUp, 0}};
    while (!path.empty() && ways.size() < limit) {
        Level& level = path.back();
        const std::size_t layer = path.size();
        const auto neighbors = links_.neighbors(level.person);
        if (layer == layers_.size() || level.nextNeighbor == neighbors.size()) {
            if (layer == layers_.size()) {
                ways.emplace_back();
                for (const Level& each : path) ways.back().persons.push_back(each.person);
            }
            path.pop_back();
            continue;
        }
        const Neighbor& neighbor = neighbors[level.nextNeighbor++];
        const Readings readings = readingsAfter(level.readings, neighbor.kinds);
        if (layerStamps_[at(neighbor.person)] != stamp_) continue;
        if (at(layerOf_[at(neighbor.person)]) != layer) continue;
        const unsigned hopes = hopes_[layer][at(indexInLayer_[at(neighbor.person)])];
        if ((hopes >> readings & 1U) != 0) path.push_back({neighbor.person, readings, 0});
    }
}

}  // namespace olvane::kin
