// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <olvane/gedcom/DiagnosticListInternal.h>
#include <olvane/gedcom/GedcomData.h>
#include <olvane/gedcom/XrefTableInternal.h>

namespace olvane::gedcom {

// Turns pointers into ids, once all records are read, and fills in who is whose father, mother, spouse and
// child.
//
// Holds: a pointer to nothing becomes nobody, with a diagnostic. Time and memory are linear in the number of
//        links, even where many persons claim the same large family.
void resolveLinks(GedcomTables& tables, const XrefTable& xrefs, DiagnosticList& diagnostics);

}  // namespace olvane::gedcom
