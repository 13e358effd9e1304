// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// All words of all records, folded and sorted, with the persons behind each. A search looks at every different word
// once; real files have few, since names come again and again.

#include <olvane/kin/PersonIndex.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <numeric>

#include <olvane/kin/Folding.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::kin {

namespace {

constexpr std::size_t kShortestWithin = 3;
constexpr std::size_t kShortestSimilar = 4;
constexpr std::size_t kMostTerms = 32;
constexpr std::uint16_t kCostOfFit = 16;

std::uint16_t costOf(Fit fit, FoundIn in) {
    return static_cast<std::uint16_t>(static_cast<unsigned>(fit) * kCostOfFit + static_cast<unsigned>(in));
}

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

bool isNumber(std::string_view text) {
    return !text.empty() && std::all_of(text.begin(), text.end(), isDigit);
}

int yearOf(std::string_view digits) {
    int number = -1;
    std::from_chars(digits.data(), digits.data() + digits.size(), number);
    return number;
}

std::string_view trimmed(std::string_view text) {
    while (!text.empty() && text.front() == ' ') text.remove_prefix(1);
    while (!text.empty() && text.back() == ' ') text.remove_suffix(1);
    return text;
}

// One letter wrong, missing, too many, or exchanged with its neighbor. Letters beyond ASCII have several bytes; a
// wrong one may differ in all of them.
bool isSimilar(std::string_view one, std::string_view other) {
    while (!one.empty() && !other.empty() && one.front() == other.front()) {
        one.remove_prefix(1);
        other.remove_prefix(1);
    }
    while (!one.empty() && !other.empty() && one.back() == other.back()) {
        one.remove_suffix(1);
        other.remove_suffix(1);
    }
    const auto isOneLetter = [](std::string_view text) {
        const auto starts = std::count_if(text.begin(), text.end(), [](char c) {
            return (static_cast<unsigned char>(c) & 0xC0U) != 0x80U;
        });
        return starts <= 1;
    };
    if (isOneLetter(one) && isOneLetter(other)) return true;
    return one.size() == 2 && other.size() == 2 && one[0] == other[1] && one[1] == other[0];
}

Fit fitOf(std::string_view word, std::string_view term, bool findsSimilar, bool& fits) {
    const std::size_t at = word.find(term);
    fits = at == 0 || (at != std::string_view::npos && term.size() >= kShortestWithin && !isNumber(term));
    if (fits) return at > 0 ? Fit::within : word.size() == term.size() ? Fit::whole : Fit::begins;
    if (!findsSimilar || term.size() < kShortestSimilar || isNumber(term)) return Fit::similar;
    const std::size_t difference = std::max(word.size(), term.size()) - std::min(word.size(), term.size());
    fits = difference <= 3 && isSimilar(word, term);
    return Fit::similar;
}

// The first and the last of all numbers of three and four digits, in both forms of a date; 0 where there is none.
struct YearRange {
    int first = 0;
    int last = 0;

