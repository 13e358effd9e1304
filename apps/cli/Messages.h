// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane/gedcom/GedcomDiagnostic.h>

namespace olvane::cli {

// Messages on stderr: "olvane: TEXT", and diagnostics as they are. In colour on a terminal alone, and never
// where the environment has NO_COLOR.
void printMessage(const std::string& text);
void printMessage(const gedcom::Diagnostic& diagnostic);

}  // namespace olvane::cli
