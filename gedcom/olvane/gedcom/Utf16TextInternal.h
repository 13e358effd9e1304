// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace olvane::gedcom {

enum class Utf16Order : unsigned char { none, littleEndian, bigEndian };

// UTF-16 by its mark, or by the zero byte that every ASCII character has, on one side.
Utf16Order utf16OrderOf(std::string_view bytes);

// The text in UTF-8 without its mark. Half a unit at the end is left out. A lone surrogate stays, in the three bytes
// that UTF-8 would give it.
std::string utf8FromUtf16(std::string_view bytes, Utf16Order order);

inline bool isHighSurrogate(unsigned unit) {
    return unit >= 0xD800 && unit <= 0xDBFF;
}
inline bool isLowSurrogate(unsigned unit) {
    return unit >= 0xDC00 && unit <= 0xDFFF;
}

inline char32_t joinSurrogates(unsigned high, unsigned low) {
    return 0x10000 + (static_cast<char32_t>(high - 0xD800) << 10) + (low - 0xDC00);
}

}  // namespace olvane::gedcom
