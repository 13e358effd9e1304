// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Measures text with the advances of one common font, so that a picture can be laid out where no font is at
// hand. Characters outside the table are taken at what their class usually needs: East Asian ones one em, emoji a
// little more, marks that sit on other letters nothing, the rest a generous part of an em.

#include <olvane/picture/TextMetrics.h>

#include <algorithm>

#include <olvane/picture/FontAdvancesInternal.h>
#include <olvane/picture/TextPropertiesInternal.h>

namespace olvane::picture {

namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";
constexpr std::string_view kEllipsis = "\xE2\x80\xA6";
// In hundredths of an em.
constexpr int kUnknownAdvance = 80;
constexpr int kWideAdvance = 100;
constexpr int kEmojiAdvance = 128;

// U+2028 and U+2029 end a line as well.
bool isSpaceControl(std::int32_t c) {
    return c == '\t' || c == '\n' || c == '\r' || c == 0x2028 || c == 0x2029;
}

bool isPrintableAscii(char c) {
    return c >= ' ' && c <= '~';
}

bool xmlAllows(std::int32_t c) {
    const bool isControl = (c >= 0 && c < 0x20) || (c >= 0x7F && c < 0xA0);
    return c >= 0 && !isControl && c != 0xFFFE && c != 0xFFFF;
}

int advanceInTable(std::int32_t c, bool bold) {
    for (const FontBlock& block : fontBlocks()) {
        if (c >= block.first && c <= block.last) return (bold ? block.bold : block.regular)[c - block.first];
    }
    return 0;
}

int advanceOf(std::int32_t c, bool bold) {
    const WidthClass width = textPropertiesOf(c).width;
    if (width == WidthClass::none) return 0;
    const int known = advanceInTable(c, bold);
    if (known > 0) return known;
    if (width == WidthClass::emoji) return kEmojiAdvance;
    return width == WidthClass::wide ? kWideAdvance : kUnknownAdvance;
}

}  // namespace

std::string cleanText(std::string_view text) {
    // Most texts are, and need no look at their characters.
    if (std::all_of(text.begin(), text.end(), isPrintableAscii)) return std::string(text);
    std::string clean;
    clean.reserve(text.size());
    forEachCharacter(text, [&clean](std::int32_t character, std::string_view bytes) {
        if (isSpaceControl(character)) {
            clean += ' ';
        } else {
            clean += xmlAllows(character) ? bytes : kReplacement;
        }
    });
    return clean;
}

std::string cutText(std::string_view text) {
    if (text.size() <= kMostTextBytes) return std::string(text);
    std::size_t whole = kMostTextBytes;  // bytes of whole characters
    while (whole > 0 && (static_cast<unsigned char>(text[whole]) & 0xC0u) == 0x80u) --whole;
    // The last cluster of the beginning may go on behind it.
    const std::string_view beginning = text.substr(0, whole);
    std::size_t end = 0;
    for (std::size_t next = 0; next < beginning.size(); next += firstCluster(beginning.substr(next)).size())
        end = next;
    if (end == 0) end = whole;
    return std::string(text.substr(0, end)) + std::string(kEllipsis);
}

double textWidth(std::string_view text, const Font& font) {
    long long hundredths = 0;
    forEachCharacter(text, [&](std::int32_t character, std::string_view) {
        hundredths += advanceOf(character, font.bold);
    });
    return static_cast<double>(hundredths) * font.size / 100.0;
}

bool runsRightToLeft(std::string_view text) {
    while (!text.empty()) {
        std::size_t size = 1;
        const DirectionClass direction = textPropertiesOf(decodeFront(text, size)).direction;
        if (direction != DirectionClass::neutral) return direction == DirectionClass::rightToLeft;
        text.remove_prefix(size);
    }
    return false;
}

}  // namespace olvane::picture
