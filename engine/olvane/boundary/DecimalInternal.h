// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <charconv>
#include <cstddef>
#include <cstdint>
#include <cstring>

namespace olvane {

constexpr std::size_t kLongestDecimal = 11;  // in bytes: -2147483648

// "00" to "99", one behind the other.
constexpr std::array<char, 200> kDigitPairs = [] {
    std::array<char, 200> pairs{};
    for (std::size_t i = 0; i < 100; ++i) {
        pairs[2 * i] = static_cast<char>('0' + i / 10);
        pairs[2 * i + 1] = static_cast<char>('0' + i % 10);
    }
    return pairs;
}();

inline char* writeDigitPair(char* place, std::uint32_t pair) {
    std::memcpy(place, &kDigitPairs[2 * pair], 2);
    return place + 2;
}

inline char* writeOneOrTwoDigits(char* place, std::uint32_t size) {
    if (size >= 10) return writeDigitPair(place, size);
    *place = static_cast<char>('0' + size);
    return place + 1;
}

// Writes the plain decimal form of the value at place, without a closing zero, and returns where it ends.
// Needs room for kLongestDecimal bytes.
inline char* writeDecimal(char* place, int value) {
    std::uint32_t size = static_cast<std::uint32_t>(value);
    if (value < 0) {
        *place++ = '-';
        size = 0u - size;
    }
    // Half of a result's text is numbers, and nearly all ids and coordinates are this short.
    if (size < 100) return writeOneOrTwoDigits(place, size);
    if (size < 10000) return writeDigitPair(writeOneOrTwoDigits(place, size / 100), size % 100);
    return std::to_chars(place, place + kLongestDecimal - 1, size).ptr;
}

}  // namespace olvane
