// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Normal forms and what counts as equal when a user searches, over utf8proc. Most text is ASCII, and every
// function has a short way through for it.

#include <olvane/gedcom/UnicodeTextInternal.h>

#include <cstdlib>
#include <memory>

#include <utf8proc.h>

namespace olvane::gedcom {
namespace {

struct FreeText {
    void operator()(utf8proc_uint8_t* text) const { std::free(text); }
};

const utf8proc_uint8_t* asBytes(std::string_view text) {
    return reinterpret_cast<const utf8proc_uint8_t*>(text.data());
}

// Empty if the library refuses the text.
std::string mapped(std::string_view text, int options) {
    utf8proc_uint8_t* raw = nullptr;
    const utf8proc_ssize_t length = utf8proc_map(asBytes(text), static_cast<utf8proc_ssize_t>(text.size()),
                                                 &raw, static_cast<utf8proc_option_t>(options));
    const std::unique_ptr<utf8proc_uint8_t, FreeText> owned(raw);
    if (length < 0) return {};
    return std::string(reinterpret_cast<const char*>(owned.get()), static_cast<std::size_t>(length));
}

// Letters with strokes and the like, which no normal form takes apart. In small letters.
const char* plainLetters(utf8proc_int32_t codePoint) {
    switch (codePoint) {
        case 0x00E6:
            return "ae";
        case 0x00F0:
        case 0x0111:
            return "d";
        case 0x00F8:
            return "o";
        case 0x00FE:
            return "th";
        case 0x0127:
            return "h";
        case 0x0131:
            return "i";
        case 0x0142:
            return "l";
        case 0x0153:
            return "oe";
        default:
            return nullptr;
    }
}

std::string withPlainLetters(const std::string& text) {
    std::string plain;
    plain.reserve(text.size());
    for (std::string_view rest = text; !rest.empty();) {
        utf8proc_int32_t codePoint = 0;
        const auto length = static_cast<std::size_t>(
            utf8proc_iterate(asBytes(rest), static_cast<utf8proc_ssize_t>(rest.size()), &codePoint));
        const char* letters = plainLetters(codePoint);
        plain += letters != nullptr ? std::string_view(letters) : rest.substr(0, length);
        rest.remove_prefix(length);
    }
    return plain;
}

std::string asciiLowered(std::string_view text) {
    std::string lowered(text);
    for (char& c : lowered) {
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    }
    return lowered;
}

}  // namespace

std::string composed(const std::string& text) {
    if (isAscii(text)) return text;
    std::string result = mapped(text, UTF8PROC_STABLE | UTF8PROC_COMPOSE);
    return result.empty() ? text : result;
}

std::string foldedForSearch(std::string_view text) {
    if (isAscii(text)) return asciiLowered(text);
    const std::string folded = mapped(text, UTF8PROC_STABLE | UTF8PROC_DECOMPOSE | UTF8PROC_COMPAT |
                                                UTF8PROC_CASEFOLD | UTF8PROC_STRIPMARK | UTF8PROC_IGNORE);
    return folded.empty() ? asciiLowered(text) : withPlainLetters(folded);
}

}  // namespace olvane::gedcom
