// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::cli {

// Lists of persons for other programs, in the order of the ids given. The data are read with facts, for the places.

// Tab-separated values, a heading first: id, xref, sex, name, given, surname, dead, birth, birth_sort, birth_place, death,
// death_sort, death_place. Cells are as tableCell makes them.
std::string peopleTable(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& persons);

// JSON of the form of docs/people.schema.json.
std::string peopleJson(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& persons);

}  // namespace olvane::cli
