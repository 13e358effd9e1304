// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Values in Unicode. A value may have been joined of several lines, so characters that a line end had cut are whole here.

#include <cstddef>

#include <olvane/gedcom/AnselInternal.h>
#include <olvane/gedcom/TextEncodingInternal.h>
#include <olvane/gedcom/UnicodeTextInternal.h>
#include <olvane/gedcom/Utf16TextInternal.h>

namespace olvane::gedcom {
namespace {

constexpr char32_t kReplacement = 0xFFFD;
constexpr std::size_t kSurrogateBytes = 3;

unsigned byteAt(std::string_view bytes, std::size_t at) {
    return static_cast<unsigned char>(bytes[at]);
}

// The surrogate that stands at this place in the three bytes that UTF-8 would give it; 0 if there is none.
unsigned surrogateAt(std::string_view raw, std::size_t at) {
    if (raw.size() < at + kSurrogateBytes || byteAt(raw, at) != 0xED) return 0;
    const unsigned unit = 0xD000 | (byteAt(raw, at + 1) & 0x3F) << 6 | (byteAt(raw, at + 2) & 0x3F);
    const bool wellFormed = (byteAt(raw, at + 1) & 0xC0) == 0x80 && (byteAt(raw, at + 2) & 0xC0) == 0x80;
    return wellFormed && (isHighSurrogate(unit) || isLowSurrogate(unit)) ? unit : 0;
}

// Takes a pair of lone surrogates that a CONC line had parted; 0 if there is none at the front.
std::size_t takeSurrogatePair(std::string_view raw, std::string& text) {
    const unsigned high = surrogateAt(raw, 0);
    const unsigned low = surrogateAt(raw, kSurrogateBytes);
    if (!isHighSurrogate(high) || !isLowSurrogate(low)) return 0;
    appendUtf8(text, joinSurrogates(high, low));
    return 2 * kSurrogateBytes;
}

// Whether nothing but the beginning of a character is left: the program that wrote the value cut it there.
bool isCutCharacter(std::string_view raw) {
    const unsigned first = byteAt(raw, 0);
    if (first < 0xC2 || first > 0xF4 || raw.size() > 3) return false;
    for (std::size_t at = 1; at < raw.size(); ++at) {
        if ((byteAt(raw, at) & 0xC0) != 0x80) return false;
    }
    return true;
}

// Bytes at the front that are no character, read as well as can be. Returns how many.
std::size_t repairUtf8(std::string_view raw, std::string& text) {
    if (const std::size_t pair = takeSurrogatePair(raw, text); pair != 0) return pair;
    if (surrogateAt(raw, 0) != 0) {
        appendUtf8(text, kReplacement);
        return kSurrogateBytes;
    }
    if (isCutCharacter(raw)) {
        appendUtf8(text, kReplacement);
        return raw.size();
    }
    const char32_t windows = kWindows1252[byteAt(raw, 0) - 0x80];
    appendUtf8(text, windows < 0xA0 ? kReplacement : windows);
    return 1;
}

std::string decodeUtf8(std::string_view raw, std::size_t& faults) {
    std::string text;
    text.reserve(raw.size());
    while (!raw.empty()) {
        std::size_t length = utf8CharacterLength(raw);
        if (length != 0) {
            text += raw.substr(0, length);
        } else {
            length = repairUtf8(raw, text);
            if (length != 2 * kSurrogateBytes) ++faults;
        }
        raw.remove_prefix(length);
    }
    return text;
}

std::string decodeCodePage(std::string_view raw, const CodePage& page, std::size_t& faults) {
    std::string text;
    text.reserve(raw.size() + raw.size() / 4);
    for (const char c : raw) {
        const auto byte = static_cast<unsigned char>(c);
        const char32_t character = byte < 0x80 ? byte : page[byte - 0x80];
        const bool known = byte < 0x80 || character != 0;
        if (!known) ++faults;
        appendUtf8(text, known ? character : kReplacement);
    }
    return text;
}

}  // namespace

std::string decodeText(std::string_view raw, const TextForm& form, std::size_t& faults) {
    switch (form.coding) {
        case ValueCoding::ansel:
            return composed(decodeAnsel(raw, faults));
        case ValueCoding::page: {
            std::string text = decodeCodePage(raw, form.page, faults);
            return form.encoding->writesMarksApart ? composed(text) : text;
        }
        case ValueCoding::utf8:
            break;
    }
    return decodeUtf8(raw, faults);
}

}  // namespace olvane::gedcom
