// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Calendars are joined at the Julian day number: each has one function from its date to the day. Back, only
// the Gregorian calendar is needed. Gregorian and Julian dates are counted from the first of March, so that
// the leap day is the last of the year. The Hebrew new year follows the mean conjunction with its four
// postponements, as in Dershowitz and Reingold, Calendrical Calculations. The French calendar uses its leap
// years 3, 7, 11 and so on.

#include <olvane/gedcom/CalendarDaysInternal.h>

#include <cstdint>

namespace olvane::gedcom {
namespace {

constexpr int kHebrewMonths = 13;
constexpr int kFrenchMonths = 13;
constexpr int kFirstAdar = 6;

// Rounds down, for years before the epoch too. divisor is above 0.
int floorDivided(int value, int divisor) {
    const int quotient = value / divisor;
    return value % divisor < 0 ? quotient - 1 : quotient;
}

// Years with a year 0, as sums need them.
int astronomicalYear(int year) {
    return year < 0 ? year + 1 : year;
}

int countedYear(int astronomical) {
    return astronomical <= 0 ? astronomical - 1 : astronomical;
}

// Days from the first of March to the first of the month; month 0 is March.
int daysSinceMarch(int month) {
    return (153 * month + 2) / 5;
}

bool isLeapYear(Calendar calendar, int year) {
    const int y = astronomicalYear(year);
    if (calendar == Calendar::julian) return y % 4 == 0;
    return y % 4 == 0 && (y % 100 != 0 || y % 400 == 0);
}

struct MarchDate {
    int year;
    int dayOfYear;
};

MarchDate marchDate(const CalendarDate& date) {
    const int fromMarch = (date.month + 9) % 12;
    const int year = astronomicalYear(date.year) - (date.month <= 2 ? 1 : 0);
    return {year, daysSinceMarch(fromMarch) + date.day - 1};
}

int gregorianDay(const CalendarDate& date) {
    const MarchDate march = marchDate(date);
    return 365 * march.year + floorDivided(march.year, 4) - floorDivided(march.year, 100) +
           floorDivided(march.year, 400) + march.dayOfYear + 1721120;
}

int julianDay(const CalendarDate& date) {
    const MarchDate march = marchDate(date);
    return 365 * march.year + floorDivided(march.year, 4) + march.dayOfYear + 1721118;
}

int frenchDay(const CalendarDate& date) {
    return date.year * 1461 / 4 + (date.month - 1) * 30 + date.day + 2375474;
}

bool isHebrewLeapYear(int year) {
    return (7 * year + 1) % 19 < 7;
}

// Days from the epoch to the new year, before the postponement that looks at neighbouring years.
int hebrewElapsedDays(int year) {
    const std::int64_t months = (235 * std::int64_t{year} - 234) / 19;
    const std::int64_t parts = 12084 + 13753 * months;
    const std::int64_t days = 29 * months + parts / 25920;
    return static_cast<int>(3 * (days + 1) % 7 < 3 ? days + 1 : days);
}

int hebrewNewYear(int year) {
    constexpr int kDayBeforeEpoch = 347997;
    const int before = hebrewElapsedDays(year - 1);
    const int here = hebrewElapsedDays(year);
    const int after = hebrewElapsedDays(year + 1);
    const int postponed = after - here == 356 ? 2 : (here - before == 382 ? 1 : 0);
    return kDayBeforeEpoch + 1 + here + postponed;
}

int daysInHebrewMonth(int year, int month) {
    const int yearLength = hebrewNewYear(year + 1) - hebrewNewYear(year);
    switch (month) {
        case 2:
            return yearLength % 10 == 5 ? 30 : 29;
        case 3:
            return yearLength % 10 == 3 ? 29 : 30;
        case kFirstAdar:
            return isHebrewLeapYear(year) ? 30 : 29;
        case kFirstAdar + 1:
            return 29;
        default:
            return month % 2 == (month < kFirstAdar ? 1 : 0) ? 30 : 29;
    }
}

// A year without a second Adar has its Adar under either name.
int hebrewDay(const CalendarDate& date) {
    int day = hebrewNewYear(date.year) + date.day - 1;
    for (int month = 1; month < date.month; ++month) {
        const bool absent = month == kFirstAdar && !isHebrewLeapYear(date.year);
        if (!absent) day += daysInHebrewMonth(date.year, month);
    }
    return day;
}

CalendarDate gregorianFromDay(int day) {
    const int fromMarch = day - 1721120;
    const int era = floorDivided(fromMarch, 146097);
    const int dayOfEra = fromMarch - era * 146097;
    const int yearOfEra = (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
    const int dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
    const int marchMonth = (5 * dayOfYear + 2) / 153;
    const int month = marchMonth < 10 ? marchMonth + 3 : marchMonth - 9;
    const int year = yearOfEra + era * 400 + (month <= 2 ? 1 : 0);
    return {countedYear(year), month, dayOfYear - daysSinceMarch(marchMonth) + 1};
}

int gregorianYearOf(Calendar calendar, int year) {
    switch (calendar) {
        case Calendar::gregorian:
        case Calendar::julian:
            return year;
        case Calendar::frenchRepublican:
            return year + 1792;
        case Calendar::hebrew:
            return countedYear(year - 3760);
    }
    return year;
}

}  // namespace

int daysInMonth(Calendar calendar, int year, int month) {
    constexpr int kDays[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    switch (calendar) {
        case Calendar::gregorian:
        case Calendar::julian:
            if (month < 1 || month > 12) return 0;
            return month == 2 && isLeapYear(calendar, year) ? 29 : kDays[month - 1];
        case Calendar::frenchRepublican:
            if (month < 1 || month > kFrenchMonths) return 0;
            return month == kFrenchMonths ? 6 : 30;
        case Calendar::hebrew:
            return month < 1 || month > kHebrewMonths ? 0 : daysInHebrewMonth(year, month);
    }
    return 0;
}

int dayNumber(Calendar calendar, const CalendarDate& date) {
    const CalendarDate first = {date.year, date.month == 0 ? 1 : date.month, date.day == 0 ? 1 : date.day};
    switch (calendar) {
        case Calendar::gregorian:
            return gregorianDay(first);
        case Calendar::julian:
            return julianDay(first);
        case Calendar::frenchRepublican:
            return frenchDay(first);
        case Calendar::hebrew:
            return hebrewDay(first);
    }
    return 0;
}

CalendarDate toGregorian(Calendar calendar, const CalendarDate& date) {
    if (calendar == Calendar::gregorian) return date;
    if (date.month == 0) return {gregorianYearOf(calendar, date.year), 0, 0};
    CalendarDate gregorian = gregorianFromDay(dayNumber(calendar, date));
    if (date.day == 0) gregorian.day = 0;
    return gregorian;
}

CalendarDate previousDay(const CalendarDate& gregorian) {
    return gregorianFromDay(dayNumber(Calendar::gregorian, gregorian) - 1);
}

}  // namespace olvane::gedcom
