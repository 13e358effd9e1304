// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "PlainSearch.h"

#include <algorithm>
#include <optional>
#include <regex>
#include <sstream>
#include <tuple>

#include <olvane/kin/Folding.h>
#include <olvane/kin/PersonIndex.h>

namespace olvane::kin::test {
namespace {

struct Word {
    std::string folded;
    FoundIn in;
};

struct Years {
    int first;
    int last;
    FoundIn in;
};

struct Record {
    std::int64_t id = 0;
    std::string xref;
    std::vector<Word> words;
    std::vector<Years> years;
};

struct Wanted {
    std::string word;
    int first = 0;  // 0 where it is no year
    int last = 0;
};

// How a word fits: the fit, where it stands, and whether the word itself has to be compared.
using Found = std::tuple<int, int, std::string>;

std::vector<Years> yearsIn(const SearchText& date) {
    const std::string sorting = date.sorting.starts_with("-") ? "" : std::string(date.sorting);
    const std::string text = sorting + " " + std::string(date.text);
    static const std::regex kNumber("[0-9]+");
    std::vector<int> years;
    for (auto at = std::sregex_iterator(text.begin(), text.end(), kNumber); at != std::sregex_iterator();
         ++at) {
        if (at->length() == 3 || at->length() == 4) years.push_back(std::stoi(at->str()));
    }
    std::erase(years, 0);
    if (years.empty()) return {};
    return {{*std::min_element(years.begin(), years.end()), *std::max_element(years.begin(), years.end()),
             date.in}};
}

void addWords(const SearchText& text, Record& record) {
    for (const FoldedWord& word : foldedWords(text.text)) {
        record.words.push_back({word.folded, text.in});
        for (const std::string apostrophe : {"'", "\u2019"}) {
            const std::size_t at = word.written.find(apostrophe);
            if (at == std::string_view::npos) continue;
            const std::string behind = foldedForSearch(word.written.substr(at + apostrophe.size()));
            if (!behind.empty()) record.words.push_back({behind, text.in});
        }
    }
}

Record recordOf(const SearchTexts& texts, std::size_t place) {
    Record record;
    record.id = texts.id(place);
    texts.visit(place, [&record](const SearchText& text) {
        if (text.isDate) {
            for (const Years& years : yearsIn(text)) {
                record.years.push_back(years);
                record.words.push_back({std::to_string(years.first), text.in});
                record.words.push_back({std::to_string(years.last), text.in});
            }
        } else if (text.in == FoundIn::identifier) {
            record.xref = text.text;
        } else {
            addWords(text, record);
        }
    });
    return record;
}

bool isNumber(const std::string& text) {
    return !text.empty() && text.find_first_not_of("0123456789") == std::string::npos;
}

std::vector<std::string> lettersOf(const std::string& text) {
    std::vector<std::string> letters;
    for (const char c : text) {
        if (letters.empty() || (static_cast<unsigned char>(c) & 0xC0U) != 0x80U) letters.emplace_back();
        letters.back() += c;
    }
    return letters;
}

// The number of steps from one to the other: a letter wrong, missing, too many, or exchanged with its neighbor.
int stepsBetween(const std::vector<std::string>& one, const std::vector<std::string>& other) {
    std::vector<std::vector<int>> steps(one.size() + 1, std::vector<int>(other.size() + 1));
    for (std::size_t i = 0; i <= one.size(); ++i) {
        for (std::size_t j = 0; j <= other.size(); ++j) {
            if (i == 0 || j == 0) {
                steps[i][j] = static_cast<int>(i + j);
                continue;
            }
            const int change = one[i - 1] == other[j - 1] ? 0 : 1;
            steps[i][j] = std::min({steps[i - 1][j] + 1, steps[i][j - 1] + 1, steps[i - 1][j - 1] + change});
            if (i > 1 && j > 1 && one[i - 1] == other[j - 2] && one[i - 2] == other[j - 1])
                steps[i][j] = std::min(steps[i][j], steps[i - 2][j - 2] + 1);
        }
    }
    return steps[one.size()][other.size()];
}

std::optional<int> fitOf(const std::string& word, const std::string& wanted, bool findsSimilar) {
    if (word == wanted) return 0;
    if (word.starts_with(wanted)) return 1;
    if (wanted.size() >= 3 && !isNumber(wanted) && word.find(wanted) != std::string::npos) return 2;
    if (!findsSimilar || wanted.size() < 4 || isNumber(wanted)) return std::nullopt;
    return stepsBetween(lettersOf(word), lettersOf(wanted)) <= 1 ? std::optional<int>(3) : std::nullopt;
}

std::vector<Wanted> wantedIn(const std::string& text) {
    static const std::regex kRange("([0-9]{1,4})(?:-|\u2013)([0-9]{1,4})");
    std::vector<Wanted> all;
    const auto add = [&all](const Wanted& wanted) {
        if (std::none_of(all.begin(), all.end(),
                         [&](const Wanted& each) { return each.word == wanted.word; }))
            all.push_back(wanted);
    };
    std::string spaced = text;
    std::replace(spaced.begin(), spaced.end(), ',', ' ');
    std::istringstream pieces(spaced);
    for (std::string piece; pieces >> piece;) {
        std::smatch range;
        if (std::regex_match(piece, range, kRange)) {
            const int first = std::stoi(range[1]);
            const int last = std::stoi(range[2]);
            add({range[1].str() + "-" + range[2].str(), std::min(first, last), std::max(first, last)});
            continue;
        }
        for (const FoldedWord& word : foldedWords(piece)) {
            const int year = isNumber(word.folded) && word.folded.size() <= 4 ? std::stoi(word.folded) : 0;
            add({word.folded, year, year});
        }
    }
    return all;
}

// The best of all words of a person.
std::optional<Found> bestOf(const Record& record, const Wanted& wanted, bool findsSimilar) {
    std::optional<Found> best;
    const auto offer = [&best](int fit, FoundIn in, const std::string& word) {
        const Found found{fit, static_cast<int>(in), word};
        if (!best || found < *best) best = found;
    };
    if (wanted.first != 0) {
        for (const Years& years : record.years) {
            if (years.first <= wanted.last && wanted.first <= years.last) offer(0, years.in, wanted.word);
        }
        if (wanted.first != wanted.last) return best;
    }
    for (const Word& word : record.words) {
        if (const auto fit = fitOf(word.folded, wanted.word, findsSimilar)) offer(*fit, word.in, word.folded);
    }
    return best;
}

std::vector<std::string> foundBy(const std::vector<Record>& records, const std::vector<Wanted>& all,
                                 bool findsSimilar, std::int64_t butFor) {
    std::vector<std::tuple<int, std::size_t, std::string>> lines;
    for (std::size_t place = 0; place < records.size(); ++place) {
        if (records[place].id == butFor) continue;
        int cost = 0;
        std::string line = std::to_string(records[place].id) + ":";
        bool isFound = !all.empty();
        for (const Wanted& wanted : all) {
            const auto best = bestOf(records[place], wanted, findsSimilar);
            isFound = isFound && best.has_value();
            if (!isFound) break;
            const auto& [fit, in, word] = *best;
            cost += 16 * fit + in;
            line += std::string(line.ends_with(":") ? " " : ", ") + nameOf(static_cast<FoundIn>(in)) + " " +
                    nameOf(static_cast<Fit>(fit)) + " " + word;
        }
        if (isFound) lines.emplace_back(cost, place, line);
    }
    std::sort(lines.begin(), lines.end());
    std::vector<std::string> found;
    found.reserve(lines.size());
    for (const auto& line : lines) found.push_back(std::get<2>(line));
    return found;
}

}  // namespace

std::vector<std::string> plainSearch(const SearchTexts& texts, const std::string& text) {
    std::vector<Record> records;
    for (std::size_t place = 0; place < texts.personCount(); ++place)
        records.push_back(recordOf(texts, place));
    const bool hasSigns = text.size() > 2 && text.front() == '@' && text.back() == '@';
    const std::string wanted = foldedForSearch(hasSigns ? text.substr(1, text.size() - 2) : text);
    std::int64_t byIdentifier = 0;
    for (const Record& record : records) {
        if (byIdentifier == 0 && foldedForSearch(record.xref) == wanted) byIdentifier = record.id;
    }
    for (const Record& record : records) {
        if (byIdentifier == 0 && std::to_string(record.id) == wanted) byIdentifier = record.id;
    }
    std::vector<std::string> found;
    if (byIdentifier != 0) found.push_back(std::to_string(byIdentifier) + ": identifier whole " + text);
    const std::vector<Wanted> all = wantedIn(text);
    std::vector<std::string> byWords = foundBy(records, all, false, byIdentifier);
    if (byWords.empty() && found.empty()) byWords = foundBy(records, all, true, byIdentifier);
    found.insert(found.end(), byWords.begin(), byWords.end());
    return found;
}

}  // namespace olvane::kin::test
