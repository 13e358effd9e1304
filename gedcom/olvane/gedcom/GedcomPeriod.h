// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/gedcom/GedcomDate.h>

namespace olvane::gedcom {

// Whether a date says how long something lasted (FROM, TO, or both), where the mark alone says before, after or between.
bool isPeriod(const GedcomDate& date);

}  // namespace olvane::gedcom
