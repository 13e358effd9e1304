// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include <olvane/Export.h>
#include <olvane/kin/Family.h>
#include <olvane/kin/SearchTexts.h>

namespace olvane::kin {

// How a word of a search fits a word of the record. Better ones come first.
enum class Fit : std::uint8_t { whole, begins, within, similar };

// "whole", "begins" and so on, for programs.
OLVANE_API const char* nameOf(Fit fit);

struct SearchReason {
    FoundIn in = FoundIn::name;
    Fit fit = Fit::whole;
    std::string word;  // of the record, folded
};

struct SearchHit {
    std::int64_t id = 0;
    std::uint32_t place = 0;            // among the persons that the index was made of
    Fit fit = Fit::whole;               // of the word that fits least
    std::vector<SearchReason> reasons;  // one for each word of the search

    // All words stand in names, and each is one or begins one.
    bool isByName() const;
    // The text of the search is the xref or the number of this person.
    bool isByIdentifier() const { return reasons.front().in == FoundIn::identifier; }
};

// Finds persons by what a user types.
//
// A text is words in any order. A person is found if each word is found in the record: as a word, as the beginning of
// one, from its middle (three letters and more), or, where nobody is found so, with one letter wrong, missing, too
// many or exchanged with its neighbor (four letters and more; never digits). Case, accents and apostrophes do not
// count. "1819-1825" is any year of birth or death from the first to the last; "@I17@", "I17" and "17" are also the
// person of that xref or number, who comes first.
//
// Order: how well the words fit, and where; then the order of the persons. The same on every machine.
// Time: grows with the number of different words, and with how often those that fit occur.
// Threads: any number may search at a time.
// Lifetime: keeps nothing of the texts.
class OLVANE_API PersonIndex {
public:
    explicit PersonIndex(const SearchTexts& texts);
    explicit PersonIndex(const Family& family);

    std::vector<SearchHit> find(std::string_view text,
                                std::size_t limit = std::numeric_limits<std::size_t>::max()) const;

private:
    struct Entry {
        std::uint32_t person;  // counted from 0 in the order of the texts
        FoundIn in;
    };
    struct Years {
        std::uint32_t person;
        FoundIn in;
        int first;
        int last;
    };
    // The best that a word of the search has found in a person.
    struct Best {
        std::uint16_t cost = kNone;
        std::uint32_t word = 0;
    };
    struct Term;
    using BestOfPersons = std::vector<Best>;

    static constexpr std::uint16_t kNone = 0xFFFF;

    void add(const SearchText& text, std::uint32_t place);
    void addYears(const SearchText& date, std::uint32_t place);
    void addWord(std::uint32_t number, FoundIn in, std::uint32_t place);
    std::uint32_t numberOf(const std::string& word);
    const std::vector<std::uint32_t>& wordsOf(std::string_view text);
    void arrange();
    std::vector<Term> termsOf(std::string_view text) const;
    bool findTerm(const Term& term, bool findsSimilar, BestOfPersons& best) const;
    std::vector<SearchHit> findTerms(const std::vector<Term>& terms, bool findsSimilar,
                                     std::size_t limit) const;
    // The place, or kNobodyHere.
    std::uint32_t findIdentifier(std::string_view text) const;

    static constexpr std::uint32_t kNobodyHere = 0xFFFFFFFF;

    std::vector<std::int64_t> ids_;
    std::unordered_map<std::string, std::uint32_t> placeOfXref_;
    // Emptied once the words are in order. Names and places come again and again, so each is cut into words once.
    std::unordered_map<std::string, std::uint32_t> wordNumbers_;
    std::unordered_map<std::string, std::vector<std::uint32_t>> wordsOfTexts_;
    std::vector<std::string> words_;           // sorted
    std::vector<std::vector<Entry>> entries_;  // of each word
    std::vector<Years> years_;
};

// What stands in the record where a word of a search was found.
struct WrittenReason {
    std::string text;   // "Kew, Surrey, England"; empty for an identifier
    std::string word;   // the word of it that was found, "Surrey"; of a date the whole
    std::string label;  // as in SearchText
};

// Reads the record of a hit again. texts are those that the index was made of.
OLVANE_API WrittenReason writtenReason(const SearchTexts& texts, const SearchHit& hit,
                                       const SearchReason& reason);

}  // namespace olvane::kin
