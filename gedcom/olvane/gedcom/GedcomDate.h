// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace olvane::gedcom {

// How firmly a date stands.
enum class DateMark : std::uint8_t {
    exact,    // the date itself, or one interpreted from a phrase
    about,    // ABT, CAL, EST
    before,   // BEF, or a period of which only the end is known
    after,    // AFT, or a period of which only the beginning is known
    between,  // BET .. AND, FROM .. TO: year is the first one, lastYear the last one
};

// A date as a record gives it, read to the Gregorian calendar whatever calendar it was written in.
//
// Units: years count without a year 0: 44 B.C. is -44. month is 1 to 12, day 1 to 31; 0 means not given.
// Holds: a date that could not be read has year 0, and written is all there is to show. A year alone of a
//        calendar whose year begins in autumn is the Gregorian year that most of it falls in. A dual year
//        (1731/32) is the later one, by which the year begins in January.
// Lifetime: written is a view into the text of the GedcomData that the date came from.
struct GedcomDate {
    std::string_view written;
    std::uint32_t line = 0;  // of its DATE in the file, from 1; 0 for a date that is from no file
    std::int16_t year = 0;
    std::int16_t lastYear = 0;
    std::uint8_t month = 0;
    std::uint8_t day = 0;
    DateMark mark = DateMark::exact;
    bool isYearAlone = false;  // a day and a month are written, in an order that is not certain: "05/06/1900"

    bool isGiven() const { return !written.empty(); }
    bool isRead() const { return year != 0; }
};

// Reads a DATE value in any of the standard's calendars and forms, of version 5.5, 5.5.1 or 7.0; also ISO dates, small
// letters, months in full and in twelve languages, weekdays, "6.5.1900", "24/01/1915", "May 24, 1819", "12MAY1900",
// "<1590>", "1850-1860" and "44 v. Chr.". With strokes or hyphens between numbers the day comes first only where it
// cannot be the month; else the year alone is read. Never fails: what cannot be read comes back with year 0.
GedcomDate parseGedcomDate(std::string_view written);

// Text that sorts as the dates do, by plain comparison of bytes: "1819-05-24", "1819-05", "1819"; a "~" at
// the end puts a date behind all that begin alike ("after 1819" is "1819~", "before 1820" too). Years B.C.
// begin with "-" and count from 9999 down. Empty for a date that was not read. At most 12 bytes.
std::string sortText(const GedcomDate& date);

// The year for a person to read, in as few letters as a box has room for: "1819", "44 BC"; with marks "~1819", "<1819",
// ">1819", "1819-1825". A date that was not read is given as written. The language is a code as in DateText.h, which has
// whole dates.
std::string displayYear(const GedcomDate& date, std::string_view language = "en");

}  // namespace olvane::gedcom
