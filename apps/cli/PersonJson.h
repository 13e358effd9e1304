// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

#include <nlohmann/json.hpp>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/gedcom/HiddenNames.h>

#include <cli/JsonOutput.h>

namespace olvane::cli {

// "male", "female", "other"
const char* sexName(gedcom::Sex sex);

// Where a person was born or died: the place of the event whose date the record gives, or else of the first that has
// one. Empty where there is none, and where the data were read without facts. tag is BIRT or DEAT.
std::string_view placeOf(const gedcom::GedcomData& data, gedcom::PersonId id, std::string_view tag);

// A date: "written", "shown", and where it could be read "year" and "sort".
nlohmann::ordered_json dateJson(const gedcom::GedcomDate& date);

// What a file says of a person, each field by name, into an object that is open; birth and death only where it gives a
// date, their places only where facts were read. Texts that name somebody hidden are left out.
void writePersonFields(const gedcom::GedcomData& data, gedcom::PersonId id,
                       const gedcom::HiddenNames& hiddenNames, JsonOutput& json);

}  // namespace olvane::cli
