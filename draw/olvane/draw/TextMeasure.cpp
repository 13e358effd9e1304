// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Measures text with the advances of one common font, so that a picture can be laid out where no font is at
// hand. Characters outside the table are taken at what their class usually needs: East Asian ones one em,
// marks that sit on other letters nothing, the rest a generous part of an em.

#include <olvane/draw/TextMeasureInternal.h>

#include <utf8proc.h>

#include <olvane/draw/FontAdvancesInternal.h>

namespace olvane::draw {

namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";
constexpr int kUnknownAdvance = 80;  // hundredths of an em
constexpr int kWideAdvance = 100;

// Reads the character at the front; -1 for a byte that begins none. size is at least 1.
std::int32_t decodeFront(std::string_view text, std::size_t& size) {
    utf8proc_int32_t character = -1;
    const auto bytes = reinterpret_cast<const utf8proc_uint8_t*>(text.data());
    const auto length = utf8proc_iterate(bytes, static_cast<utf8proc_ssize_t>(text.size()), &character);
    size = length > 0 ? static_cast<std::size_t>(length) : 1;
    return length > 0 ? character : -1;
}

bool isSpaceControl(std::int32_t c) {
    return c == '\t' || c == '\n' || c == '\r';
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

bool drawsNothing(std::int32_t c) {
    switch (utf8proc_category(c)) {
        case UTF8PROC_CATEGORY_MN:
        case UTF8PROC_CATEGORY_ME:
        case UTF8PROC_CATEGORY_CF:
            return true;
        default:
            return false;
    }
}

int advanceOf(std::int32_t c, bool bold) {
    if (drawsNothing(c)) return 0;
    const int known = advanceInTable(c, bold);
    if (known > 0) return known;
    return utf8proc_charwidth(c) > 1 ? kWideAdvance : kUnknownAdvance;
}

template <class Visit>
void forEachCharacter(std::string_view text, Visit visit) {
    while (!text.empty()) {
        std::size_t size = 1;
        const std::int32_t character = decodeFront(text, size);
        visit(character, text.substr(0, size));
        text.remove_prefix(size);
    }
}

bool isRightToLeft(std::int32_t c) {
    const auto direction = utf8proc_get_property(c)->bidi_class;
    return direction == UTF8PROC_BIDI_CLASS_R || direction == UTF8PROC_BIDI_CLASS_AL;
}

bool isLeftToRight(std::int32_t c) {
    return utf8proc_get_property(c)->bidi_class == UTF8PROC_BIDI_CLASS_L;
}

}  // namespace

std::string cleanText(std::string_view text) {
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

double textWidth(std::string_view text, const Font& font) {
    int hundredths = 0;
    forEachCharacter(text, [&](std::int32_t character, std::string_view) {
        hundredths += advanceOf(character, font.bold);
    });
    return hundredths * font.size / 100.0;
}

std::vector<std::string_view> readersCharacters(std::string_view text) {
    std::vector<std::string_view> characters;
    std::int32_t previous = -1;
    std::int32_t state = 0;
    std::size_t start = 0;
    std::size_t position = 0;
    forEachCharacter(text, [&](std::int32_t character, std::string_view bytes) {
        if (position > 0 && utf8proc_grapheme_break_stateful(previous, character, &state)) {
            characters.push_back(text.substr(start, position - start));
            start = position;
        }
        previous = character;
        position += bytes.size();
    });
    if (position > start) characters.push_back(text.substr(start));
    return characters;
}

bool runsRightToLeft(std::string_view text) {
    bool decided = false;
    bool rightToLeft = false;
    forEachCharacter(text, [&](std::int32_t character, std::string_view) {
        if (decided) return;
        rightToLeft = isRightToLeft(character);
        decided = rightToLeft || isLeftToRight(character);
    });
    return rightToLeft;
}

}  // namespace olvane::draw
