// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>

namespace olvane::gedcom {

// The characters of the bytes 0x80 to 0xFF, in that order; 0 for a byte that is none.
using CodePage = std::array<char16_t, 128>;

extern const CodePage kWindows1250;
extern const CodePage kWindows1251;
extern const CodePage kWindows1252;
extern const CodePage kIbm437;
extern const CodePage kIbm850;
extern const CodePage kMacRoman;
extern const CodePage kIbm737;
extern const CodePage kIbm775;
extern const CodePage kIbm852;
extern const CodePage kIbm855;
extern const CodePage kIbm857;
extern const CodePage kIbm858;
extern const CodePage kIbm860;
extern const CodePage kIbm861;
extern const CodePage kIbm862;
extern const CodePage kIbm863;
extern const CodePage kIbm865;
extern const CodePage kIbm866;
extern const CodePage kIbm869;

}  // namespace olvane::gedcom
