// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// UTF-8 as the reader needs it: what is a character, and how one is written. Most text is ASCII, and every
// function has a short way through for it.

#include <olvane/gedcom/UnicodeTextInternal.h>

#include <cstring>
#include <iterator>

#include <boost/locale/utf.hpp>

#include <olvane/gedcom/LineScannerInternal.h>

namespace olvane::gedcom {
namespace {

using Utf8 = boost::locale::utf::utf_traits<char>;

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

// Length of half a surrogate pair written as if it were a character, which some programs do; 0 if none is in front. It is no
// character, and can be met in no other encoding by chance.
std::size_t surrogateLength(std::string_view rest) {
    const bool isOne = rest.size() >= 3 && rest[0] == '\xED' && static_cast<unsigned char>(rest[1]) >= 0xA0 &&
                       isContinuation(rest[1]) && isContinuation(rest[2]);
    return isOne ? 3 : 0;
}

}  // namespace

std::size_t utf8CharacterLength(std::string_view text) {
    if (text.empty()) return 0;
    const char* end = text.data();
    const auto codePoint = Utf8::decode(end, text.data() + text.size());
    if (codePoint == boost::locale::utf::illegal || codePoint == boost::locale::utf::incomplete) return 0;
    return static_cast<std::size_t>(end - text.data());
}

char32_t firstCharacter(std::string_view text) {
    const char* at = text.data();
    const auto codePoint = Utf8::decode(at, text.data() + text.size());
    const bool none = codePoint == boost::locale::utf::illegal || codePoint == boost::locale::utf::incomplete;
    return none ? 0 : static_cast<char32_t>(codePoint);
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
        if (length == 0) length = surrogateLength(bytes);
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
    Utf8::encode(codePoint, std::back_inserter(text));
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

}  // namespace olvane::gedcom
