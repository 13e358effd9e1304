// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A file's text must not steer the terminal of whoever reads about it.

#include <cli/TerminalText.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstdio>

#include <unistd.h>

namespace olvane::cli {

namespace {

// The character at the start of the text, where it has two or three bytes and is well-formed; 0 for all others, none
// of which is unsafe.
std::uint32_t shortCharacter(std::string_view text) {
    const auto byte = [text](std::size_t i) {
        return static_cast<std::uint32_t>(static_cast<unsigned char>(text[i]));
    };
    const auto follows = [&](std::size_t i) { return i < text.size() && (byte(i) & 0xC0U) == 0x80U; };
    if ((byte(0) & 0xE0U) == 0xC0U && follows(1)) return ((byte(0) & 0x1FU) << 6U) | (byte(1) & 0x3FU);
    if ((byte(0) & 0xF0U) == 0xE0U && follows(1) && follows(2)) {
        return ((byte(0) & 0x0FU) << 12U) | ((byte(1) & 0x3FU) << 6U) | (byte(2) & 0x3FU);
    }
    return byte(0) < 0x80U ? byte(0) : 0;
}

bool isUnsafe(std::uint32_t character) {
    if (character == 0 || character == '\t' || character == '\n') return false;
    if (character < 0x20 || (character >= 0x7F && character <= 0x9F)) return true;
    return (character >= 0x2028 && character <= 0x202E) || (character >= 0x2066 && character <= 0x2069);
}

std::size_t lengthOf(std::uint32_t character) {
    if (character < 0x80) return 1;
    return character < 0x800 ? 2 : 3;
}

}  // namespace

std::string visibleText(std::string_view text) {
    std::string visible;
    while (!text.empty()) {
        const std::uint32_t character = shortCharacter(text);
        if (isUnsafe(character)) {
            std::array<char, 8> code{};
            std::snprintf(code.data(), code.size(), "\\u%04X", character);
            visible += code.data();
            text.remove_prefix(lengthOf(character));
        } else {
            visible += text.front();
            text.remove_prefix(1);
        }
    }
    return visible;
}

std::string textFor(int descriptor, std::string_view text) {
    return ::isatty(descriptor) != 0 ? visibleText(text) : std::string(text);
}

}  // namespace olvane::cli
