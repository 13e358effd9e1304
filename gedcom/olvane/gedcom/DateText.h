// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

#include <olvane/gedcom/GedcomDate.h>

namespace olvane::gedcom {

// Dates, places and lives as a reader of a language sees them, in pictures, panels and lists. Languages are codes such as
// "de" or "de-AT"; English stands for others. Programs find the file's own text in GedcomDate::written.

// "12 Feb 1809", "about 1809", "between 1809 and 1811", "11 Feb 1731/32", "18 Brumaire VIII (9 Nov 1799)", "1809 (the phrase)":
// a date in the calendar it is written in, and behind another one in the Gregorian calendar.
//
// Holds: what cannot be put into words without loss is given as written, however long: a date that was not read, one that
//        does not exist, one whose day and month may be either way round.
std::string dateText(const GedcomDate& date, std::string_view language = "en");

// "1809", "1809–1882" or "about 1809 – 1882", "born 1809", "died before 1882"; empty where neither year was read.
std::string yearsText(const GedcomDate& birth, const GedcomDate& death, std::string_view language = "en");

// "born 12 Feb 1809, died about 1882": whole dates, of which each may not be given.
std::string lifeText(const GedcomDate& birth, const GedcomDate& death, std::string_view language = "en");

// "Kew, England" for "Kew,,,England".
std::string placeText(std::string_view place);

}  // namespace olvane::gedcom
