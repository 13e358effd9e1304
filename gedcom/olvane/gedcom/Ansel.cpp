// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// ANSEL (ANSI/NISO Z39.47) with the additions of the GEDCOM standard: bytes above 0xA0 are letters and signs,
// those from 0xE0 on are marks, which come before their letter, where Unicode has them behind it.

#include <olvane/gedcom/AnselInternal.h>

#include <cstddef>

#include <olvane/gedcom/LineScannerInternal.h>
#include <olvane/gedcom/UnicodeTextInternal.h>

namespace olvane::gedcom {
namespace {

constexpr char32_t kReplacement = 0xFFFD;
constexpr unsigned char kFirstSign = 0xA1;
constexpr unsigned char kFirstMark = 0xE0;

// Bytes 0xA1 to 0xCF; 0 for a byte that is none.
constexpr char16_t kSigns[] = {
    0x0141, 0x00D8, 0x0110, 0x00DE, 0x00C6, 0x0152, 0x02B9, 0x00B7, 0x266D, 0x00AE, 0x00B1,
    0x01A0,  // A1 - AC
    0x01AF, 0x02BC, 0x0000, 0x02BB, 0x0142, 0x00F8, 0x0111, 0x00FE, 0x00E6, 0x0153, 0x02BA,
    0x0131,  // AD - B8
    0x00A3, 0x00F0, 0x0000, 0x01A1, 0x01B0, 0x25A1, 0x25A0, 0x00B0, 0x2113, 0x2117, 0x00A9,
    0x266F,                                                                                  // B9 - C4
    0x00BF, 0x00A1, 0x00DF, 0x20AC, 0x0000, 0x0000, 0x0000, 0x0000, 0x0065, 0x006F, 0x00DF,  // C5 - CF
};

// Bytes 0xE0 to 0xFF; 0 for a byte that is none.
constexpr char16_t kMarks[] = {
    0x0309, 0x0300, 0x0301, 0x0302, 0x0303, 0x0304, 0x0306, 0x0307,  // E0 - E7
    0x0308, 0x030C, 0x030A, 0xFE20, 0xFE21, 0x0315, 0x030B, 0x0310,  // E8 - EF
    0x0327, 0x0328, 0x0323, 0x0324, 0x0325, 0x0333, 0x0332, 0x0326,  // F0 - F7
    0x031C, 0x032E, 0xFE22, 0xFE23, 0x0338, 0x0000, 0x0313, 0x0000,  // F8 - FF
};

char32_t markOf(unsigned char byte) {
    return byte < kFirstMark ? 0 : kMarks[byte - kFirstMark];
}

char32_t signOf(unsigned char byte) {
    if (byte < 0x80) return byte;
    const std::size_t place = static_cast<std::size_t>(byte) - kFirstSign;
    return byte < kFirstSign || place >= std::size(kSigns) ? 0 : kSigns[place];
}

bool isLetter(unsigned char byte) {
    return (byte >= 'A' && byte <= 'Z') || (byte >= 'a' && byte <= 'z');
}

// Whether Unicode has the letter with the mark as one character: a sign that the pair was meant.
bool composes(char32_t mark, unsigned char letter) {
    std::string pair(1, static_cast<char>(letter));
    appendUtf8(pair, mark);
    return composed(pair).size() < pair.size();
}

// The one that the text goes on with, in a CONC line if need be.
unsigned char characterBehind(std::string_view rest) {
    const std::size_t conc = findConcText(rest);
    if (conc != std::string_view::npos) rest.remove_prefix(conc);
    return static_cast<unsigned char>(rest.empty() ? ' ' : rest.front());
}

}  // namespace

AnselCensus takeAnselCensus(std::string_view bytes) {
    AnselCensus census;
    for (std::size_t at = 0; at < bytes.size(); ++at) {
        const auto byte = static_cast<unsigned char>(bytes[at]);
        if (byte < 0x80) continue;
        const unsigned char next = characterBehind(bytes.substr(at + 1));
        const char32_t mark = markOf(byte);
        const bool fits =
            mark != 0 ? markOf(next) != 0 || (isLetter(next) && composes(mark, next)) : signOf(byte) != 0;
        ++(fits ? census.fitting : census.doubtful);
    }
    return census;
}

std::string decodeAnsel(std::string_view bytes, std::size_t& faults) {
    std::string text;
    std::string marks;
    text.reserve(bytes.size() + bytes.size() / 4);
    for (const char c : bytes) {
        const auto byte = static_cast<unsigned char>(c);
        if (const char32_t mark = markOf(byte); mark != 0) {
            appendUtf8(marks, mark);
            continue;
        }
        const char32_t sign = byte == 0 ? U' ' : signOf(byte);
        if (sign == 0) ++faults;
        appendUtf8(text, sign == 0 ? kReplacement : sign);
        text += marks;
        marks.clear();
    }
    return text + marks;
}

}  // namespace olvane::gedcom
