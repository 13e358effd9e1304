// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Encodings by name. Headers, users and platforms spell one name in many ways, so labels are compared without
// capitals and signs, and the families that count up (windows-1250, ISO-8859-2, IBM852) are known by their number.

#include <olvane/gedcom/EncodingTableInternal.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <iterator>
#include <string>

#include <olvane/gedcom/GedcomEncodings.h>

namespace olvane::gedcom {
namespace {

constexpr KnownEncoding ofOurOwn(std::string_view name, const CodePage& page) {
    return {name, EncodingSort::ownPage, &page, nullptr, nullptr, false};
}

constexpr KnownEncoding ofPlatform(std::string_view name, const char* iconvName, const char* browserLabel,
                                   EncodingSort sort = EncodingSort::platformPage) {
    return {name, sort, nullptr, iconvName, browserLabel, false};
}

constexpr KnownEncoding vietnamese() {
    KnownEncoding encoding = ofPlatform("windows-1258", "CP1258", "windows-1258");
    encoding.writesMarksApart = true;
    return encoding;
}

constexpr KnownEncoding kEncodings[] = {
    {"UTF-8", EncodingSort::utf8},
    {"ANSEL", EncodingSort::ansel},
    ofOurOwn("windows-1252", kWindows1252),
    ofOurOwn("windows-1250", kWindows1250),
    ofOurOwn("windows-1251", kWindows1251),
    ofPlatform("windows-1253", "CP1253", "windows-1253"),
    ofPlatform("windows-1254", "CP1254", "windows-1254"),
    ofPlatform("windows-1255", "CP1255", "windows-1255"),
    ofPlatform("windows-1256", "CP1256", "windows-1256"),
    ofPlatform("windows-1257", "CP1257", "windows-1257"),
    vietnamese(),
    ofOurOwn("macintosh", kMacRoman),
    ofOurOwn("IBM437", kIbm437),
    ofOurOwn("IBM850", kIbm850),
    ofOurOwn("IBM852", kIbm852),
    {"UTF-16LE", EncodingSort::utf16Little},
    {"UTF-16BE", EncodingSort::utf16Big},
    {"ASCII", EncodingSort::ascii},
    ofPlatform("ISO-8859-2", "ISO-8859-2", "iso-8859-2"),
    ofPlatform("ISO-8859-3", "ISO-8859-3", "iso-8859-3"),
    ofPlatform("ISO-8859-4", "ISO-8859-4", "iso-8859-4"),
    ofPlatform("ISO-8859-5", "ISO-8859-5", "iso-8859-5"),
    ofPlatform("ISO-8859-6", "ISO-8859-6", "iso-8859-6"),
    ofPlatform("ISO-8859-7", "ISO-8859-7", "iso-8859-7"),
    ofPlatform("ISO-8859-8", "ISO-8859-8", "iso-8859-8"),
    ofPlatform("ISO-8859-10", "ISO-8859-10", "iso-8859-10"),
    ofPlatform("ISO-8859-13", "ISO-8859-13", "iso-8859-13"),
    ofPlatform("ISO-8859-14", "ISO-8859-14", "iso-8859-14"),
    ofPlatform("ISO-8859-15", "ISO-8859-15", "iso-8859-15"),
    ofPlatform("ISO-8859-16", "ISO-8859-16", "iso-8859-16"),
    ofPlatform("KOI8-R", "KOI8-R", "koi8-r"),
    ofPlatform("KOI8-U", "KOI8-U", "koi8-u"),
    ofPlatform("GBK", "GB18030", "gbk", EncodingSort::multiByte),
    ofPlatform("GB18030", "GB18030", "gb18030", EncodingSort::multiByte),
    ofPlatform("BIG5", "BIG5-HKSCS", "big5", EncodingSort::multiByte),
    ofPlatform("Shift_JIS", "CP932", "shift_jis", EncodingSort::multiByte),
    ofPlatform("EUC-JP", "EUC-JP", "euc-jp", EncodingSort::multiByte),
    ofPlatform("EUC-KR", "CP949", "euc-kr", EncodingSort::multiByte),
    ofPlatform("TIS-620", "CP874", "windows-874"),
    ofOurOwn("IBM737", kIbm737),
    ofOurOwn("IBM775", kIbm775),
    ofOurOwn("IBM855", kIbm855),
    ofOurOwn("IBM857", kIbm857),
    ofOurOwn("IBM858", kIbm858),
    ofOurOwn("IBM860", kIbm860),
    ofOurOwn("IBM861", kIbm861),
    ofOurOwn("IBM862", kIbm862),
    ofOurOwn("IBM863", kIbm863),
    ofOurOwn("IBM865", kIbm865),
    ofOurOwn("IBM866", kIbm866),
    ofOurOwn("IBM869", kIbm869),
};

constexpr auto kNames = [] {
    std::array<std::string_view, std::size(kEncodings)> names{};
    for (std::size_t i = 0; i < names.size(); ++i) names[i] = kEncodings[i].name;
    return names;
}();

constexpr const KnownEncoding& named(std::string_view name) {
    for (const KnownEncoding& encoding : kEncodings) {
        if (encoding.name == name) return encoding;
    }
    return kEncodings[0];
}

// Labels in bare form (capitals and digits alone) whose name is another.
struct Alias {
    std::string_view label;
    std::string_view name;
};

constexpr Alias kAliases[] = {
    {"UNICODE", "UTF-16LE"},     {"UTF16", "UTF-16LE"},
    {"USASCII", "ASCII"},        {"ANSI", "windows-1252"},
    {"WINDOWS", "windows-1252"}, {"IBMWINDOWS", "windows-1252"},
    {"IBMPC", "IBM437"},         {"IBM", "IBM437"},
    {"IBMDOS", "IBM850"},        {"DOS", "IBM850"},
    {"MSDOS", "IBM850"},         {"MAC", "macintosh"},
    {"MACROMAN", "macintosh"},   {"ISO88591", "windows-1252"},
    {"LATIN1", "windows-1252"},  {"ISO88599", "windows-1254"},
    {"LATIN5", "windows-1254"},  {"ISO885911", "TIS-620"},
    {"LATIN2", "ISO-8859-2"},    {"LATIN3", "ISO-8859-3"},
    {"LATIN4", "ISO-8859-4"},    {"LATIN6", "ISO-8859-10"},
    {"LATIN7", "ISO-8859-13"},   {"LATIN8", "ISO-8859-14"},
    {"LATIN9", "ISO-8859-15"},   {"LATIN10", "ISO-8859-16"},
    {"CYRILLIC", "ISO-8859-5"},  {"GREEK", "ISO-8859-7"},
    {"HEBREW", "ISO-8859-8"},    {"KOI8", "KOI8-R"},
    {"GB2312", "GBK"},           {"EUCCN", "GBK"},
    {"SJIS", "Shift_JIS"},       {"MSKANJI", "Shift_JIS"},
    {"UHC", "EUC-KR"},           {"KSC56011987", "EUC-KR"},
};

// Numbers of code pages that are no IBM pages of ours.
constexpr Alias kPageNumbers[] = {
    {"874", "TIS-620"},  {"932", "Shift_JIS"}, {"936", "GBK"},          {"949", "EUC-KR"},
    {"950", "BIG5"},     {"866", "IBM866"},    {"65001", "UTF-8"},      {"10000", "macintosh"},
    {"20866", "KOI8-R"}, {"21866", "KOI8-U"},  {"819", "windows-1252"}, {"31J", "Shift_JIS"},
};

std::string bareLabel(std::string_view label) {
    constexpr std::size_t kLongest = 24;
    std::string bare;
    for (const char c : label.substr(0, kLongest)) {
        if (c >= 'a' && c <= 'z') bare += static_cast<char>(c - 'a' + 'A');
        if ((c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9')) bare += c;
    }
    return bare;
}

template <std::size_t N>
const KnownEncoding* findAlias(const Alias (&aliases)[N], std::string_view label) {
    const auto* const found = std::find_if(std::begin(aliases), std::end(aliases),
                                           [&label](const Alias& alias) { return alias.label == label; });
    return found == std::end(aliases) ? nullptr : &named(found->name);
}

const KnownEncoding* findByBareName(std::string_view bare) {
    const auto* const found =
        std::find_if(std::begin(kEncodings), std::end(kEncodings),
                     [&bare](const KnownEncoding& known) { return bareLabel(known.name) == bare; });
    return found == std::end(kEncodings) ? nullptr : found;
}

// "CP1252", "WIN1251", "ANSI1250", "PC850": a system's word and the number of a code page.
const KnownEncoding* findPage(std::string_view bare) {
    for (const std::string_view word : {"WINDOWS", "WINCP", "WIN", "ANSI", "IBMCP", "IBM", "DOSCP", "DOS",
                                        "CP", "CODEPAGE", "PC", "XCP", "MS"}) {
        if (!bare.starts_with(word)) continue;
        const std::string_view number = bare.substr(word.size());
        if (const KnownEncoding* found = findAlias(kPageNumbers, number)) return found;
        if (number.size() == 4) return findByBareName("WINDOWS" + std::string(number));
        if (number.size() == 3) return findByBareName("IBM" + std::string(number));
    }
    return nullptr;
}

constexpr std::string_view kSystems[] = {"ANSI", "WINDOWS", "IBMWINDOWS", "IBMPC", "IBM", "IBMDOS"};

}  // namespace

const KnownEncoding& kAscii = named("ASCII");
const KnownEncoding& kUtf8 = named("UTF-8");
const KnownEncoding& kUtf16Little = named("UTF-16LE");
const KnownEncoding& kUtf16Big = named("UTF-16BE");
const KnownEncoding& kAnsel = named("ANSEL");
const KnownEncoding& kWindowsLatin = named("windows-1252");

const KnownEncoding* findEncoding(std::string_view label) {
    const std::string bare = bareLabel(label);
    if (bare.empty()) return nullptr;
    if (const KnownEncoding* found = findAlias(kAliases, bare)) return found;
    if (const KnownEncoding* found = findByBareName(bare)) return found;
    return findPage(bare);
}

bool namesASystem(std::string_view label) {
    const std::string bare = bareLabel(label);
    return std::find(std::begin(kSystems), std::end(kSystems), bare) != std::end(kSystems);
}

std::span<const std::string_view> encodingNames() {
    return kNames;
}

std::string_view encodingLabelled(std::string_view label) {
    const KnownEncoding* const found = findEncoding(label);
    return found == nullptr ? std::string_view() : found->name;
}

}  // namespace olvane::gedcom
