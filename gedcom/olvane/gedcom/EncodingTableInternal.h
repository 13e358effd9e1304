// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string_view>

#include <olvane/gedcom/CodePagesInternal.h>

namespace olvane::gedcom {

enum class EncodingSort : std::uint8_t {
    ascii,
    utf8,
    utf16Little,
    utf16Big,
    ansel,
    ownPage,       // one byte a character, by a table of our own
    platformPage,  // one byte a character, by a table that the platform has
    multiByte,     // one, two or more bytes a character; the platform decodes it
};

// An encoding that files come in.
//
// Holds: valid until the program ends. Of a platform's encoding there are the names that iconv and a browser's TextDecoder have
//        for it, chosen so that both read the same.
struct KnownEncoding {
    std::string_view name;  // to be shown
    EncodingSort sort = EncodingSort::utf8;
    const CodePage* page = nullptr;      // of ownPage
    const char* iconvName = nullptr;     // of platformPage and multiByte
    const char* browserLabel = nullptr;  // the same
    bool writesMarksApart = false;       // accents are characters of their own, to be composed
};

// Null for a label that nobody knows. "ANSI", "IBMPC" and the like are what custom takes them for.
const KnownEncoding* findEncoding(std::string_view label);

// Whether a label names a maker's system instead of an encoding; what it means is a custom, not a rule.
bool namesASystem(std::string_view label);

extern const KnownEncoding& kAscii;
extern const KnownEncoding& kUtf8;
extern const KnownEncoding& kUtf16Little;
extern const KnownEncoding& kUtf16Big;
extern const KnownEncoding& kAnsel;
extern const KnownEncoding& kWindowsLatin;

}  // namespace olvane::gedcom
