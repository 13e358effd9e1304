// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Unicode as the reader needs it, over utf8proc: what is a character, which normal form, what counts as equal
// when a user searches. Most text is ASCII, and every function has a short way through for it.

#include <olvane/gedcom/UnicodeTextInternal.h>

#include <cstdlib>
#include <cstring>
#include <memory>

#include <utf8proc.h>

#include <olvane/gedcom/LineScannerInternal.h>

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

std::size_t asciiRun(std::string_view text) {
    constexpr std::uint64_t kHighBits = 0x8080808080808080U;
    std::size_t run = 0;
    for (std::uint64_t word = 0; run + sizeof word <= text.size(); run += sizeof word) {
        std::memcpy(&word, text.data() + run, sizeof word);
        if ((word & kHighBits) != 0) break;
    }
    while (run < text.size() && static_cast<unsigned char>(text[run]) < 0x80) ++run;
    return run;
}

bool isContinuation(char c) {
    return (static_cast<unsigned char>(c) & 0xC0) == 0x80;
}

// Bytes that a character beginning with this byte has; 0 for a byte that begins none.
std::size_t announcedLength(char first) {
    const auto byte = static_cast<unsigned char>(first);
    if (byte >= 0xC2 && byte <= 0xDF) return 2;
    if (byte >= 0xE0 && byte <= 0xEF) return 3;
    if (byte >= 0xF0 && byte <= 0xF4) return 4;
    return byte < 0x80 ? 1 : 0;
}

// Length over a character that begins at the front and goes on in a CONC line; 0 if that is not the case.
std::size_t cutCharacterLength(std::string_view rest) {
    const std::size_t announced = announcedLength(rest.front());
    std::size_t head = 1;
    while (head < announced && head < rest.size() && isContinuation(rest[head])) ++head;
    if (announced < 2 || head >= announced) return 0;
    const std::size_t gap = findConcText(rest.substr(head));
    if (gap == std::string_view::npos) return 0;
    const std::string joined =
        std::string(rest.substr(0, head)) + std::string(rest.substr(head + gap, announced - head));
    return utf8CharacterLength(joined) == announced ? announced + gap : 0;
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

std::size_t utf8CharacterLength(std::string_view text) {
    if (text.empty()) return 0;
    utf8proc_int32_t codePoint = 0;
    const utf8proc_ssize_t length =
        utf8proc_iterate(asBytes(text), static_cast<utf8proc_ssize_t>(text.size()), &codePoint);
    return length > 0 ? static_cast<std::size_t>(length) : 0;
}

bool isAscii(std::string_view text) {
    return asciiRun(text) == text.size();
}

bool isUtf8(std::string_view text) {
    for (;;) {
        text.remove_prefix(asciiRun(text));
        if (text.empty()) return true;
        const std::size_t length = utf8CharacterLength(text);
        if (length == 0) return false;
        text.remove_prefix(length);
    }
}

Utf8Census takeUtf8Census(std::string_view bytes) {
    Utf8Census census;
    for (;;) {
        bytes.remove_prefix(asciiRun(bytes));
        if (bytes.empty()) return census;
        std::size_t length = utf8CharacterLength(bytes);
        if (length == 0) length = cutCharacterLength(bytes);
        if (length == 0) {
            ++census.faults;
            length = 1;
        } else {
            ++census.characters;
        }
        bytes.remove_prefix(length);
    }
}

void appendUtf8(std::string& text, char32_t codePoint) {
    utf8proc_uint8_t bytes[4];
    const utf8proc_ssize_t length = utf8proc_encode_char(static_cast<utf8proc_int32_t>(codePoint), bytes);
    text.append(reinterpret_cast<const char*>(bytes), static_cast<std::size_t>(length));
}

std::string lossyUtf8(std::string_view text) {
    std::string clean;
    clean.reserve(text.size());
    while (!text.empty()) {
        const std::size_t length = utf8CharacterLength(text);
        clean += length == 0 ? std::string_view("?") : text.substr(0, length);
        text.remove_prefix(length == 0 ? 1 : length);
    }
    return clean;
}

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
