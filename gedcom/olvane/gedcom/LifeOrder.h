// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <span>
#include <vector>

#include <olvane/gedcom/GedcomRecords.h>

namespace olvane::gedcom {

// Facts of a person or a family in the order of a life, whatever order the file has them in: birth, what has a date, what has
// none, death and what follows it. Of one kind they stand by their dates; with one date, or without, as in the file.
//
// Lifetime: points into the facts.
std::vector<const Fact*> inLifeOrder(std::span<const Fact> facts);

}  // namespace olvane::gedcom
