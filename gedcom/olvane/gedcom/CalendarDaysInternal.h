// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

namespace olvane::gedcom {

enum class Calendar { gregorian, julian, frenchRepublican, hebrew };

// A day, or with day 0 a month, or with month 0 as well a year.
//
// Units: year as people count: no year 0, 44 B.C. is -44. The months of the French calendar are 1 to 13 with
//        the complementary days last; those of the Hebrew one begin with Tishri as 1, Adar is 6, the second
//        Adar 7, Elul 13.
struct CalendarDate {
    int year = 0;
    int month = 0;
    int day = 0;
};

// The last year that a date is read of, of either era.
constexpr int kLastYear = 9999;

// The highest day number of the month; 0 for a month that the calendar does not have.
int daysInMonth(Calendar calendar, int year, int month);

// Julian day number of the date's first day. The date is one that the calendar has.
int dayNumber(Calendar calendar, const CalendarDate& date);

// The same date in the Gregorian calendar, as fine as it was. A year alone of the French or Hebrew calendar
// becomes the Gregorian year that it has the most of.
CalendarDate toGregorian(Calendar calendar, const CalendarDate& date);

// The day before.
CalendarDate previousDay(const CalendarDate& gregorian);

}  // namespace olvane::gedcom
