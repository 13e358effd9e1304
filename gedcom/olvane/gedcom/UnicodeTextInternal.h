// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

// UnicodeForms.cpp is the one place that knows the Unicode library.
namespace olvane::gedcom {

// How bytes look as UTF-8.
struct Utf8Census {
    std::size_t characters = 0;  // well-formed ones outside ASCII, and halves of surrogate pairs
    std::size_t faults = 0;      // places that are none
};

// Bytes at the front of text that are one well-formed character; 0 if there is none.
// Fails: a surrogate, an overlong form and a character beyond U+10FFFF are not well-formed.
std::size_t utf8CharacterLength(std::string_view text);

// The character at the front of text; 0 if there is no well-formed one.
char32_t firstCharacter(std::string_view text);

bool isUtf8(std::string_view text);

bool isAscii(std::string_view text);

// Counts over a whole GEDCOM file. A character that a CONC line cuts in two counts as a character.
Utf8Census takeUtf8Census(std::string_view bytes);

// codePoint is never a surrogate nor beyond U+10FFFF.
void appendUtf8(std::string& text, char32_t codePoint);

// The text with each byte that is not UTF-8 turned into a question mark.
std::string lossyUtf8(std::string_view text);

// Composed normal form (NFC). text is well-formed.
std::string composed(const std::string& text);

// What a text is compared by in a search: without case, accents and compatibility forms, and with letters
// such as the o with stroke, which Unicode does not take apart, written plain. Ill-formed text comes back
// lower-cased alone.
std::string foldedForSearch(std::string_view text);

}  // namespace olvane::gedcom
