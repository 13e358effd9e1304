// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A file's text must not steer the terminal of the person who reads about it.

#include <cli/TerminalText.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <utility>

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

constexpr std::size_t kPieceBytes = 64 * 1024;

// How much of the text ends before a character of which only a part is there.
std::size_t endOfWhole(std::string_view text) {
    const std::size_t size = text.size();
    const auto byte = [text](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    if (size >= 1 && byte(size - 1) >= 0xC0U) return size - 1;
    if (size >= 2 && byte(size - 2) >= 0xE0U && byte(size - 2) < 0xF0U) return size - 2;
    return size;
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

TextPieces::TextPieces(int descriptor, picture::TextSink write)
    : write_(std::move(write)), isTerminal_(::isatty(descriptor) != 0) {}

void TextPieces::add(std::string_view piece) {
    while (!piece.empty()) {
        const std::size_t some = std::min(piece.size(), kPieceBytes);
        pending_ += piece.substr(0, some);
        piece.remove_prefix(some);
        if (pending_.size() < kPieceBytes) continue;
        const std::size_t end = endOfWhole(pending_);
        pass(std::string_view(pending_).substr(0, end));
        pending_.erase(0, end);
    }
}

void TextPieces::finish() {
    if (!pending_.empty()) pass(pending_);
    pending_.clear();
}

void TextPieces::pass(std::string_view text) {
    isTerminal_ ? write_(visibleText(text)) : write_(text);
}

}  // namespace olvane::cli
