// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Between host values and the engine's text: numbers both ways, and dates on the way in.

#include <olvane/boundary/HostText.h>

#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include <olvane/boundary/DecimalInternal.h>

std::string intToString(int value) {
    char digits[olvane::kLongestDecimal];
    return std::string(digits, olvane::writeDecimal(digits, value));
}

int stringToInt(std::string text) {
    const long long wide = std::strtoll(text.c_str(), nullptr, 10);
    return static_cast<int>(static_cast<std::uint32_t>(static_cast<unsigned long long>(wide)));
}

namespace {

// How a character goes on behind its first byte. The bounds of the second byte rule out overlong forms, surrogates, and
// what lies beyond the last code point.
struct Utf8Form {
    std::size_t length;  // in bytes
    unsigned char least;
    unsigned char most;
};

Utf8Form formOfLead(unsigned char lead) {
    if (lead < 0x80) return {1, 0, 0};
    if (lead >= 0xC2 && lead <= 0xDF) return {2, 0x80, 0xBF};
    if (lead == 0xE0) return {3, 0xA0, 0xBF};
    if (lead == 0xED) return {3, 0x80, 0x9F};
    if (lead >= 0xE1 && lead <= 0xEF) return {3, 0x80, 0xBF};
    if (lead == 0xF0) return {4, 0x90, 0xBF};
    if (lead >= 0xF1 && lead <= 0xF3) return {4, 0x80, 0xBF};
    if (lead == 0xF4) return {4, 0x80, 0x8F};
    return {1, 0, 0};
}

// 1 where no well-formed character begins the text, which is not empty.
std::size_t lengthOfFirstCharacter(std::string_view text) {
    const auto byteAt = [text](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    const Utf8Form form = formOfLead(byteAt(0));
    if (form.length > text.size()) return 1;
    for (std::size_t i = 1; i < form.length; ++i) {
        const unsigned char least = i == 1 ? form.least : 0x80;
        const unsigned char most = i == 1 ? form.most : 0xBF;
        if (byteAt(i) < least || byteAt(i) > most) return 1;
    }
    return form.length;
}

}  // namespace

std::string stringToString(std::string text) {
    return std::string(firstCharacterOf(text));
}

std::string_view firstCharacterOf(std::string_view text) {
    const bool isNothing = text.empty() || text.front() == '\0';
    return text.substr(0, isNothing ? 0 : lengthOfFirstCharacter(text));
}
