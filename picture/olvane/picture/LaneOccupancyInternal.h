// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <optional>
#include <vector>

#include <olvane/picture/Picture.h>

namespace olvane::picture {

// Which places of which lanes are taken, and by which family: an open hash table of cells a few points wide.
// A lane is a channel or a row, in which a place is an x, or a gap of a row, in which it is a y.
class LaneOccupancy {
public:
    // Wanted and least distance between places of different families, in points.
    static constexpr double kWanted = 4;
    static constexpr double kLeast = 2.5;

    explicit LaneOccupancy(std::size_t expected);

    void take(std::size_t lane, double place, Index family);

    // The place in [lo, hi] nearest to the wanted one that is free in all lanes and lies on an eighth of a
    // point, save the wanted one itself; nothing where the range is empty or full. Places of the same family
    // are no obstacle. distance is what is kept from others if it can be; kLeast is kept always. Looks no further than kFarthest from the wanted place, put into the range.
    std::optional<double> freePlace(std::initializer_list<std::size_t> lanes, double lo, double hi,
                                    double wanted, Index family, double distance = kWanted) const;

private:
    struct Entry {
        std::uint64_t key = kEmpty;
        double place = 0;
        Index family = kNone;
    };
    static constexpr std::uint64_t kEmpty = ~std::uint64_t{0};
    static constexpr double kFarthest = 160;

    static std::int64_t cellOf(double place) {
        return static_cast<std::int64_t>(std::floor(place / kWanted));
    }
    static std::uint64_t keyOf(std::size_t lane, std::int64_t cell) {
        return (static_cast<std::uint64_t>(lane) << 36) ^ (static_cast<std::uint64_t>(cell) & 0xFFFFFFFFFU);
    }
    std::size_t slotOf(std::uint64_t key) const {
        return static_cast<std::size_t>((key * 0x9E3779B97F4A7C15U) >> 20) & (entries_.size() - 1);
    }
    bool isFree(std::size_t lane, double place, double distance, Index family) const;
    void grow();

    std::vector<Entry> entries_;
    std::size_t count_ = 0;
};

}  // namespace olvane::picture
