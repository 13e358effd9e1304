// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::cli {

// Who may be living: everybody with no sign of death who was born less than 110 years before
// thisYear, and everybody without a sign of death whose dates do not decide it and who is within two steps (to a
// parent, a child or a spouse) of such a person.
//
// Holds: one entry for each person of the file; entry 0 is person 1.
std::vector<bool> livingPersons(const gedcom::GedcomData& data, int thisYear);

}  // namespace olvane::cli
