// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <span>
#include <string_view>

namespace olvane::gedcom {

// Encodings that a file may be read in, by the names to show and to choose from: "UTF-8", "ANSEL", "windows-1252",
// "ISO-8859-2", "KOI8-R", "GBK", "IBM850" and so on, the usual ones first.
std::span<const std::string_view> encodingNames();

// The name in encodingNames() that a label stands for: "cp1252", "Windows 1252" and "latin1" are windows-1252.
// Capitals, spaces and signs do not count. Empty for a label that nobody knows.
//
// Holds: ISO-8859-1, -9 and -11 are read as the windows code pages that extend them, as browsers do.
std::string_view encodingLabelled(std::string_view label);

}  // namespace olvane::gedcom
