// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include <olvane/gedcom/DiagnosticListInternal.h>
#include <olvane/gedcom/EncodingTableInternal.h>

namespace olvane::gedcom {

// Turns bytes of an encoding with several bytes a character to UTF-8, all at once, since such a character may hold
// bytes that mean something in ASCII. A character that a CONC line cuts in two stands whole before the line end then.
// Bytes that are no character become U+FFFD and are reported. False if the platform does not know the encoding.
bool turnMultiByte(std::string& bytes, const KnownEncoding& encoding, DiagnosticList& diagnostics);

}  // namespace olvane::gedcom
