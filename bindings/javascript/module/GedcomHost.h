// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane.h>

#include <olvane/source/GedcomDataSource.h>

namespace olvane::js {

// A GEDCOM file as a host of the C interface. source outlives what is returned.
olvane_host hostOfFile(gedcom::GedcomDataSource& source);

}  // namespace olvane::js
