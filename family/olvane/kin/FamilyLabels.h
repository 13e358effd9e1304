// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/kin/Family.h>
#include <olvane/kin/PersonLabel.h>

namespace olvane::kin {

// What a table says of a person in a picture: given name and surname, or else the full name, and the years of birth and
// death, which are the first three or four digits in a row of the written date.
// Fails: std::out_of_range for a person who is not in the table.
OLVANE_API PersonLabel labelOf(const Family& family, std::int64_t id);

}  // namespace olvane::kin
