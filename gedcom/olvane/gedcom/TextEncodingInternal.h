// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include <olvane/gedcom/DiagnosticListInternal.h>
#include <olvane/gedcom/EncodingTableInternal.h>

namespace olvane::gedcom {

// What a file's header says of itself. Views into the bytes; empty where it says nothing.
struct HeaderClaims {
    std::string_view characters;  // HEAD.CHAR
    std::string_view version;     // HEAD.GEDC.VERS
    std::uint32_t charactersLine = 0;
};

// How values are decoded when they are kept.
enum class ValueCoding : std::uint8_t { utf8, ansel, page };

// How the bytes are to be read.
struct TextForm {
    const KnownEncoding* encoding = &kAscii;  // of the file, before anything was done to it
    ValueCoding coding = ValueCoding::utf8;   // of the bytes as they are now
    CodePage page{};                          // of ValueCoding::page
    std::string version;                      // as the header has it
    bool doublesEveryAt = true;  // @@ stands for @ everywhere; since 7.0 at the front of a value only
};

// Makes the bytes a superset of ASCII: takes off a byte-order mark, and turns UTF-16 and encodings of several bytes a
// character to UTF-8. A lone surrogate stays, in three bytes, since a CONC line may bring the other one. The encoding
// is the chosen one, by any of its names; where none is chosen, a byte-order mark decides, else the header, unless the
// bytes cannot be that. Whatever is not certain is reported.
// Fails: GedcomError, in the name of the file, for a chosen encoding that nobody knows.
TextForm prepareText(std::string& bytes, const std::string& file, std::string_view chosen,
                     DiagnosticList& diagnostics);

// Text in Unicode, composed where the encoding has no composed letters. raw may have been joined of several
// lines. Bytes that are no character become U+FFFD, or what they are in windows-1252 if the file is UTF-8
// otherwise; faults counts them.
std::string decodeText(std::string_view raw, const TextForm& form, std::size_t& faults);

}  // namespace olvane::gedcom
