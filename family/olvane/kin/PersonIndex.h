// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/Export.h>
#include <olvane/kin/Family.h>
#include <olvane/kin/SearchTexts.h>
#include <olvane/kin/detail/TextNumbers.h>

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
// one, from its middle (three letters and more; fewer of those beyond ASCII), or, where nobody is found so, with one
// letter wrong, missing, too many or exchanged with its neighbor (four letters and more; never digits). Case, accents
// and apostrophes do not count. "1819-1825" is any year of birth or death from the first to the last; "@I17@", "I17" and "17" are also the
// person of that xref or number, who comes first.
//
// Order: how well the words fit, and where; then the order of the persons. The same on every machine.
// Time: grows with the number of different words, and with how often those that fit occur.
// Threads: any number may search at a time, while nobody adds.
// Lifetime: keeps nothing of the texts.
// Fails: std::length_error for more than 2^28 persons; std::bad_alloc. add may be called again then.
class OLVANE_API PersonIndex {
public:
    static constexpr std::size_t kEverybody = std::numeric_limits<std::size_t>::max();

    // Of nobody yet.
    PersonIndex() = default;
    explicit PersonIndex(const SearchTexts& texts);
    explicit PersonIndex(const Family& family);

    // Adds the next persons, at most that many, for a program that has other things to do in between. True where all of
    // the texts are in; until then a search finds those who are. texts are the same each time.
    bool add(const SearchTexts& texts, std::size_t most = kEverybody);

    std::vector<SearchHit> find(std::string_view text, std::size_t limit = kEverybody) const;

private:
    // A person, counted from 0 in the order of the texts, and where in the record a word stands.
    class Entry {
    public:
        Entry(std::uint32_t person, FoundIn in)
            : packed_(person << kInBits | static_cast<std::uint32_t>(in)) {}
        std::uint32_t person() const { return packed_ >> kInBits; }
        FoundIn in() const { return static_cast<FoundIn>(packed_ & ((1U << kInBits) - 1)); }

    private:
        std::uint32_t packed_;
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
    static constexpr std::uint32_t kYear = 0xFFFFFFFF;  // in the place of a word
    static constexpr unsigned kInBits = 4;
    static constexpr std::uint32_t kMostPersons = 1U << (32 - kInBits);

    void addText(const SearchText& text, std::uint32_t place);
    void addYears(const SearchText& date, std::uint32_t place);
    void addWord(std::string_view word, FoundIn in, std::uint32_t place);
    static std::vector<Term> termsOf(std::string_view text);
    static void dropRepeated(std::vector<Term>& terms);
    bool isBetter(const Best& one, const Best& other) const;
    bool offerWord(std::uint32_t word, Fit fit, BestOfPersons& best) const;
    bool findYears(const Term& term, BestOfPersons& best) const;
    bool findPart(std::string_view part, BestOfPersons& best) const;
    bool findSlips(std::string_view term, BestOfPersons& best) const;
    bool findTerm(const Term& term, bool findsSimilar, BestOfPersons& best) const;
    std::vector<SearchHit> findTerms(const std::vector<Term>& terms, bool findsSimilar,
                                     std::size_t limit) const;
    // The place, or kNobodyHere.
    std::uint32_t findIdentifier(std::string_view text) const;

    static constexpr std::uint32_t kNobodyHere = 0xFFFFFFFF;

    std::size_t added_ = 0;  // persons, each with all texts; where memory ran out, ids_ has one more
    std::vector<std::int64_t> ids_;
    TextNumbers xrefs_;
    std::vector<std::uint32_t> placeOfXref_;  // of each of them; where memory ran out, of all but one
    TextNumbers words_;
    std::vector<std::vector<Entry>> entries_;  // of each word; where memory ran out, of all but one
    std::vector<Years> years_;
};

// What stands in the record where a word of a search was found.
struct WrittenReason {
    std::string text;   // "Kew, Surrey, England"; empty for an identifier
    std::string word;   // the word of it that was found, "Surrey"; of a date the whole
    std::string label;  // as in SearchText
    bool isDate = false;
};

// Reads the record of a hit again. texts are those that the index was made of.
OLVANE_API WrittenReason writtenReason(const SearchTexts& texts, const SearchHit& hit,
                                       const SearchReason& reason);

}  // namespace olvane::kin
