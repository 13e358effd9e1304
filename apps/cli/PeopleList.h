// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/picture/TextSink.h>

namespace olvane::cli {

// Lists of persons for other programs, in the order of the ids given. The data are read with facts, for the places.

// Tab-separated values, a heading first: id, xref, sex, name, given, surname, dead, birth, birth_sort, birth_place, death,
// death_sort, death_place. Cells are as tableCell makes them.
void writePeopleTable(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& persons,
                      const picture::TextSink& write);

// JSON of the form of docs/people.schema.json.
void writePeopleJson(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& persons,
                     const picture::TextSink& write);

}  // namespace olvane::cli
