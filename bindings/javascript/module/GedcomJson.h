// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <exception>
#include <span>

#include <olvane/gedcom/GedcomDate.h>
#include <olvane/gedcom/GedcomDetails.h>

#include "JsonText.h"
#include "OpenFile.h"

namespace olvane::js {

// 0 for a date that is not given; else what was written, year, month, day, mark, last year and the text of the year.
void appendDate(JsonText& json, const gedcom::GedcomDate& date);

// 0 where there are none; else in the order of the fields of Details. A quality that is not given is -1.
void appendDetails(JsonText& json, const gedcom::Details& details);

// What make returns, kept as the last text; or null, with the reason as the last text.
template <class Make>
const char* textOrRefusal(const Make& make) {
    try {
        lastText = make();
        return lastText.c_str();
    } catch (const std::exception& error) {
        lastText = error.what();
        return nullptr;
    }
}

}  // namespace olvane::js
