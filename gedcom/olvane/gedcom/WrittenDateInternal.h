// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <string_view>

#include <olvane/gedcom/DateReadingInternal.h>

namespace olvane::gedcom {

// What a DATE value says of its dates.
enum class DateForm : unsigned char {
    exact,
    about,
    calculated,
    estimated,
    before,
    after,
    between,
    since,  // FROM alone
    until,  // TO alone
    lasting,
};

constexpr std::size_t kDateForms = static_cast<std::size_t>(DateForm::lasting) + 1;

// A DATE value as it is written, each date in its own calendar.
//
// Holds: between and lasting, and no others, have a last date. A value with a beginning alone of what is between two dates
//        is after it.
// Lifetime: phrase is a view into the value.
struct WrittenDate {
    DateForm form = DateForm::exact;
    ReadDate first;
    std::optional<ReadDate> last;
    std::string_view phrase;  // with its brackets; empty for none
    bool isWhole = true;      // all of the value was read
};

// Empty for a value that is no date.
std::optional<WrittenDate> readWrittenDate(std::string_view text);

}  // namespace olvane::gedcom
