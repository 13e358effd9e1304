// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/SearchWordsInternal.h>

#include <algorithm>
#include <charconv>
#include <cstddef>

namespace olvane::kin {

namespace {

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

}  // namespace

bool isNumber(std::string_view text) {
    return !text.empty() && std::all_of(text.begin(), text.end(), isDigit);
}

int yearOf(std::string_view digits) {
    int number = -1;
    std::from_chars(digits.data(), digits.data() + digits.size(), number);
    return number;
}

YearRange yearsOf(const SearchText& date) {
    YearRange years;
    const bool isBeforeChrist = !date.sorting.empty() && date.sorting.front() == '-';
    for (const std::string_view text : {isBeforeChrist ? std::string_view() : date.sorting, date.text}) {
        for (std::size_t at = 0; at < text.size();) {
            std::size_t end = at;
            while (end < text.size() && isDigit(text[end])) ++end;
            const std::string_view digits = text.substr(at, end - at);
            at = std::max(end, at + 1);
            if (digits.size() == 3 || digits.size() == 4) years.add(yearOf(digits));
        }
    }
    return years;
}

}  // namespace olvane::kin
