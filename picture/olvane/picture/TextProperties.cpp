// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Unpacks the table once, into the first character of each run, and looks characters up by halving.

#include <olvane/picture/TextPropertiesInternal.h>

#include <algorithm>
#include <array>
#include <vector>

namespace olvane::picture {

namespace {

constexpr std::int32_t kReplacement = 0xFFFD;
constexpr std::int32_t kFirstSyllable =
    0xAC00;  // of Hangul, in blocks of one syllable for each final consonant
constexpr std::int32_t kLastSyllable = 0xD7A3;
constexpr std::int32_t kFinals = 28;

std::vector<std::int32_t> unpackedRuns() {
    std::vector<std::int32_t> firsts;
    firsts.reserve(kTextRunCount);
    const std::uint8_t* next = kTextRunLengths;
    std::int32_t first = 0;
    for (std::size_t run = 0; run < kTextRunCount; ++run) {
        firsts.push_back(first);
        std::int32_t length = 0;
        for (int shift = 0;; shift += 7) {
            length |= static_cast<std::int32_t>(*next & 0x7Fu) << shift;
            if ((*next++ & 0x80u) == 0) break;
        }
        first += length;
    }
    return firsts;
}

TextProperties propertiesInTable(std::int32_t character) {
    static const std::vector<std::int32_t> kFirsts = unpackedRuns();
    const auto run = std::upper_bound(kFirsts.begin(), kFirsts.end(), character) - kFirsts.begin() - 1;
    const TextRecord& record = kTextRecords[kTextRunRecords[run]];
    TextProperties properties{static_cast<GraphemeClass>(record.grapheme),
                              static_cast<LineClass>(record.line), static_cast<WidthClass>(record.width),
                              static_cast<DirectionClass>(record.direction)};
    if (character >= kFirstSyllable && character <= kLastSyllable &&
        (character - kFirstSyllable) % kFinals != 0) {
        properties.grapheme = GraphemeClass::lvt;
        properties.line = LineClass::h3;
    }
    return properties;
}

// Most characters of names and dates, which need no search then.
constexpr std::int32_t kAsciiCount = 128;
typedef std::array<TextProperties, kAsciiCount> AsciiProperties;

const AsciiProperties& asciiProperties() {
    static const AsciiProperties kProperties = [] {
        AsciiProperties properties;
        for (std::int32_t c = 0; c < kAsciiCount; ++c)
            properties[static_cast<std::size_t>(c)] = propertiesInTable(c);
        return properties;
    }();
    return kProperties;
}

bool isContinuation(char c) {
    return (static_cast<unsigned char>(c) & 0xC0u) == 0x80u;
}

}  // namespace

TextProperties textPropertiesOf(std::int32_t character) {
    if (character < 0 || character > 0x10FFFF) character = kReplacement;
    return character < kAsciiCount ? asciiProperties()[static_cast<std::size_t>(character)]
                                   : propertiesInTable(character);
}

std::int32_t decodeFront(std::string_view text, std::size_t& size) {
    size = 1;
    const auto lead = static_cast<unsigned char>(text[0]);
    if (lead < 0x80) return lead;
    const std::size_t bytes = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : 2;
    if (lead < 0xC2 || lead > 0xF4 || text.size() < bytes) return -1;
    std::int32_t character = lead & (0x7F >> bytes);
    for (std::size_t i = 1; i < bytes; ++i) {
        if (!isContinuation(text[i])) return -1;
        character = (character << 6) | (static_cast<unsigned char>(text[i]) & 0x3F);
    }
    const bool isOverlong = (bytes == 3 && character < 0x800) || (bytes == 4 && character < 0x10000);
    const bool isSurrogate = character >= 0xD800 && character <= 0xDFFF;
    if (isOverlong || isSurrogate || character > 0x10FFFF) return -1;
    size = bytes;
    return character;
}

}  // namespace olvane::picture
