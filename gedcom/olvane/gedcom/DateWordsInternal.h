// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <initializer_list>
#include <string_view>

namespace olvane::gedcom {

// A word of a date in capitals without accents: "févr." is FEVR. Points, commas and hyphens at its end are left out;
// words that are longer than any known one are empty.
class DateWord {
public:
    explicit DateWord(std::string_view raw);

    std::string_view text() const { return {letters_.data(), length_}; }
    bool isOneOf(std::initializer_list<std::string_view> choices) const;

private:
    static constexpr std::size_t kLongest = 16;

    std::array<char, kLongest> letters_{};
    std::size_t length_ = 0;
};

// 1 to 12 for a month's name or abbreviation in English, French, German, Dutch, Spanish, Italian, Portuguese, Polish,
// Swedish, Norwegian, Danish or Finnish; 0 for anything else.
int monthNamed(const DateWord& word);

// Whether the word is a weekday's name or abbreviation in one of these languages. MAR is also March.
bool isWeekday(const DateWord& word);

// An era at the end of a year.
enum class Era : unsigned char { none, beforeChrist, afterChrist };

// The era that letters stand for, without the points and spaces between them: BC, BCE, VCHR, AVJC, AD, NCHR.
Era eraNamed(std::string_view letters);

}  // namespace olvane::gedcom
