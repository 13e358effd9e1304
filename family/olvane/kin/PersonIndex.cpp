// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// All words of all records, folded, with the persons behind each. A search looks at every different word once; real files
// have few, since names come again and again. Words stand as they came, so that persons can be added a few at a time.

#include <olvane/kin/PersonIndex.h>

#include <stdexcept>
#include <string>

#include <olvane/kin/Folding.h>
#include <olvane/kin/SearchWordsInternal.h>

namespace olvane::kin {

PersonIndex::PersonIndex(const Family& family) : PersonIndex(FamilySearchTexts(family)) {}

PersonIndex::PersonIndex(const SearchTexts& texts) {
    add(texts);
}

bool PersonIndex::add(const SearchTexts& texts, std::size_t most) {
    const std::size_t all = texts.personCount();
    if (all > kMostPersons) throw std::length_error("too many persons for an index");
    for (; added_ < all && most > 0; --most, ++added_) {
        const auto place = static_cast<std::uint32_t>(added_);
        if (ids_.size() == added_) ids_.push_back(texts.id(place));
        texts.visit(place, [this, place](const SearchText& text) { addText(text, place); });
    }
    return added_ >= all;
}

void PersonIndex::addText(const SearchText& text, std::uint32_t place) {
    if (text.isDate) return addYears(text, place);
    if (text.in != FoundIn::identifier) {
        forEachWord(text.text,
                    [&](std::string_view word, std::string_view) { addWord(word, text.in, place); });
    } else if (!text.text.empty()) {
        // The first of several persons of one xref.
        const std::uint32_t number = xrefs_.numberOf(foldedForSearch(text.text));
        if (number >= placeOfXref_.size()) placeOfXref_.resize(number + 1U, place);
    }
}

void PersonIndex::addYears(const SearchText& date, std::uint32_t place) {
    const YearRange years = yearsOf(date);
    if (years.first == 0) return;
    years_.push_back({place, date.in, years.first, years.last});
    addWord(std::to_string(years.first), date.in, place);
    if (years.last != years.first) addWord(std::to_string(years.last), date.in, place);
}

// A person is added at once, so an entry of theirs is a word's last.
void PersonIndex::addWord(std::string_view word, FoundIn in, std::uint32_t place) {
    const std::uint32_t number = words_.numberOf(word);
    if (number >= entries_.size()) entries_.resize(number + 1U);
    std::vector<Entry>& entries = entries_[number];
    if (entries.empty() || entries.back().person() != place) {
        entries.emplace_back(place, in);
    } else if (in < entries.back().in()) {
        entries.back() = Entry(place, in);
    }
}

}  // namespace olvane::kin
