// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finds the person whom a user names, and offers others where the name does not settle it.

#include <cli/FocusChoice.h>

#include <algorithm>
#include <sstream>
#include <vector>

#include <olvane/picture/TextMetrics.h>
#include <olvane/source/GedcomLabels.h>
#include <olvane/source/PersonFinder.h>

#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

constexpr std::size_t kMostCandidates = 10;
constexpr std::size_t kBeginning = 3;  // bytes; ASCII alone, so that no character is cut

std::string candidateList(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& candidates) {
    std::string list;
    const std::size_t shown = std::min(candidates.size(), kMostCandidates);
    for (std::size_t i = 0; i < shown; ++i) list += "\n  " + personLine(data, candidates[i]);
    if (candidates.size() > shown) list += "\n  and " + std::to_string(candidates.size() - shown) + " more";
    return list;
}

std::vector<std::string> wordsOf(const std::string& text) {
    std::istringstream stream(text);
    std::vector<std::string> words;
    for (std::string word; stream >> word;) words.push_back(word);
    return words;
}

bool isAscii(const std::string& word) {
    return std::all_of(word.begin(), word.end(), [](char c) { return static_cast<unsigned char>(c) < 0x80; });
}

void addMatches(gedcom::PersonFinder& finder, const std::string& word, std::vector<gedcom::PersonId>& found) {
    for (const gedcom::PersonId id : finder.find(word, kMostCandidates)) {
        if (std::find(found.begin(), found.end(), id) == found.end()) found.push_back(id);
    }
}

// Persons whom a mistyped name may mean: by all of its words as they are written nearly, by one of them, or else by
// how a word begins.
std::vector<gedcom::PersonId> similarPersons(gedcom::PersonFinder& finder, const std::string& who) {
    std::vector<gedcom::PersonId> found = finder.find(who, kMostCandidates);
    if (!found.empty()) return found;
    for (const std::string& word : wordsOf(who)) addMatches(finder, word, found);
    if (!found.empty()) return found;
    for (const std::string& word : wordsOf(who)) {
        if (word.size() > kBeginning && isAscii(word)) addMatches(finder, word.substr(0, kBeginning), found);
    }
    return found;
}

[[noreturn]] void refuseUnknown(const gedcom::GedcomData& data, gedcom::PersonFinder& finder,
                                const std::string& who) {
    const std::vector<gedcom::PersonId> similar = similarPersons(finder, who);
    const std::string start = data.file() + ": no person is called '" + who + "'";
    if (similar.empty()) throw UsageError(start + "; 'olvane people' lists them all");
    throw UsageError(start + "; perhaps one of these is meant:" + candidateList(data, similar));
}

// As in the box of a picture.
std::string years(const gedcom::GedcomData& data, gedcom::PersonId id) {
    return picture::cutText(kin::lifeLine(gedcom::GedcomLabels(data).ofPerson(id), " "));
}

}  // namespace

gedcom::PersonId chooseFocus(const gedcom::GedcomData& data, const std::string& who) {
    gedcom::PersonFinder finder(data);
    const std::vector<gedcom::PersonId> found = finder.meant(who);
    if (found.empty()) refuseUnknown(data, finder, who);
    if (found.size() > 1) {
        throw UsageError(data.file() + ": '" + who + "' may be any of " + std::to_string(found.size()) +
                         " persons; name one by its id:" + candidateList(data, found));
    }
    return found.front();
}

std::string readableName(const gedcom::GedcomData& data, gedcom::PersonId id) {
    // A little more than is shown, so that what is cut ends in an ellipsis.
    return picture::cutText(gedcom::displayName(data.firstName(id), 2 * picture::kMostTextBytes));
}

std::string personLine(const gedcom::GedcomData& data, gedcom::PersonId id) {
    const gedcom::Person& person = data.person(id);
    const std::string xref = person.xref.empty() ? "-" : "@" + std::string(person.xref) + "@";
    return std::to_string(id) + "\t" + xref + "\t" + readableName(data, id) + "\t" + years(data, id);
}

}  // namespace olvane::cli
