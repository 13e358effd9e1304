// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <string_view>

#include <olvane/gedcom/WrittenDateInternal.h>

namespace olvane::gedcom {

// Everything that a language says about dates. Lists have a bar between their words: an object for each word would be larger
// than the words, in a module for browsers.
struct DateLanguage {
    std::string_view code;  // "de"
    std::string_view months;
    std::string_view frenchMonths;
    std::string_view hebrewMonths;
    std::string_view behindDay;     // up to the month
    std::string_view beforeChrist;  // behind the year
    std::string_view julian;        // behind the date
    std::string_view frenchYear;    // before a year of the Republic alone
    // What stands before a date in the order of DateForm: one that is a day, and one that is a month or a year. German says
    // "vor dem 12. Feb. 1809", and "vor 1809". Then what stands between two dates, of between and of lasting.
    std::string_view beforeDay;
    std::string_view beforeOther;
    std::string_view joinsDay;
    std::string_view joinsOther;
    std::string_view born;  // before a date
    std::string_view died;
};

constexpr std::size_t kDateLanguages = 3;
extern const std::array<DateLanguage, kDateLanguages> kAllDateLanguages;

// A word of such a list, from 0; empty where there is none.
std::string_view wordIn(std::string_view list, std::size_t place);

// By the beginning of a code such as "de-AT"; English for a language that has none.
const DateLanguage& dateLanguageOf(std::string_view code);

}  // namespace olvane::gedcom
