// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace olvane::gedcom {

// How well bytes fit ANSEL, in which a mark stands before the letter that it belongs to.
struct AnselCensus {
    std::size_t fitting = 0;   // single characters, and marks before a letter that has them
    std::size_t doubtful = 0;  // marks within a word before a letter that has none such in Unicode
    std::size_t impossible =
        0;  // bytes that are no ANSEL, marks before what is no letter, three marks in a row
};

AnselCensus takeAnselCensus(std::string_view bytes);

// The text in Unicode with marks behind their letters, not yet composed. Bytes that are no ANSEL become
// U+FFFD and are counted in faults.
std::string decodeAnsel(std::string_view bytes, std::size_t& faults);

}  // namespace olvane::gedcom
