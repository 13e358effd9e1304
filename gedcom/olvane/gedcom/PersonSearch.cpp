// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finding persons by what a user types. Names are folded as they are compared; a file of a million persons is
// searched in well under a second, and nothing is kept beside the data.

#include <olvane/gedcom/PersonSearch.h>

#include <algorithm>
#include <charconv>
#include <string>
#include <system_error>

#include <olvane/gedcom/LineScannerInternal.h>
#include <olvane/gedcom/UnicodeTextInternal.h>

namespace olvane::gedcom {
namespace {

enum class Match { none, begins, whole };

// Characters that part words: blanks, slashes and such signs as stand between names. All bytes of other
// characters belong to words.
bool partsWords(char c) {
    return c == ' ' || c == '\t' || c == '/' || c == ',' || c == '"' || c == '(' || c == ')' || c == '-';
}

std::vector<std::string_view> wordsOf(std::string_view text) {
    std::vector<std::string_view> words;
    std::size_t start = 0;
    for (std::size_t at = 0; at <= text.size(); ++at) {
        if (at < text.size() && !partsWords(text[at])) continue;
        if (at > start) words.push_back(text.substr(start, at - start));
        start = at + 1;
    }
    return words;
}

// Everything that a person is called, folded, with a space between.
void appendNames(const GedcomData& data, PersonId id, std::string& names) {
    for (const PersonName& name : data.names(id)) {
        for (const std::string_view piece :
             {name.written, name.prefix, name.given, name.surname, name.suffix, name.nickname}) {
            names += foldedForSearch(piece);
            names += ' ';
        }
    }
}

Match matchWord(std::string_view names, std::string_view word) {
    Match best = Match::none;
    for (std::size_t at = names.find(word); at != std::string_view::npos; at = names.find(word, at + 1)) {
        if (at > 0 && !partsWords(names[at - 1])) continue;
        const std::size_t end = at + word.size();
        if (end == names.size() || partsWords(names[end])) return Match::whole;
        best = Match::begins;
    }
    return best;
}

Match matchWords(std::string_view names, const std::vector<std::string_view>& words) {
    Match worst = Match::whole;
    for (const std::string_view word : words) worst = std::min(worst, matchWord(names, word));
    return worst;
}

std::vector<PersonId> findByWords(const GedcomData& data, std::string_view text, std::size_t limit) {
    const std::string folded = foldedForSearch(text);
    const std::vector<std::string_view> words = wordsOf(folded);
    std::vector<PersonId> whole;
    std::vector<PersonId> begins;
    if (words.empty()) return whole;
    std::string names;
    for (PersonId id = 1; id <= data.personCount() && whole.size() < limit; ++id) {
        names.clear();
        appendNames(data, id, names);
        const Match match = matchWords(names, words);
        if (match == Match::whole) whole.push_back(id);
        if (match == Match::begins && begins.size() < limit) begins.push_back(id);
    }
    begins.resize(std::min(begins.size(), limit - whole.size()));
    whole.insert(whole.end(), begins.begin(), begins.end());
    return whole;
}

PersonId personByNumber(const GedcomData& data, std::string_view text) {
    PersonId id = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), id);
    return error == std::errc{} && end == text.data() + text.size() && data.hasPerson(id) ? id : 0;
}

}  // namespace

std::vector<PersonId> findPersons(const GedcomData& data, std::string_view text, std::size_t limit) {
    if (limit == 0) return {};
    const std::string_view wanted = trimmed(text);
    if (const PersonId person = data.personByXref(wanted); person != 0) return {person};
    if (const PersonId person = personByNumber(data, wanted); person != 0) return {person};
    return findByWords(data, wanted, limit);
}

}  // namespace olvane::gedcom
