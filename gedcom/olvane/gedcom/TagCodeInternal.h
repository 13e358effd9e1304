// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string_view>

namespace olvane::gedcom {

// A tag as a number, in capitals; longer tags than any known one are 0.
constexpr std::uint64_t tagCode(std::string_view tag) {
    if (tag.size() > 8) return 0;
    std::uint64_t code = 0;
    for (const char c : tag) {
        const char capital = c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
        code = code << 8 | static_cast<unsigned char>(capital);
    }
    return code;
}

}  // namespace olvane::gedcom
