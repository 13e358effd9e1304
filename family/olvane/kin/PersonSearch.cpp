// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A search in the index: its text becomes terms; each offers every person the best word that fits it; who has one for every
// term is found, and those whose words fit best come first.

#include <olvane/kin/PersonIndex.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <string>
#include <utility>

#include <olvane/kin/Folding.h>
#include <olvane/kin/SearchWordsInternal.h>
#include <olvane/kin/SlipFinderInternal.h>

namespace olvane::kin {

namespace {

constexpr std::size_t kShortestWithin = 3;
constexpr std::size_t kShortestSimilar = 4;
constexpr std::size_t kMostTerms = 32;
constexpr std::uint16_t kCostOfFit = 16;

std::uint16_t costOf(Fit fit, FoundIn in) {
    return static_cast<std::uint16_t>(static_cast<unsigned>(fit) * kCostOfFit + static_cast<unsigned>(in));
}

std::string_view trimmed(std::string_view text) {
    while (!text.empty() && text.front() == ' ') text.remove_prefix(1);
    while (!text.empty() && text.back() == ' ') text.remove_suffix(1);
    return text;
}

bool canBeWithin(std::string_view term) {
    return term.size() >= kShortestWithin && !isNumber(term);
}

bool canBeSimilar(std::string_view term) {
    return term.size() >= kShortestSimilar && !isNumber(term);
}

}  // namespace

// A word of the search, or years from one to another.
struct PersonIndex::Term {
    std::string word;
    int firstYear = 0;  // 0 where it is no year
    int lastYear = 0;
};

const char* nameOf(Fit fit) {
    constexpr std::array kNames{"whole", "begins", "within", "similar"};
    return kNames[static_cast<std::size_t>(fit)];
}

bool SearchHit::isByName() const {
    return std::all_of(reasons.begin(), reasons.end(), [](const SearchReason& reason) {
        const bool isName =
            reason.in == FoundIn::name || reason.in == FoundIn::nickname || reason.in == FoundIn::title;
        return isName && reason.fit <= Fit::begins;
    });
}

// "1819-1825" and "1819–1825" are one term.
std::vector<PersonIndex::Term> PersonIndex::termsOf(std::string_view text) {
    std::vector<Term> terms;
    for (const FoldedWord& word : foldedWords(text)) {
        const bool isYear = isNumber(word.folded) && word.folded.size() <= 4;
        if (isYear && !terms.empty() && terms.back().firstYear != 0) {
            Term& before = terms.back();
            const char* const end = word.written.data();
            const std::size_t start = static_cast<std::size_t>(end - text.data());
            const std::string_view prefix = text.substr(0, start);
            const bool isRange = before.firstYear == before.lastYear &&
                                 (prefix.ends_with("-") || prefix.ends_with("\u2013")) &&
                                 !prefix.ends_with(" -");
            if (isRange) {
                before.lastYear = yearOf(word.folded);
                if (before.lastYear < before.firstYear) std::swap(before.firstYear, before.lastYear);
                before.word += "-" + word.folded;
                continue;
            }
        }
        dropRepeated(terms);
        if (terms.size() == kMostTerms) return terms;
        const int year = isYear ? yearOf(word.folded) : 0;
        terms.push_back({word.folded, year, year});
    }
    dropRepeated(terms);
    return terms;
}

// The last one, where an earlier one is the same: it is complete only when the next one begins.
void PersonIndex::dropRepeated(std::vector<Term>& terms) {
    if (terms.empty()) return;
    const auto isSame = [&terms](const Term& term) { return term.word == terms.back().word; };
    if (std::any_of(terms.begin(), terms.end() - 1, isSame)) terms.pop_back();
}

// Of words that fit as well and stand in the same place, the first by the alphabet is the reason; a year before all words.
bool PersonIndex::isBetter(const Best& one, const Best& other) const {
    if (one.cost != other.cost) return one.cost < other.cost;
    return one.word != other.word && other.word != kYear && words_[one.word] < words_[other.word];
}

bool PersonIndex::offerWord(std::uint32_t word, Fit fit, BestOfPersons& best) const {
    if (word >= entries_.size()) return false;  // memory ran out behind its text
    const std::vector<Entry>& entries = entries_[word];
    for (const Entry entry : entries) {
        const Best offered{costOf(fit, entry.in()), word};
        if (isBetter(offered, best[entry.person()])) best[entry.person()] = offered;
    }
    return !entries.empty();
}

bool PersonIndex::findYears(const Term& term, BestOfPersons& best) const {
    bool found = false;
    for (const Years& years : years_) {
        if (years.first > term.lastYear || years.last < term.firstYear) continue;
        const Best offered{costOf(Fit::whole, years.in), kYear};
        if (isBetter(offered, best[years.person])) best[years.person] = offered;
        found = true;
    }
    return found;
}

// Whole, from the beginning, or from the middle.
bool PersonIndex::findPart(std::string_view part, BestOfPersons& best) const {
    bool found = false;
    const auto use = [&](std::uint32_t word) {
        const std::string_view text = words_[word];
        const Fit fit = !text.starts_with(part)      ? Fit::within
                        : text.size() == part.size() ? Fit::whole
                                                     : Fit::begins;
        found |= offerWord(word, fit, best);
    };
    if (canBeWithin(part)) {
        words_.visitHolding(part, use);
    } else {
        words_.visitBeginning(part, use);
    }
    return found;
}

bool PersonIndex::findSlips(std::string_view term, BestOfPersons& best) const {
    const SlipFinder slips(term);
    bool found = false;
    for (std::uint32_t word = 0; word < entries_.size(); ++word) {
        if (slips.fits(words_[word])) found |= offerWord(word, Fit::similar, best);
    }
    return found;
}

// Answers whether anybody was found, as all these do.
bool PersonIndex::findTerm(const Term& term, bool findsSimilar, BestOfPersons& best) const {
    bool found = term.firstYear != 0 && findYears(term, best);
    if (term.firstYear != term.lastYear) return found;
    found |= findPart(term.word, best);
    if (findsSimilar && canBeSimilar(term.word)) found |= findSlips(term.word, best);
    return found;
}

std::vector<SearchHit> PersonIndex::findTerms(const std::vector<Term>& terms, bool findsSimilar,
                                              std::size_t limit) const {
    std::vector<BestOfPersons> best(terms.size(), BestOfPersons(ids_.size()));
    for (std::size_t i = 0; i < terms.size(); ++i) {
        if (!findTerm(terms[i], findsSimilar, best[i])) return {};
    }
    std::vector<std::pair<unsigned, std::uint32_t>> order;
    for (std::uint32_t person = 0; person < ids_.size(); ++person) {
        unsigned cost = 0;
        bool isFound = true;
        for (const BestOfPersons& each : best) {
            isFound = isFound && each[person].cost != kNone;
            cost += each[person].cost;
        }
        if (isFound) order.emplace_back(cost, person);
    }
    const std::size_t count = std::min(limit, order.size());
    std::partial_sort(order.begin(), order.begin() + static_cast<std::ptrdiff_t>(count), order.end());
    std::vector<SearchHit> hits(count);
    for (std::size_t i = 0; i < count; ++i) {
        const std::uint32_t person = order[i].second;
        hits[i].id = ids_[person];
        hits[i].place = person;
        for (std::size_t term = 0; term < terms.size(); ++term) {
            const Best& each = best[term][person];
            const auto fit = static_cast<Fit>(each.cost / kCostOfFit);
            hits[i].fit = std::max(hits[i].fit, fit);
            hits[i].reasons.push_back(
                {static_cast<FoundIn>(each.cost % kCostOfFit), fit,
                 std::string(each.word != kYear ? words_[each.word] : terms[term].word)});
        }
    }
    return hits;
}

std::uint32_t PersonIndex::findIdentifier(std::string_view text) const {
    std::string_view xref = trimmed(text);
    if (xref.size() > 2 && xref.front() == '@' && xref.back() == '@') xref = xref.substr(1, xref.size() - 2);
    const std::uint32_t known = xrefs_.find(foldedForSearch(xref));
    if (known < placeOfXref_.size()) return placeOfXref_[known];
    if (!isNumber(xref) || xref.size() > 10) return kNobodyHere;
    std::int64_t number = 0;
    std::from_chars(xref.data(), xref.data() + xref.size(), number);
    const auto id = std::find(ids_.begin(), ids_.end(), number);
    return id != ids_.end() ? static_cast<std::uint32_t>(id - ids_.begin()) : kNobodyHere;
}

std::vector<SearchHit> PersonIndex::find(std::string_view text, std::size_t limit) const {
    std::vector<SearchHit> hits;
    if (limit == 0) return hits;
    const std::uint32_t byIdentifier = findIdentifier(text);
    if (byIdentifier != kNobodyHere) {
        const SearchReason reason{FoundIn::identifier, Fit::whole, std::string(trimmed(text))};
        hits.push_back({ids_[byIdentifier], byIdentifier, Fit::whole, {reason}});
    }
    const std::vector<Term> terms = termsOf(text);
    if (terms.empty()) return hits;
    std::vector<SearchHit> byWords = findTerms(terms, false, limit);
    const auto mayBeSimilar = [](const Term& term) { return canBeSimilar(term.word); };
    if (byWords.empty() && hits.empty() && std::any_of(terms.begin(), terms.end(), mayBeSimilar))
        byWords = findTerms(terms, true, limit);
    for (SearchHit& hit : byWords) {
        if (hits.size() < limit && hit.place != byIdentifier) hits.push_back(std::move(hit));
    }
    return hits;
}

}  // namespace olvane::kin
