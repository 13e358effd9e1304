// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <span>

#include <olvane/gedcom/GedcomDate.h>
#include <olvane/gedcom/GedcomDetails.h>

#include "JsonText.h"
#include "OpenFile.h"

namespace olvane::js {

// 0 for a date that is not given; else what was written, year, month, day, mark, last year, the text of the year, and
// whether it is a period.
void appendDate(JsonText& json, const gedcom::GedcomDate& date);

// 0 where there are none; else in the order of the fields of Details. A quality that is not given is -1.
void appendDetails(JsonText& json, const gedcom::Details& details);

// Tag, value, date and place, as entries of a list that is begun.
void appendFact(JsonText& json, const gedcom::Fact& fact);

}  // namespace olvane::js
