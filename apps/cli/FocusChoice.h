// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::cli {

// The one person whom the user means: by xref ("I17", "@I17@"), by number or by words of a name.
// Fails: throws UsageError with the candidates, one a line, when nobody or more than one fits.
gedcom::PersonId chooseFocus(const gedcom::GedcomData& data, const std::string& who);

// A person's name for a line that people read: of one that is longer than picture::kMostTextBytes the beginning.
std::string readableName(const gedcom::GedcomData& data, gedcom::PersonId id);

// "1 <tab> @I1@ <tab> Victoria Hanover <tab> * 1819 † 1901"
std::string personLine(const gedcom::GedcomData& data, gedcom::PersonId id);

}  // namespace olvane::cli
