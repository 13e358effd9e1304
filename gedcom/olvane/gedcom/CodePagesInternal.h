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

}  // namespace olvane::gedcom
