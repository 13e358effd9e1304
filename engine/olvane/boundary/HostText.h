// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

#include <olvane/Export.h>

// Plain decimal: no grouping, no "+", no leading zeros.
OLVANE_API std::string intToString(int value);

// Skips white space, reads an optional sign and digits, and stops at the first other character; a text with
// no number gives 0. A number too large keeps the low 32 bits of the largest (or least) 64-bit number.
OLVANE_API int stringToInt(std::string text);

// The engine's text of a host's date: its first character, and nothing for an empty date. Deliberately
// narrow: dates are looked at only to distinguish two records of a child, and longer texts would separate
// what has been one record in every chart so far. The first byte where the text does not begin with a
// well-formed UTF-8 character.
OLVANE_API std::string stringToString(std::string text);
// The same, as a part of the text.
OLVANE_API std::string_view firstCharacterOf(std::string_view text);
