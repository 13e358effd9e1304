// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// ANSEL (ANSI/NISO Z39.47) with the additions of the GEDCOM standard: bytes above 0xA0 are letters and signs,
// those from 0xE0 on are marks, which come before their letter, where Unicode has them behind it.

#include <olvane/gedcom/AnselInternal.h>

#include <algorithm>
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

// Marks in a row at the front, up to one more than a letter bears.
std::size_t markRun(std::string_view rest) {
    constexpr std::size_t kMoreThanALetterBears = 3;
    std::size_t run = 0;
    while (run < rest.size() && run < kMoreThanALetterBears &&
           markOf(static_cast<unsigned char>(rest[run])) != 0) {
        ++run;
    }
    return run;
}

// A mark over two letters, which is written as its halves before each: "\xEBi\xECa".
bool beginsLigature(std::string_view rest) {
    if (rest.size() < 4) return false;
    const auto first = static_cast<unsigned char>(rest[0]);
    const auto second = static_cast<unsigned char>(rest[2]);
    const bool halves = (first == 0xEB && second == 0xEC) || (first == 0xFA && second == 0xFB);
    return halves && isLetter(static_cast<unsigned char>(rest[1])) &&
           isLetter(static_cast<unsigned char>(rest[3]));
}

bool isAnselLetter(unsigned char byte) {
    return isLetter(byte) || (byte >= kFirstSign && byte <= 0xBD && signOf(byte) != 0);
}

// Judges the marks at the front of rest. Outside of words, and where the letter before bears a mark too, as in tables of
// all characters, a mark may stand before any letter.
void judgeMarks(std::string_view rest, std::size_t run, bool isInsideWord, AnselCensus& census) {
    const unsigned char next = characterBehind(rest.substr(run));
    if (run >= 3 || !isAnselLetter(next)) {
        census.impossible += run;
        return;
    }
    bool fits = false;
    for (std::size_t at = 0; at < run && isLetter(next); ++at) {
        fits = fits || composes(markOf(static_cast<unsigned char>(rest[at])), next);
    }
    if (fits) {
        census.fitting += run;
    } else if (isInsideWord) {
        census.doubtful += run;
    }
}

}  // namespace

AnselCensus takeAnselCensus(std::string_view bytes) {
    constexpr std::size_t kLigatureBytes = 3;
    AnselCensus census;
    bool isInsideWord = false;  // the character before is a letter without a mark
    bool isMarked = false;      // the character in hand bears a mark
    for (std::size_t at = 0; at < bytes.size();) {
        const auto byte = static_cast<unsigned char>(bytes[at]);
        const std::string_view rest = bytes.substr(at);
        const std::size_t run = byte < kFirstMark ? 0 : markRun(rest);
        const bool isLigature = run == 1 && beginsLigature(rest);
        if (isLigature) {
            census.fitting += 2;
        } else if (run > 0) {
            judgeMarks(rest, run, isInsideWord, census);
        } else if (byte >= 0x80) {
            ++(signOf(byte) != 0 ? census.fitting : census.impossible);
        }
        isInsideWord = run == 0 && isLetter(byte) && !isMarked;
        isMarked = run > 0;
        at += isLigature ? kLigatureBytes : std::max<std::size_t>(run, 1);
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
