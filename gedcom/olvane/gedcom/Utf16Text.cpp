// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// UTF-16 as UTF-8, since lines are cut in a superset of ASCII.

#include <olvane/gedcom/Utf16TextInternal.h>

#include <cstddef>

#include <olvane/gedcom/UnicodeTextInternal.h>

namespace olvane::gedcom {
namespace {

unsigned byteAt(std::string_view bytes, std::size_t at) {
    return static_cast<unsigned char>(bytes[at]);
}

// A lone surrogate in the three bytes that UTF-8 would give it.
void appendSurrogate(std::string& text, unsigned unit) {
    text += static_cast<char>(0xE0 | (unit >> 12));
    text += static_cast<char>(0x80 | ((unit >> 6) & 0x3F));
    text += static_cast<char>(0x80 | (unit & 0x3F));
}

}  // namespace

Utf16Order utf16OrderOf(std::string_view bytes) {
    if (bytes.size() < 2) return Utf16Order::none;
    const unsigned first = byteAt(bytes, 0);
    const unsigned second = byteAt(bytes, 1);
    if ((first == 0xFF && second == 0xFE) || (first != 0 && second == 0)) return Utf16Order::littleEndian;
    if ((first == 0xFE && second == 0xFF) || (first == 0 && second != 0)) return Utf16Order::bigEndian;
    return Utf16Order::none;
}

std::string utf8FromUtf16(std::string_view bytes, Utf16Order order) {
    const std::size_t highByte = order == Utf16Order::bigEndian ? 0 : 1;
    const auto unitAt = [&bytes, highByte](std::size_t at) {
        return byteAt(bytes, at + highByte) << 8 | byteAt(bytes, at + 1 - highByte);
    };
    std::string text;
    text.reserve(bytes.size() / 2 + bytes.size() / 16);
    const std::size_t end = bytes.size() & ~std::size_t{1};
    for (std::size_t at = 0; at < end; at += 2) {
        const unsigned unit = unitAt(at);
        if (at == 0 && unit == 0xFEFF) continue;
        if (unit < 0x80) {
            text += static_cast<char>(unit);
        } else if (isHighSurrogate(unit) && at + 2 < end && isLowSurrogate(unitAt(at + 2))) {
            appendUtf8(text, joinSurrogates(unit, unitAt(at + 2)));
            at += 2;
        } else if (isHighSurrogate(unit) || isLowSurrogate(unit)) {
            appendSurrogate(text, unit);
        } else {
            appendUtf8(text, unit);
        }
    }
    return text;
}

}  // namespace olvane::gedcom
