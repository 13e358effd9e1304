// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <string_view>

#include <olvane/gedcom/CalendarDaysInternal.h>
#include <olvane/gedcom/DateWordsInternal.h>
#include <olvane/gedcom/WordScannerInternal.h>

namespace olvane::gedcom {

// A date, and what is doubtful about it.
struct ReadDate {
    Calendar calendar = Calendar::gregorian;
    CalendarDate date;
    bool doubtful = false;
    bool yearAlone = false;  // day and month are there, in an order that is not certain
    bool shortened =
        false;  // something that is written cannot be: a 31st of February, a second year that does not follow
    int earlierYear = 0;  // of a year with two forms, whose later one is the date's; 0 for a year with one
};

// Reads [calendar] [weekday] [[day] month] year [B.C.], or a date in numbers. Empty where the words are no date; how many
// of them were skipped is then not stated.
std::optional<ReadDate> takeDate(WordScanner& words);

// "1819-05-24" or "1819-05". False for any other word.
bool readIsoDate(std::string_view word, ReadDate& result);

// "06.05.1900", "24/01/1915", "1915/1/24", "01/1915"; also in three words: "6. 5. 1900". False, with no word skipped, for
// anything else.
bool takeNumericDate(WordScanner& words, ReadDate& result);

// The number that the digits are; empty for more than `longest` of them, or for other characters.
std::optional<int> wholeNumber(std::string_view digits, std::size_t longest);

// A day that the month does not have is left out; the month and year still say something.
void dropImpossibleDay(ReadDate& result);

}  // namespace olvane::gedcom
