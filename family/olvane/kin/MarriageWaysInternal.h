// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <vector>

#include <olvane/kin/KinLinksInternal.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::kin {

struct MarriageWays {
    std::vector<MarriageWay> ways;
    std::optional<std::uint64_t> count = 0;
};

// How a way so far can be read, as a set: only upwards, up and then down, or with a partner or a second climb.
using Readings = std::uint8_t;
constexpr Readings kReadsUp = 1;
constexpr Readings kReadsUpAndDown = 2;
constexpr Readings kReadsMore = 4;

// The readings of a way that goes on to a neighbor of these kinds.
Readings readingsAfter(Readings readings, std::uint8_t kinds);

// The steps that a way consists of: partner links, and climbs with the descents behind them.
std::vector<KinStep> stepsOf(const KinLinks& links, const std::vector<Place>& persons);

// The ways from one side, as said below.
MarriageWays findFartherMarriageWays(const KinLinks& links, Place a, Place b, std::size_t limit);

// How far a search goes: to ways over marriages, or only to the shortest of all ways, where none may be
// over a marriage.
enum class MarriageReach : std::uint8_t { anyWay, shortestWay };

// Finds the shortest ways over partners, parents and children that are more than up to an ancestor and down again.
//
// Mostly the two meet midway in a search from both sides (Pohl, "Bi-directional search", 1971), and every shortest
// way is found. Where all shortest ways are ways up and down, longer ones are searched from one side, on which nobody
// can be left out: no two persons with one between them are linked themselves, so that a brother is not also the
// son of the father's wife. That search is given up after a fixed number of steps.
//
// Threads: one call at a time.
class MarriageSearch {
public:
    explicit MarriageSearch(const KinLinks& links);

    MarriageWays find(Place a, Place b, std::size_t limit, MarriageReach reach = MarriageReach::anyWay);

private:
    static constexpr std::size_t kReadingSets = 8;

    // Everybody within a distance of one of the two.
    struct Side {
        std::vector<std::uint32_t> stamps;
        std::vector<std::int32_t> distances;
        std::vector<std::vector<Place>> rings;  // by distance

        std::int32_t radius() const { return static_cast<std::int32_t>(rings.size()) - 1; }
    };
    using CountsByReadings = std::array<std::uint64_t, kReadingSets>;

    // -1 where the side has not reached the person.
    std::int32_t distance(const Side& side, Place person) const;
    void start(Side& side, Place person);
    std::int32_t widen(Side& side, const Side& other);
    std::int32_t meet(Place a, Place b);
    void layShortest(std::int32_t total);
    void addLayer(const std::vector<Place>& beside, const Side& side, std::int32_t distance,
                  std::vector<Place>& layer);
    std::optional<std::uint64_t> countShortest();
    void listShortest(std::size_t limit, std::vector<MarriageWay>& ways) const;

    const KinLinks& links_;
    std::uint32_t stamp_ = 0;
    Side sideA_;
    Side sideB_;
    // Persons on shortest ways by their distance from A, and which readings of a way to one of them can become more
    // than up and down: a bit for each set of readings.
    std::vector<std::vector<Place>> layers_;
    std::vector<std::vector<std::uint8_t>> hopes_;
    // By person: valid where the stamp is that of this search.
    std::vector<std::uint32_t> layerStamps_;
    std::vector<std::int32_t> layerOf_;
    std::vector<std::int32_t> indexInLayer_;
};

}  // namespace olvane::kin
