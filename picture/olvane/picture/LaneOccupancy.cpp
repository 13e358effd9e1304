// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/LaneOccupancyInternal.h>

#include <algorithm>
#include <bit>
#include <utility>

namespace olvane::picture {

LaneOccupancy::LaneOccupancy(std::size_t expected)
    : entries_(std::bit_ceil(std::max<std::size_t>(64, expected * 2))) {}

void LaneOccupancy::take(std::size_t lane, double place, Index family) {
    if ((count_ + 1) * 4 > entries_.size() * 3) grow();
    const std::uint64_t key = keyOf(lane, cellOf(place));
    std::size_t slot = slotOf(key);
    while (entries_[slot].key != kEmpty) slot = (slot + 1) & (entries_.size() - 1);
    entries_[slot] = {key, place, family};
    ++count_;
}

void LaneOccupancy::grow() {
    std::vector<Entry> old(entries_.size() * 2);
    old.swap(entries_);
    for (const Entry& entry : old) {
        if (entry.key == kEmpty) continue;
        std::size_t slot = slotOf(entry.key);
        while (entries_[slot].key != kEmpty) slot = (slot + 1) & (entries_.size() - 1);
        entries_[slot] = entry;
    }
}

bool LaneOccupancy::isFree(std::size_t lane, double place, double distance, Index family) const {
    const std::int64_t cell = cellOf(place);
    for (std::int64_t c = cell - 1; c <= cell + 1; ++c) {
        const std::uint64_t key = keyOf(lane, c);
        for (std::size_t slot = slotOf(key); entries_[slot].key != kEmpty;
             slot = (slot + 1) & (entries_.size() - 1)) {
            const Entry& entry = entries_[slot];
            if (entry.key == key && entry.family != family && std::abs(entry.place - place) < distance) {
                return false;
            }
        }
    }
    return true;
}

std::optional<double> LaneOccupancy::freePlace(std::initializer_list<std::size_t> lanes, double lo, double hi,
                                               double wanted, Index family, double distance) const {
    if (!(lo <= hi)) return std::nullopt;
    wanted = std::clamp(wanted, lo, hi);
    const auto fits = [&](double place, double kept) {
        return place >= lo && place <= hi && std::all_of(lanes.begin(), lanes.end(), [&](std::size_t lane) {
                   return isFree(lane, place, kept, family);
               });
    };
    const double start = std::round(wanted * 8) / 8;
    for (const double kept : {distance, kLeast}) {
        if (fits(wanted, kept)) return wanted;
        for (double step = 0.5; step <= kFarthest; step += 0.5) {
            if (start + step > hi && start - step < lo) break;
            if (fits(start - step, kept)) return start - step;
            if (fits(start + step, kept)) return start + step;
        }
    }
    return std::nullopt;
}

}  // namespace olvane::picture
