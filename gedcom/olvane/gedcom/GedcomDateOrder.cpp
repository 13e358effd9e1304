// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates that were read, as texts that sort.

#include <olvane/gedcom/GedcomDate.h>

#include <cstddef>

#include <olvane/gedcom/CalendarDaysInternal.h>

namespace olvane::gedcom {

namespace {

// Appends the number with leading zeros up to `digits` digits.
void appendPadded(std::string& text, int number, std::size_t digits) {
    const std::string plain = std::to_string(number);
    if (plain.size() < digits) text.append(digits - plain.size(), '0');
    text.append(plain);
}

// Years B.C. are turned round, so that they sort: "-9955" is 44 B.C.
std::string sortableDate(const CalendarDate& date) {
    std::string text;
    if (date.year < 0) text.push_back('-');
    appendPadded(text, date.year < 0 ? kLastYear + date.year : date.year, 4);
    for (const int part : {date.month, date.day}) {
        if (part == 0) break;
        text.push_back('-');
        appendPadded(text, part, 2);
    }
    return text;
}

// The day, month or year before, as fine as the date is.
CalendarDate justBefore(const CalendarDate& date) {
    CalendarDate before =
        previousDay({date.year, date.month == 0 ? 1 : date.month, date.day == 0 ? 1 : date.day});
    if (date.day == 0) before.day = 0;
    if (date.month == 0) before.month = 0;
    return before;
}

}  // namespace

std::string sortText(const GedcomDate& date) {
    if (!date.isRead()) return {};
    const CalendarDate day = {date.year, date.month, date.day};
    if (date.mark == DateMark::after) return sortableDate(day) + "~";
    if (date.mark == DateMark::before && date.year > -kLastYear) return sortableDate(justBefore(day)) + "~";
    return sortableDate(day);
}

}  // namespace olvane::gedcom
