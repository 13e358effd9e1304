// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include <olvane/gedcom/DiagnosticListInternal.h>

namespace olvane::gedcom {

enum class Encoding : std::uint8_t {
    ascii,
    utf8,
    utf16Little,
    utf16Big,
    ansel,
    windows1250,
    windows1251,
    windows1252,
    ibm437,
    ibm850,
    macRoman,
};

// "UTF-8", "windows-1252" and so on.
const char* encodingName(Encoding encoding);

// What a file's header says of itself. Views into the bytes; empty where it says nothing.
struct HeaderClaims {
    std::string_view characters;  // HEAD.CHAR
    std::string_view version;     // HEAD.GEDC.VERS
    std::uint32_t charactersLine = 0;
};

// How the bytes are to be read.
struct TextForm {
    Encoding encoding = Encoding::ascii;  // of the text before anything was done to it
    std::string version;                  // as the header has it
    bool doublesEveryAt = true;  // @@ stands for @ everywhere; since 7.0 at the front of a value only
};

// Makes the bytes a superset of ASCII: takes off a byte-order mark, and turns UTF-16 to UTF-8. A lone
// surrogate stays, in three bytes, since a CONC line may bring the other one. Tells then how the text is
// encoded: a byte-order mark decides, else the header, unless the bytes cannot be that.
TextForm prepareText(std::string& bytes, DiagnosticList& diagnostics);

// Text in Unicode, composed where the encoding has no composed letters. raw may have been joined of several
// lines. Bytes that are no character become U+FFFD, or what they are in windows-1252 if the file is UTF-8
// otherwise; faults counts them.
std::string decodeText(std::string_view raw, Encoding encoding, std::size_t& faults);

}  // namespace olvane::gedcom
