// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Dates in numbers alone. Which of two small numbers is the day, the separator and the numbers themselves decide; where
// they do not, the year alone is read.

#include <algorithm>
#include <array>
#include <string>

#include <olvane/gedcom/DateReadingInternal.h>

namespace olvane::gedcom {

namespace {

// Numbers between separators of one sort: "06.05.1900", "24/01/1915", "1915/1/24", "01/1915".
struct NumberGroups {
    std::array<int, 3> values{};
    std::array<std::size_t, 3> digits{};
    std::size_t count = 0;
    char separator = '\0';
};

std::optional<NumberGroups> readGroups(std::string_view word) {
    NumberGroups groups;
    while (groups.count < groups.values.size()) {
        std::size_t length = 0;
        while (length < word.size() && isDigit(word[length])) ++length;
        const auto number = wholeNumber(word.substr(0, length), 4);
        if (!number) return {};
        groups.values[groups.count] = *number;
        groups.digits[groups.count++] = length;
        word.remove_prefix(length);
        if (word.empty() || (word == "." && groups.count == 3)) break;
        if (!isSeparator(word.front()) || (groups.separator != '\0' && groups.separator != word.front()))
            return {};
        groups.separator = word.front();
        word.remove_prefix(1);
    }
    return word.size() <= 1 && groups.count >= 2 ? std::optional(groups) : std::nullopt;
}

// Points are set where the day comes first. Strokes are set in both orders, so the day comes first only where the other
// order is impossible; else, and where no order is possible, the year alone is certain. A 0 is written for what is not known.
bool readDayMonthYear(const NumberGroups& groups, ReadDate& result) {
    const auto [first, second, year] = groups.values;
    const bool secondIsMonth = second >= 1 && second <= 12;
    const bool either = groups.separator != '.' && first <= 12 && first != second;
    if (year == 0 || first > 31 || second > 31) return false;
    result.yearAlone = !secondIsMonth || either;
    result.date = result.yearAlone ? CalendarDate{year, 0, 0} : CalendarDate{year, second, first};
    if (!result.yearAlone) dropImpossibleDay(result);
    return true;
}

bool readNumericDate(std::string_view word, ReadDate& result) {
    const auto groups = readGroups(word);
    if (!groups) return false;
    const auto& values = groups->values;
    const auto& digits = groups->digits;
    if (groups->count == 2) {
        const bool isMonthAndYear =
            digits[0] <= 2 && digits[1] >= 3 && values[0] >= 1 && values[0] <= 12 && values[1] != 0;
        if (isMonthAndYear) result.date = {values[1], values[0], 0};
        return isMonthAndYear;
    }
    if (digits[0] <= 2 && digits[1] <= 2 && digits[2] >= 3) return readDayMonthYear(*groups, result);
    if (digits[0] < 3 || digits[1] > 2 || digits[2] > 2 || values[0] == 0 || values[1] < 1 || values[1] > 12)
        return false;
    result.date = {values[0], values[1], values[2]};
    dropImpossibleDay(result);
    return true;
}

}  // namespace

std::optional<int> wholeNumber(std::string_view digits, std::size_t longest) {
    if (digits.empty() || digits.size() > longest || !std::all_of(digits.begin(), digits.end(), isDigit))
        return {};
    int number = 0;
    for (const char c : digits) number = number * 10 + (c - '0');
    return number;
}

void dropImpossibleDay(ReadDate& result) {
    if (result.date.day < 1 ||
        result.date.day > daysInMonth(result.calendar, result.date.year, result.date.month)) {
        result.shortened = result.shortened || result.date.day != 0;
        result.date.day = 0;
    }
}

bool readIsoDate(std::string_view word, ReadDate& result) {
    const auto year = word.size() > 4 && word[4] == '-' ? wholeNumber(word.substr(0, 4), 4) : std::nullopt;
    const auto month = year ? wholeNumber(word.substr(5, 2), 2) : std::nullopt;
    if (!month || *month < 1 || *month > 12 || *year == 0) return false;
    result.date = {*year, *month, 0};
    if (word.size() == 7) return true;
    const auto day = word.size() == 10 && word[7] == '-' ? wholeNumber(word.substr(8, 2), 2) : std::nullopt;
    if (!day) return false;
    result.date.day = *day;
    dropImpossibleDay(result);
    return true;
}

bool takeNumericDate(WordScanner& words, ReadDate& result) {
    constexpr std::size_t kDayDigits = 2;
    const std::string_view word = words.peek();
    const bool mayHaveSeparator =
        isDigit(words.front()) && (word.size() > kDayDigits || isSeparator(word.back()));
    if (!mayHaveSeparator || std::none_of(word.begin(), word.end(), isSeparator)) return false;
    if (readNumericDate(words.peek(), result)) {
        words.skip();
        return true;
    }
    if (words.peek().back() != '.') return false;
    WordScanner ahead = words;
    std::string joined;
    for (int i = 0; i < 3 && joined.size() < 16; ++i, ahead.skip()) joined += ahead.peek();
    if (!readNumericDate(joined, result)) return false;
    words = ahead;
    return true;
}

}  // namespace olvane::gedcom
