// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstddef>
#include <string>
#include <string_view>

#include <olvane/kin/Folding.h>
#include <olvane/kin/SearchTexts.h>

namespace olvane::kin {

// The first and the last of some years; 0 where there is none.
struct YearRange {
    int first = 0;
    int last = 0;

    void add(int year) {
        if (year == 0) return;
        first = first == 0 ? year : std::min(first, year);
        last = std::max(last, year);
    }
};

// The years of a date: all numbers of three and four digits, in both of its forms. Of a date before Christ only the text
// counts.
YearRange yearsOf(const SearchText& date);

bool isNumber(std::string_view text);

// Of digits; -1 where they are none, or too many.
int yearOf(std::string_view digits);

// Calls use(folded, written) with each word of a text. A word with an apostrophe is found without it, and by what stands
// behind it.
template <class Use>
void forEachWord(std::string_view text, const Use& use) {
    visitFoldedWords(text, [&use](std::string_view written, std::string_view folded) {
        use(folded, written);
        for (const std::string_view apostrophe : {"'", "\u2019"}) {
            const std::size_t at = written.find(apostrophe);
            if (at == std::string_view::npos) continue;
            const std::string_view rest = written.substr(at + apostrophe.size());
            const std::string behind = foldedForSearch(rest);
            if (!behind.empty()) use(behind, rest);
        }
    });
}

}  // namespace olvane::kin