    void add(int year) {
        if (year == 0) return;
        first = first == 0 ? year : std::min(first, year);
        last = std::max(last, year);
    }
};

YearRange yearsOf(const SearchText& date) {
    YearRange years;
    const bool isBeforeChrist = !date.sorting.empty() && date.sorting.front() == '-';
    for (const std::string_view text : {isBeforeChrist ? std::string_view() : date.sorting, date.text}) {
        for (std::size_t at = 0; at < text.size();) {
            std::size_t end = at;
            while (end < text.size() && isDigit(text[end])) ++end;
            const std::string_view digits = text.substr(at, end - at);
            at = std::max(end, at + 1);
            if (digits.size() == 3 || digits.size() == 4) years.add(yearOf(digits));
        }
    }
    return years;
}

// Calls use(folded, written) with each word of a text. A word with an apostrophe is found without it, and by what stands
// behind it.
template <class Use>
void forEachWord(std::string_view text, const Use& use) {
    for (const FoldedWord& word : foldedWords(text)) {
        use(word.folded, word.written);
        for (const char* const apostrophe : {"'", "\u2019"}) {
            const std::size_t at = word.written.find(apostrophe);
            if (at == std::string_view::npos) continue;
            const std::string_view written = word.written.substr(at + std::string_view(apostrophe).size());
            const std::string behind = foldedForSearch(written);
            if (!behind.empty()) use(behind, written);
        }
    }
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

PersonIndex::PersonIndex(const Family& family) : PersonIndex(FamilySearchTexts(family)) {}

PersonIndex::PersonIndex(const SearchTexts& texts) {
    const std::size_t count = texts.personCount();
    ids_.reserve(count);
    for (std::uint32_t place = 0; place < count; ++place) {
        ids_.push_back(texts.id(place));
        texts.visit(place, [this, place](const SearchText& text) { add(text, place); });
    }
    arrange();
}

void PersonIndex::add(const SearchText& text, std::uint32_t place) {
    if (text.isDate) return addYears(text, place);
    if (text.in == FoundIn::identifier) {
        if (!text.text.empty()) placeOfXref_.emplace(foldedForSearch(text.text), place);
        return;
    }
    for (const std::uint32_t number : wordsOf(text.text)) addWord(number, text.in, place);
}

void PersonIndex::addYears(const SearchText& date, std::uint32_t place) {
    const YearRange years = yearsOf(date);
    if (years.first == 0) return;
    years_.push_back({place, date.in, years.first, years.last});
    addWord(numberOf(std::to_string(years.first)), date.in, place);
    if (years.last != years.first) addWord(numberOf(std::to_string(years.last)), date.in, place);
}

const std::vector<std::uint32_t>& PersonIndex::wordsOf(std::string_view text) {
    const auto [found, isNew] = wordsOfTexts_.try_emplace(std::string(text));
    std::vector<std::uint32_t>& numbers = found->second;
    if (isNew) {
        forEachWord(text,
                    [&](const std::string& word, std::string_view) { numbers.push_back(numberOf(word)); });
    }
    return numbers;
}

std::uint32_t PersonIndex::numberOf(const std::string& word) {
    const auto [found, isNew] = wordNumbers_.emplace(word, static_cast<std::uint32_t>(words_.size()));
    if (isNew) {
        words_.push_back(word);
        entries_.emplace_back();
    }
    return found->second;
}

void PersonIndex::addWord(std::uint32_t number, FoundIn in, std::uint32_t place) {
    std::vector<Entry>& entries = entries_[number];
    if (!entries.empty() && entries.back().person == place) {
        entries.back().in = std::min(entries.back().in, in);
    } else {
        entries.push_back({place, in});
    }
}

void PersonIndex::arrange() {
    std::vector<std::uint32_t> order(words_.size());
    std::iota(order.begin(), order.end(), 0U);
    mergeSort(order.begin(), order.end(),
              [this](std::uint32_t one, std::uint32_t other) { return words_[one] < words_[other]; });
    std::vector<std::string> words;
    std::vector<std::vector<Entry>> entries;
    words.reserve(order.size());
    entries.reserve(order.size());
    for (const std::uint32_t number : order) {
        words.push_back(std::move(words_[number]));
        entries.push_back(std::move(entries_[number]));
    }
    words_ = std::move(words);
    entries_ = std::move(entries);
    wordNumbers_ = {};
    wordsOfTexts_ = {};
}

// "1819-1825" and "1819–1825" are one term.
std::vector<PersonIndex::Term> PersonIndex::termsOf(std::string_view text) const {
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
        const int year = isYear ? yearOf(word.folded) : 0;
        const auto isSame = [&word](const Term& term) { return term.word == word.folded; };
        if (std::none_of(terms.begin(), terms.end(), isSame)) terms.push_back({word.folded, year, year});
        if (terms.size() == kMostTerms) break;
    }
    return terms;
}

// Answers whether anybody was found.
bool PersonIndex::findTerm(const Term& term, bool findsSimilar, BestOfPersons& best) const {
    bool found = false;
    const auto offer = [&best, &found](std::uint32_t person, Fit fit, FoundIn in, std::uint32_t word) {
        const std::uint16_t cost = costOf(fit, in);
        if (cost < best[person].cost) best[person] = {cost, word};
        found = true;
    };
    if (term.firstYear != 0) {
        for (const Years& years : years_) {
            if (years.first <= term.lastYear && years.last >= term.firstYear)
                offer(years.person, Fit::whole, years.in, static_cast<std::uint32_t>(words_.size()));
        }
        if (term.lastYear != term.firstYear) return found;
    }
    for (std::uint32_t word = 0; word < words_.size(); ++word) {
        bool fits = false;
        const Fit fit = fitOf(words_[word], term.word, findsSimilar, fits);
        if (!fits) continue;
        for (const Entry& entry : entries_[word]) offer(entry.person, fit, entry.in, word);
    }
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
            hits[i].reasons.push_back({static_cast<FoundIn>(each.cost % kCostOfFit), fit,
                                       each.word < words_.size() ? words_[each.word] : terms[term].word});
        }
    }
    return hits;
}

std::uint32_t PersonIndex::findIdentifier(std::string_view text) const {
    std::string_view xref = trimmed(text);
    if (xref.size() > 2 && xref.front() == '@' && xref.back() == '@') xref = xref.substr(1, xref.size() - 2);
    const auto found = placeOfXref_.find(foldedForSearch(xref));
    if (found != placeOfXref_.end()) return found->second;
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
    if (byWords.empty() && hits.empty()) byWords = findTerms(terms, true, limit);
    for (SearchHit& hit : byWords) {
        if (hits.size() < limit && hit.place != byIdentifier) hits.push_back(std::move(hit));
    }
    return hits;
}

namespace {

// The word of a text, as it is written, that a reason has found; empty where it is another text.
std::string_view foundWord(const SearchText& text, const SearchReason& reason) {
    std::string_view found;
    forEachWord(text.text, [&](const std::string& word, std::string_view written) {
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
        found = {std::string(text.text), std::string(word), std::string(text.label)};
    });
    return found;
}

}  // namespace olvane::kin
