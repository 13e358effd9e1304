// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <olvane/gedcom/DiagnosticListInternal.h>
#include <olvane/gedcom/GedcomData.h>

namespace olvane::gedcom {

// Adds the missing side of links that one side alone has, as GedcomData.h says where each stands, and puts partners into
// the slot of their sex. Pointers are resolved. What is added, and what contradicts it, is reported.
// Units: time and memory grow with the number of links.
void completeLinks(GedcomTables& tables, DiagnosticList& diagnostics);

}  // namespace olvane::gedcom
