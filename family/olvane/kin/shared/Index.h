// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

namespace olvane::kin {

// A place in a list, known not to be negative here, as an index.
constexpr std::size_t at(std::int32_t place) {
    return static_cast<std::size_t>(place);
}

// The list of one place among many that lie behind one another in values: start holds where the list of each place begins,
// and at its end the size of values. Valid while values keeps its elements.
template <class Value>
std::span<const Value> slice(const std::vector<Value>& values, const std::vector<std::uint32_t>& start,
                             std::int32_t place) {
    const std::uint32_t first = start[at(place)];
    return {values.data() + first, start[at(place) + 1] - first};
}

}  // namespace olvane::kin
