// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A record is read again for the one text that a search has found: it is cheaper than an index that has every text.

#include <string>
#include <string_view>

#include <olvane/kin/PersonIndex.h>
#include <olvane/kin/SearchWordsInternal.h>

namespace olvane::kin {

namespace {

// The word of a text, as it is written, that a reason has found; empty where it is another text.
std::string_view foundWord(const SearchText& text, const SearchReason& reason) {
    std::string_view found;
    forEachWord(text.text, [&](std::string_view word, std::string_view written) {
        if (found.empty() && word == reason.word) found = written;
    });
    return found;
}

bool holdsYears(const SearchText& date, const YearRange& wanted) {
    const YearRange years = yearsOf(date);
    return years.first != 0 && wanted.first != 0 && years.first <= wanted.last && years.last >= wanted.first;
}

}  // namespace

WrittenReason writtenReason(const SearchTexts& texts, const SearchHit& hit, const SearchReason& reason) {
    const YearRange wanted = yearsOf({reason.in, reason.word, {}, true, {}});
    WrittenReason found;
    texts.visit(hit.place, [&](const SearchText& text) {
        if (!found.text.empty() || text.in != reason.in || text.in == FoundIn::identifier) return;
        const std::string_view word = text.isDate ? text.text : foundWord(text, reason);
        if (word.empty() || (text.isDate && !holdsYears(text, wanted))) return;
        found = {std::string(text.text), std::string(word), std::string(text.label), text.isDate};
    });
    return found;
}

}  // namespace olvane::kin
