// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Calendars against dates that are known in two of them, and against themselves day by day.

#include <gtest/gtest.h>

#include <olvane/gedcom/CalendarDaysInternal.h>

namespace olvane::gedcom {
namespace {

void expectSameDay(Calendar calendar, CalendarDate date, CalendarDate gregorian) {
    const CalendarDate found = toGregorian(calendar, date);
    EXPECT_EQ(found.year, gregorian.year) << date.year << "-" << date.month << "-" << date.day;
    EXPECT_EQ(found.month, gregorian.month) << date.year << "-" << date.month << "-" << date.day;
    EXPECT_EQ(found.day, gregorian.day) << date.year << "-" << date.month << "-" << date.day;
}

TEST(CalendarDays, dayNumbersCountFromTheAgreedDay) {
    EXPECT_EQ(dayNumber(Calendar::julian, {-4713, 1, 1}), 0);
    EXPECT_EQ(dayNumber(Calendar::gregorian, {-4714, 11, 24}), 0);
    EXPECT_EQ(dayNumber(Calendar::gregorian, {2000, 1, 1}), 2451545);
    EXPECT_EQ(dayNumber(Calendar::hebrew, {1, 1, 1}), dayNumber(Calendar::julian, {-3761, 10, 7}));
}

TEST(CalendarDays, theReformSkipsTenDays) {
    expectSameDay(Calendar::julian, {1582, 10, 5}, {1582, 10, 15});
    expectSameDay(Calendar::julian, {1582, 10, 4}, {1582, 10, 14});
    expectSameDay(Calendar::julian, {300, 1, 1}, {300, 1, 1});
}

TEST(CalendarDays, noYearZeroLiesBetweenTheEras) {
    expectSameDay(Calendar::julian, {-1, 12, 31}, {-1, 12, 29});
    expectSameDay(Calendar::julian, {1, 1, 3}, {1, 1, 1});
    expectSameDay(Calendar::julian, {1, 1, 2}, {-1, 12, 31});
}

TEST(CalendarDays, hebrewMonthsFollowEachOtherWithoutGap) {
    for (int year = 5700; year < 5800; ++year) {
        int day = dayNumber(Calendar::hebrew, {year, 1, 1});
        for (int month = 1; month <= 13; ++month) {
            const bool leapYear = (7 * year + 1) % 19 < 7;
            if (month == 6 && !leapYear) continue;
            EXPECT_EQ(dayNumber(Calendar::hebrew, {year, month, 1}), day) << year << " " << month;
            day += daysInMonth(Calendar::hebrew, year, month);
        }
        EXPECT_EQ(dayNumber(Calendar::hebrew, {year + 1, 1, 1}), day) << year;
    }
}

TEST(CalendarDays, everyGregorianDayComesBack) {
    CalendarDate date = {2001, 3, 1};
    int day = dayNumber(Calendar::gregorian, date);
    while (date.year > -5) {
        date = previousDay(date);
        ASSERT_EQ(dayNumber(Calendar::gregorian, date), --day)
            << date.year << "-" << date.month << "-" << date.day;
        ASSERT_GE(date.day, 1);
        ASSERT_LE(date.day, daysInMonth(Calendar::gregorian, date.year, date.month));
    }
}

}  // namespace
}  // namespace olvane::gedcom
