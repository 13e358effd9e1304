// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::cli {

// Everybody who comes back to themself over fathers and mothers, in the order of the file. Time grows with
// the number of persons alone, whatever circles they form.
std::vector<gedcom::PersonId> ownAncestors(const gedcom::GedcomData& data);

}  // namespace olvane::cli
