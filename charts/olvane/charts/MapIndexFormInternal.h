// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

#include <olvane/charts/MapIndex.h>

namespace olvane::charts {

// The form of a map as bytes, as its writer and its reader know it: a header, and behind it one section for every list.

constexpr std::string_view kMagic = "OLVMAP\r\n";
constexpr std::uint32_t kVersion = 1;
constexpr std::size_t kChecked = 20;  // where the words that the checksum is of begin
constexpr std::size_t kHeader = 28;
constexpr std::int32_t kRoles = 8;  // y and role share a number: 8 y + role

enum class Section : std::uint32_t {
    box = 1,
    rows,
    places,
    numbers,
    births,
    deaths,
    flags,
    names,
    strings,
    unions,
    states,
    starts,
    children,
    bands,
    bars,
    uprights,
    marks,
    levels,
    labels
};
constexpr std::size_t kSections = 19;

inline std::uint32_t bitsOf(std::int32_t value) {
    return static_cast<std::uint32_t>(value);
}

inline std::int32_t signedOf(std::uint32_t bits) {
    return static_cast<std::int32_t>(bits);
}

inline std::uint32_t wordAt(std::string_view bytes, std::size_t place) {
    std::uint32_t word = 0;
    for (std::size_t i = 0; i < 4; ++i) {
        word |= std::uint32_t{static_cast<std::uint8_t>(bytes[place + i])} << (8 * i);
    }
    return word;
}

inline std::uint32_t checksumOf(std::string_view bytes) {
    std::uint32_t sum = 2166136261U;
    for (std::size_t place = kChecked; place + 4 <= bytes.size(); place += 4) {
        sum = (sum ^ wordAt(bytes, place)) * 16777619U;
    }
    return sum;
}

// Where the persons of each row begin, and behind the last one how many there are.
inline std::vector<std::uint32_t> rowStarts(const MapIndex& map, std::size_t persons) {
    std::vector<std::uint32_t> starts;
    for (const MapIndex::Row& row : map.rows) starts.push_back(row.firstPerson);
    starts.push_back(static_cast<std::uint32_t>(persons));
    return starts;
}

}  // namespace olvane::charts
