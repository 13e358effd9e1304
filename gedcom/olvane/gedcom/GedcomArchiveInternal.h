// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

#include <olvane/gedcom/DiagnosticListInternal.h>

namespace olvane::gedcom {

// Whether the bytes begin as a zip archive does, which no GEDCOM text can.
bool looksLikeArchive(std::string_view bytes);

// The GEDCOM member of a .gdz archive.
// Fails: GedcomError if there is none, if it cannot be unpacked or is larger than its archive can sensibly
//        make it, and always in a library that was built without zip.
std::string unpackGedcom(const std::string& archive, const std::string& name, DiagnosticList& diagnostics);

}  // namespace olvane::gedcom
