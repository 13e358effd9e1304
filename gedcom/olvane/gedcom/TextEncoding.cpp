// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which encoding a file is in, and its text in Unicode. Headers lie: files that call themselves ANSEL or ANSI
// are often UTF-8, and those that say UTF-8 were often written by a program that only knew its system's code
// page. UTF-8 can hardly be met by chance, so bytes that are UTF-8 are taken as such; ANSEL is told from a
// code page by whether its marks stand before letters that can bear them. The text stays as it is in the file
// until a value is kept, because a character may be cut in two by a CONC line.

#include <olvane/gedcom/TextEncodingInternal.h>

#include <array>
#include <cstddef>
#include <optional>

#include <olvane/gedcom/AnselInternal.h>
#include <olvane/gedcom/CodePagesInternal.h>
#include <olvane/gedcom/LineScannerInternal.h>
#include <olvane/gedcom/UnicodeTextInternal.h>

namespace olvane::gedcom {
namespace {

constexpr char32_t kReplacement = 0xFFFD;
constexpr std::string_view kUtf8Mark = "\xEF\xBB\xBF";

// What a header may call an encoding. utf16 stands for either order.
struct EncodingLabel {
    std::string_view label;
    Encoding encoding;
};

constexpr EncodingLabel kLabels[] = {
    {"UTF-8", Encoding::utf8},
    {"UTF8", Encoding::utf8},
    {"UNICODE", Encoding::utf16Little},
    {"UTF-16", Encoding::utf16Little},
    {"UTF16", Encoding::utf16Little},
    {"UTF-16LE", Encoding::utf16Little},
    {"UTF-16BE", Encoding::utf16Big},
    {"ANSEL", Encoding::ansel},
    {"ASCII", Encoding::ascii},
    {"US-ASCII", Encoding::ascii},
    {"ANSI", Encoding::windows1252},
    {"WINDOWS", Encoding::windows1252},
    {"IBM WINDOWS", Encoding::windows1252},
    {"WINDOWS-1252", Encoding::windows1252},
    {"CP1252", Encoding::windows1252},
    {"ISO-8859-1", Encoding::windows1252},
    {"ISO8859-1", Encoding::windows1252},
    {"LATIN1", Encoding::windows1252},
    {"WINDOWS-1250", Encoding::windows1250},
    {"CP1250", Encoding::windows1250},
    {"WINDOWS-1251", Encoding::windows1251},
    {"CP1251", Encoding::windows1251},
    {"IBMPC", Encoding::ibm437},
    {"IBM", Encoding::ibm437},
    {"IBM-PC", Encoding::ibm437},
    {"IBM DOS", Encoding::ibm850},
    {"MSDOS", Encoding::ibm850},
    {"MS-DOS", Encoding::ibm850},
    {"CP437", Encoding::ibm437},
    {"CP850", Encoding::ibm850},
    {"MACINTOSH", Encoding::macRoman},
    {"MACROMAN", Encoding::macRoman},
};

// Names of a maker's system instead of an encoding; what they mean is a custom, not a rule.
constexpr std::string_view kLooseLabels[] = {"ANSI", "WINDOWS", "IBM WINDOWS", "IBMPC",
                                             "IBM",  "IBM-PC",  "IBM DOS"};

std::string capitals(std::string_view text) {
    std::string upper(text);
    for (char& c : upper) {
        if (c >= 'a' && c <= 'z') c = static_cast<char>(c - 'a' + 'A');
    }
    return upper;
}

std::optional<Encoding> encodingLabelled(const std::string& label) {
    for (const EncodingLabel& known : kLabels) {
        if (known.label == label) return known.encoding;
    }
    return {};
}

bool isLooseLabel(const std::string& label) {
    for (const std::string_view loose : kLooseLabels) {
        if (loose == label) return true;
    }
    return false;
}

bool isUtf16(Encoding encoding) {
    return encoding == Encoding::utf16Little || encoding == Encoding::utf16Big;
}

const CodePage* codePageOf(Encoding encoding) {
    switch (encoding) {
        case Encoding::windows1250:
            return &kWindows1250;
        case Encoding::windows1251:
            return &kWindows1251;
        case Encoding::windows1252:
            return &kWindows1252;
        case Encoding::ibm437:
            return &kIbm437;
        case Encoding::ibm850:
            return &kIbm850;
        case Encoding::macRoman:
            return &kMacRoman;
        default:
            return nullptr;
    }
}

unsigned byteAt(std::string_view bytes, std::size_t at) {
    return static_cast<unsigned char>(bytes[at]);
}

// UTF-16 by its mark, or by the zero byte that every ASCII character has, on one side.
std::optional<Encoding> utf16OrderOf(std::string_view bytes) {
    if (bytes.size() < 2) return {};
    const unsigned first = byteAt(bytes, 0);
    const unsigned second = byteAt(bytes, 1);
    if ((first == 0xFF && second == 0xFE) || (first != 0 && second == 0)) return Encoding::utf16Little;
    if ((first == 0xFE && second == 0xFF) || (first == 0 && second != 0)) return Encoding::utf16Big;
    return {};
}

// A lone surrogate in the three bytes that UTF-8 would give it.
void appendSurrogate(std::string& text, unsigned unit) {
    text += static_cast<char>(0xE0 | (unit >> 12));
    text += static_cast<char>(0x80 | ((unit >> 6) & 0x3F));
    text += static_cast<char>(0x80 | (unit & 0x3F));
}

bool isHighSurrogate(unsigned unit) {
    return unit >= 0xD800 && unit <= 0xDBFF;
}
bool isLowSurrogate(unsigned unit) {
    return unit >= 0xDC00 && unit <= 0xDFFF;
}

char32_t joinSurrogates(unsigned high, unsigned low) {
    return 0x10000 + (static_cast<char32_t>(high - 0xD800) << 10) + (low - 0xDC00);
}

std::string utf8FromUtf16(std::string_view bytes, Encoding order) {
    const std::size_t highByte = order == Encoding::utf16Big ? 0 : 1;
    const auto unitAt = [&bytes, highByte](std::size_t at) {
        return byteAt(bytes, at + highByte) << 8 | byteAt(bytes, at + 1 - highByte);
    };
    std::string text;
    text.reserve(bytes.size() / 2 + bytes.size() / 16);
    const std::size_t end = bytes.size() & ~std::size_t{1};
    for (std::size_t at = 0; at < end; at += 2) {
        const unsigned unit = unitAt(at);
        if (at == 0 && unit == 0xFEFF) continue;
        if (unit < 0x80) {
            text += static_cast<char>(unit);
        } else if (isHighSurrogate(unit) && at + 2 < end && isLowSurrogate(unitAt(at + 2))) {
            appendUtf8(text, joinSurrogates(unit, unitAt(at + 2)));
            at += 2;
        } else if (isHighSurrogate(unit) || isLowSurrogate(unit)) {
            appendSurrogate(text, unit);
        } else {
            appendUtf8(text, unit);
        }
    }
    return text;
}

// Takes the bytes for UTF-16 if they are, and makes them UTF-8.
std::optional<Encoding> turnUtf16(std::string& bytes, DiagnosticList& diagnostics) {
    const auto order = utf16OrderOf(bytes);
    if (!order) return {};
    if (bytes.size() % 2 != 0) {
        diagnostics.add(DiagnosticKind::badCharacter, Severity::error, 0,
                        "half a character at the end of the file", "left out");
    }
    bytes = utf8FromUtf16(bytes, *order);
    return order;
}

bool takeUtf8Mark(std::string& bytes) {
    if (!bytes.starts_with(kUtf8Mark)) return false;
    bytes.erase(0, kUtf8Mark.size());
    return true;
}

// Reads the header record alone; nothing is reported, since all lines are read again.
HeaderClaims readHeaderClaims(std::string_view bytes) {
    DiagnosticList unheard({}, 0);
    LineScanner scanner(bytes, unheard);
    HeaderClaims claims;
    GedcomLine line;
    std::string_view section;
    if (!scanner.next(line) || line.level != 0 || line.tag != "HEAD") return claims;
    while (scanner.next(line) && line.level != 0) {
        if (line.level == 1) section = line.tag;
        if (line.level == 1 && line.tag == "CHAR" && claims.charactersLine == 0) {
            claims.characters = trimmed(line.value);
            claims.charactersLine = line.number;
        }
        if (line.level == 2 && section == "GEDC" && line.tag == "VERS" && claims.version.empty()) {
            claims.version = trimmed(line.value);
        }
    }
    return claims;
}

// What the bytes beyond ASCII allow, for a file that is neither UTF-16 nor marked as UTF-8.
Encoding encodingByBytes(std::string_view bytes, std::optional<Encoding> claimed, const Utf8Census& census) {
    if (census.characters > 0 && census.faults == 0) return Encoding::utf8;
    if (claimed == Encoding::utf8 && census.characters >= census.faults) return Encoding::utf8;
    if (claimed && codePageOf(*claimed) != nullptr) return *claimed;
    if (claimed && *claimed != Encoding::ansel) return Encoding::windows1252;
    const AnselCensus ansel = takeAnselCensus(bytes);
    const bool trusted = claimed ? ansel.fitting > ansel.doubtful : ansel.doubtful == 0;
    return trusted ? Encoding::ansel : Encoding::windows1252;
}

void reportClaims(const HeaderClaims& claims, std::optional<Encoding> claimed, Encoding used,
                  DiagnosticList& diagnostics) {
    if (claims.characters.empty()) return;
    const std::string done = std::string("read as ") + encodingName(used);
    const std::string label = capitals(claims.characters);
    if (!claimed) {
        diagnostics.add(DiagnosticKind::encodingUnknown, Severity::warning, claims.charactersLine,
                        "the header names an encoding that is not known", done, claims.characters);
    } else if (*claimed != used && !(isUtf16(*claimed) && isUtf16(used))) {
        diagnostics.add(DiagnosticKind::encodingMismatch, Severity::warning, claims.charactersLine,
                        "the text is not in the encoding that the header names", done, claims.characters);
    } else if (isLooseLabel(label)) {
        diagnostics.add(DiagnosticKind::encodingUnknown, Severity::note, claims.charactersLine,
                        "the header names a system, not an encoding", done, claims.characters);
    }
}

void reportFaults(const Utf8Census& census, Encoding used, DiagnosticList& diagnostics) {
    if (used != Encoding::utf8 || census.faults == 0) return;
    diagnostics.add(DiagnosticKind::badCharacter, Severity::warning, 0,
                    "the text is UTF-8 but for " + std::to_string(census.faults) + " places",
                    "those in names and dates are told below");
}

// A file's version counts as 7 or later by its first number.
bool isBeforeVersion7(std::string_view version) {
    const std::string_view major = version.substr(0, version.find('.'));
    return major.empty() || major.size() > 1 || major[0] < '7' || major[0] > '9';
}

// All that the header says fits a text of ASCII alone, but for UTF-16. Since version 7 there is UTF-8 only.
Encoding encodingOfAscii(const HeaderClaims& claims, std::optional<Encoding> claimed) {
    if (claimed && !isUtf16(*claimed)) return *claimed;
    return isBeforeVersion7(claims.version) ? Encoding::ascii : Encoding::utf8;
}

Encoding chooseEncoding(std::string_view bytes, const HeaderClaims& claims, bool marked,
                        DiagnosticList& diagnostics) {
    const auto claimed = encodingLabelled(capitals(claims.characters));
    const Utf8Census census = takeUtf8Census(bytes);
    const bool ascii = census.characters == 0 && census.faults == 0;
    Encoding used = Encoding::utf8;
    if (!marked) used = ascii ? encodingOfAscii(claims, claimed) : encodingByBytes(bytes, claimed, census);
    reportClaims(claims, claimed, used, diagnostics);
    reportFaults(census, used, diagnostics);
    return used;
}

// Takes a pair of lone surrogates that a CONC line had parted; 0 if there is none at the front.
std::size_t takeSurrogatePair(std::string_view raw, std::string& text) {
    const auto unitAt = [&raw](std::size_t at) -> unsigned {
        if (raw.size() < at + 3 || byteAt(raw, at) != 0xED) return 0;
        return 0xD000 | (byteAt(raw, at + 1) & 0x3F) << 6 | (byteAt(raw, at + 2) & 0x3F);
    };
    const unsigned high = unitAt(0);
    const unsigned low = unitAt(3);
    if (!isHighSurrogate(high) || !isLowSurrogate(low)) return 0;
    appendUtf8(text, joinSurrogates(high, low));
    return 6;
}

// Whether nothing but the beginning of a character is left: whoever wrote the value cut it there.
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
            if (length != 6) ++faults;
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

const char* encodingName(Encoding encoding) {
    switch (encoding) {
        case Encoding::ascii:
            return "ASCII";
        case Encoding::utf8:
            return "UTF-8";
        case Encoding::utf16Little:
            return "UTF-16LE";
        case Encoding::utf16Big:
            return "UTF-16BE";
        case Encoding::ansel:
            return "ANSEL";
        case Encoding::windows1250:
            return "windows-1250";
        case Encoding::windows1251:
            return "windows-1251";
        case Encoding::windows1252:
            return "windows-1252";
        case Encoding::ibm437:
            return "IBM437";
        case Encoding::ibm850:
            return "IBM850";
        case Encoding::macRoman:
            return "macintosh";
    }
    return "";
}

TextForm prepareText(std::string& bytes, DiagnosticList& diagnostics) {
    const auto utf16 = turnUtf16(bytes, diagnostics);
    const bool marked = takeUtf8Mark(bytes);
    const HeaderClaims claims = readHeaderClaims(bytes);
    TextForm form;
    form.version = lossyUtf8(claims.version);
    form.doublesEveryAt = isBeforeVersion7(claims.version);
    if (utf16) {
        form.encoding = *utf16;
        reportClaims(claims, encodingLabelled(capitals(claims.characters)), *utf16, diagnostics);
    } else {
        form.encoding = chooseEncoding(bytes, claims, marked, diagnostics);
    }
    return form;
}

std::string decodeText(std::string_view raw, Encoding encoding, std::size_t& faults) {
    if (encoding == Encoding::ansel) return composed(decodeAnsel(raw, faults));
    if (const CodePage* page = codePageOf(encoding)) return decodeCodePage(raw, *page, faults);
    return decodeUtf8(raw, faults);
}

}  // namespace olvane::gedcom
