// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Names in free text. Each person gives a few pairs of a given word and a surname word; a text is cut into words, those
// that are anybody's given word or surname are picked out, and pairs of them are looked up. Words are what letters and
// digits make between anything else; a run of a script that is written without spaces gives all its short pieces.

#include <olvane/gedcom/NameFinderInternal.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <span>
#include <string>
#include <utility>

#include <olvane/gedcom/UnicodeTextInternal.h>

namespace olvane::gedcom {
namespace {

using Hashes = std::vector<std::uint64_t>;

// Of each person, and of each as a spouse, so that neither a name of a million words nor a million names take long.
constexpr std::size_t kMostWords = 8;
constexpr std::size_t kMostNames = 8;
constexpr std::size_t kMostBytes = 256;
// A text in which more pairs could be met is a list of people.
constexpr std::size_t kMostPairs = 4096;
// Characters; a name of four syllables in Hangul, taken apart, has that many.
constexpr std::size_t kLongestPiece = 12;

constexpr std::uint64_t kHashStart = 14695981039346656037U;

// Fowler, Noll and Vo's hash, 1a.
std::uint64_t hashed(std::string_view word) {
    std::uint64_t hash = kHashStart;
    for (const char c : word) hash = (hash ^ static_cast<unsigned char>(c)) * 1099511628211U;
    return hash;
}

std::uint64_t pairOf(std::uint64_t given, std::uint64_t surname) {
    return (given ^ (surname >> 29)) * 0x9E3779B97F4A7C15U + surname;
}

enum class Sort { parting, spaced, unspaced };

bool isAsciiLetterOrDigit(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9');
}

// By the first two bytes: signs of Latin-1, general punctuation and that of East Asia part words; Hangul's letters, and
// all from kana and Han to Hangul's syllables, and what lies beyond U+20000, are written without spaces.
Sort sortOf(std::string_view character) {
    const auto first = static_cast<unsigned char>(character[0]);
    if (character.size() == 1) return isAsciiLetterOrDigit(character[0]) ? Sort::spaced : Sort::parting;
    const auto second = static_cast<unsigned char>(character[1]);
    if (first == 0xC2) return Sort::parting;
    if (first == 0xE2 && (second == 0x80 || second == 0x81)) return Sort::parting;
    if (first == 0xE3 && second == 0x80) return Sort::parting;
    if (first == 0xE1 && second >= 0x84 && second <= 0x87) return Sort::unspaced;
    if (first >= 0xE3 && first <= 0xED) return Sort::unspaced;
    return first == 0xF0 && second >= 0xA0 ? Sort::unspaced : Sort::spaced;
}

// Well-formed text as runs of one sort, a byte that is no character as one that parts.
template <typename Visitor>
void forEachRun(std::string_view text, const Visitor& visit) {
    std::size_t start = 0;
    Sort sort = Sort::parting;
    for (std::size_t at = 0; at <= text.size();) {
        const std::size_t length = at == text.size() ? 0 : utf8CharacterLength(text.substr(at));
        const Sort next = length == 0 ? Sort::parting : sortOf(text.substr(at, length));
        if (next != sort) {
            if (sort != Sort::parting) visit(text.substr(start, at - start), sort);
            start = at;
            sort = next;
        }
        at += std::max<std::size_t>(length, 1);
    }
}

// Where each of the first characters of a run ends.
std::array<std::size_t, kLongestPiece> characterEnds(std::string_view run) {
    std::array<std::size_t, kLongestPiece> ends{};
    std::size_t at = 0;
    for (std::size_t& end : ends) {
        if (at < run.size()) at += utf8CharacterLength(run.substr(at));
        end = at;
    }
    return ends;
}

void addPieces(std::string_view run, Hashes& words) {
    while (!run.empty()) {
        const auto ends = characterEnds(run);
        std::size_t previous = 0;
        for (const std::size_t end : ends) {
            if (end != previous) words.push_back(hashed(run.substr(0, end)));
            previous = end;
        }
        run.remove_prefix(ends.front());
    }
}

Hashes wordsOfText(std::string_view text) {
    const std::string folded = foldedForSearch(text);
    Hashes words;
    forEachRun(folded, [&words](std::string_view run, Sort sort) {
        if (sort == Sort::unspaced) return addPieces(run, words);
        words.push_back(hashed(run));
    });
    return words;
}

bool isParticle(std::string_view word) {
    return word[0] >= 'a' && word[0] <= 'z';
}

// The words of a name that count: no single letters, and particles only where there is nothing else.
Hashes wordsOfName(std::string_view name) {
    Hashes words;
    Hashes particles;
    forEachRun(name.substr(0, kMostBytes), [&](std::string_view part, Sort) {
        Hashes& list = isParticle(part) ? particles : words;
        forEachRun(foldedForSearch(part), [&list](std::string_view run, Sort sort) {
            const std::size_t length = sort == Sort::unspaced ? characterEnds(run).back() : run.size();
            if (length > 1) list.push_back(hashed(run.substr(0, length)));
        });
    });
    return words.empty() ? particles : words;
}

bool isAmong(const Hashes& words, std::uint64_t word) {
    return std::find(words.begin(), words.end(), word) != words.end();
}

void addSome(const Hashes& more, Hashes& words) {
    for (const std::uint64_t word : more) {
        if (words.size() < kMostWords && !isAmong(words, word)) words.push_back(word);
    }
}

std::span<const PersonName> someNames(const GedcomData& data, PersonId id) {
    const auto all = data.names(id);
    return all.first(std::min(all.size(), kMostNames));
}

// A piece of a record need not be what its value has between the slashes; both count.
void addSurname(const PersonName& name, Hashes& words) {
    addSome(wordsOfName(name.surname), words);
    const std::size_t first = name.written.find('/');
    if (first == std::string_view::npos) return;
    const std::string_view rest = name.written.substr(first + 1);
    addSome(wordsOfName(rest.substr(0, rest.find('/'))), words);
}

void addGivenNames(const PersonName& name, Hashes& words) {
    addSome(wordsOfName(name.given), words);
    addSome(wordsOfName(name.written.substr(0, name.written.find('/'))), words);
}

Hashes surnamesOf(const GedcomData& data, PersonId id) {
    Hashes words;
    for (const PersonName& name : someNames(data, id)) addSurname(name, words);
    return words;
}

// What stands without slashes may be the surname all the same.
void removeSurnames(const Hashes& surnames, Hashes& given) {
    Hashes rest;
    for (const std::uint64_t word : given) {
        if (!isAmong(surnames, word)) rest.push_back(word);
    }
    if (!rest.empty()) given = std::move(rest);
}

void addSpousesSurnames(const GedcomData& data, PersonId id, Hashes& surnames) {
    for (const PersonId spouse : data.spouses(id)) {
        if (surnames.size() >= kMostWords) return;
        addSome(surnamesOf(data, spouse), surnames);
    }
}

void makeSet(Hashes& words) {
    std::sort(words.begin(), words.end());
    words.erase(std::unique(words.begin(), words.end()), words.end());
}

bool contains(const Hashes& set, std::uint64_t word) {
    return std::binary_search(set.begin(), set.end(), word);
}

Hashes common(const Hashes& words, const Hashes& set) {
    Hashes found;
    for (const std::uint64_t word : words) {
        if (contains(set, word)) found.push_back(word);
    }
    makeSet(found);
    return found;
}

}  // namespace

void NameFinder::add(const GedcomData& data, PersonId id) {
    Hashes surnames = surnamesOf(data, id);
    Hashes given;
    for (const PersonName& name : someNames(data, id)) addGivenNames(name, given);
    removeSurnames(surnames, given);
    if (surnames.empty() && given.size() > 1) {
        surnames.push_back(given.back());
        given.pop_back();
    }
    for (const PersonName& name : someNames(data, id)) addSome(wordsOfName(name.nickname), given);
    ownWords_.insert(ownWords_.end(), given.begin(), given.end());
    ownWords_.insert(ownWords_.end(), surnames.begin(), surnames.end());
    addSpousesSurnames(data, id, surnames);
    for (const std::uint64_t word : given) {
        for (const std::uint64_t surname : surnames) pairs_.push_back(pairOf(word, surname));
    }
    givenWords_.insert(givenWords_.end(), given.begin(), given.end());
    surnameWords_.insert(surnameWords_.end(), surnames.begin(), surnames.end());
}

void NameFinder::addOther(const GedcomData& data, PersonId id) {
    Hashes words;
    for (const PersonName& name : someNames(data, id)) {
        addGivenNames(name, words);
        addSurname(name, words);
    }
    otherWords_.insert(otherWords_.end(), words.begin(), words.end());
}

void NameFinder::buildIndex() {
    for (Hashes* const set : {&givenWords_, &surnameWords_, &pairs_, &ownWords_, &otherWords_}) makeSet(*set);
    std::erase_if(ownWords_, [this](std::uint64_t word) { return contains(otherWords_, word); });
}

bool NameFinder::isNamedIn(std::string_view text) const {
    const Hashes words = wordsOfText(text);
    const Hashes given = common(words, givenWords_);
    if (given.empty()) return false;
    const Hashes surnames = common(words, surnameWords_);
    if (given.size() * surnames.size() > kMostPairs) return true;
    return std::any_of(given.begin(), given.end(), [&](std::uint64_t word) {
        return std::any_of(surnames.begin(), surnames.end(),
                           [&](std::uint64_t surname) { return contains(pairs_, pairOf(word, surname)); });
    });
}

bool NameFinder::isHintedAtIn(std::string_view text) const {
    const Hashes words = wordsOfText(text);
    return std::any_of(words.begin(), words.end(),
                       [this](std::uint64_t word) { return contains(ownWords_, word); });
}

}  // namespace olvane::gedcom
