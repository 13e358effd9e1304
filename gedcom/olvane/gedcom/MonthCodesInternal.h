// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace olvane::gedcom {

// Months as GEDCOM abbreviates them, packed so that one comparison finds one.

constexpr std::size_t kLongestMonthCode = 4;

// Up to four letters as a number, in capitals; 0 for more.
constexpr std::uint32_t code(std::string_view letters) {
    if (letters.size() > kLongestMonthCode) return 0;
    std::uint32_t packed = 0;
    for (const char c : letters) {
        packed = packed << 8 | static_cast<unsigned char>(c >= 'a' && c <= 'z' ? c - 'a' + 'A' : c);
    }
    return packed;
}

constexpr std::array kMonths = {code("JAN"), code("FEB"), code("MAR"), code("APR"), code("MAY"), code("JUN"),
                                code("JUL"), code("AUG"), code("SEP"), code("OCT"), code("NOV"), code("DEC")};

// Place of the name in the list from 1; 0 if it is not there.
template <typename Name, std::size_t N>
int placeIn(const std::array<Name, N>& names, Name name) {
    const auto found = std::find(names.begin(), names.end(), name);
    return found == names.end() ? 0 : static_cast<int>(found - names.begin()) + 1;
}

}  // namespace olvane::gedcom
