// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// All words of all records, folded, with the persons behind each. A search looks at every different word once; real files
// have few, since names come again and again. Words stand as they came, so that persons can be added a few at a time.

#include <olvane/kin/PersonIndex.h>

#include <algorithm>
#include <array>
#include <charconv>
#include <optional>
#include <stdexcept>

#include <olvane/kin/Folding.h>

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

constexpr std::size_t kMostLetterBytes = 4;

bool beginsLetter(char c) {
    return (static_cast<unsigned char>(c) & 0xC0U) != 0x80U;
}

// Whether the text is whole letters from there on.
bool isBetweenLetters(std::string_view text, std::size_t at) {
    return at >= text.size() || beginsLetter(text[at]);
}

bool isAtMostOneLetter(std::string_view text) {
    return std::count_if(text.begin(), text.end(), beginsLetter) <= 1;
}

// Whether the texts are two letters that have changed places.
bool areExchanged(std::string_view one, std::string_view other) {
    if (one.size() != other.size()) return false;
    std::size_t first = 1;
    while (first < one.size() && !beginsLetter(one[first])) ++first;
    return isAtMostOneLetter(one.substr(first)) && other.ends_with(one.substr(0, first)) &&
           other.starts_with(one.substr(first));
}

// One letter wrong, missing, too many, or exchanged with its neighbor. Letters beyond ASCII have several bytes; only
// whole ones are alike.
bool isSimilar(std::string_view one, std::string_view other) {
    const std::size_t shorter = std::min(one.size(), other.size());
    std::size_t front = 0;
    while (front < shorter && one[front] == other[front]) ++front;
    while (front > 0 && !(isBetweenLetters(one, front) && isBetweenLetters(other, front))) --front;
    std::size_t back = 0;
    while (back < shorter - front && one[one.size() - 1 - back] == other[other.size() - 1 - back]) ++back;
    while (back > 0 && !beginsLetter(one[one.size() - back])) --back;
    one = one.substr(front, one.size() - front - back);
    other = other.substr(front, other.size() - front - back);
    return (isAtMostOneLetter(one) && isAtMostOneLetter(other)) || areExchanged(one, other);
}

bool canBeWithin(std::string_view term) {
    return term.size() >= kShortestWithin && !isNumber(term);
}

bool canBeSimilar(std::string_view term) {
    return term.size() >= kShortestSimilar && !isNumber(term);
}

// Looks for words with one slip in them. Of three letters and more a slip leaves the first as it was, or the last.
class SlipFinder {
public:
    explicit SlipFinder(std::string_view term)
        : term_(term), isLong_(std::count_if(term.begin(), term.end(), beginsLetter) >= 3) {}

    bool fits(std::string_view word) const {
        const std::size_t longer = std::max(word.size(), term_.size());
        if (longer - std::min(word.size(), term_.size()) > kMostLetterBytes) return false;
        if (isLong_ && word.front() != term_.front() && word.back() != term_.back()) return false;
        return isSimilar(word, term_);
    }

private:
    std::string_view term_;
    bool isLong_;
};

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
        found = {std::string(text.text), std::string(word), std::string(text.label)};
    });
    return found;
}

}  // namespace olvane::kin
