// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::cli {

// Whom an output hides.
struct HidingOptions {
    bool hideLiving = false;
    int year = 0;  // the present one for hideLiving; 0 takes presentYear()
};

// Who is hidden, an entry for each person, entry 0 for person 1; empty for nobody.
std::vector<bool> hiddenPersons(const gedcom::GedcomData& data, const HidingOptions& options);

// The year of the clock, or of SOURCE_DATE_EPOCH where that is earlier; never a later one, since more persons would be
// taken for dead.
// Fails: throws UsageError for a SOURCE_DATE_EPOCH that is no time.
int presentYear();

}  // namespace olvane::cli
