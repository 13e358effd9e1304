// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lists persons: number, xref, name and years, with tabs between.

#include <cli/Commands.h>

#include <olvane/gedcom/PersonSearch.h>

#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/Messages.h>
#include <cli/OutputFile.h>

namespace olvane::cli {

namespace {

std::string joined(const std::vector<std::string>& words) {
    std::string text;
    for (const std::string& word : words) text += (text.empty() ? "" : " ") + word;
    return text;
}

std::vector<gedcom::PersonId> everybody(const gedcom::GedcomData& data) {
    std::vector<gedcom::PersonId> all(data.personCount());
    for (std::size_t i = 0; i < all.size(); ++i) all[i] = static_cast<gedcom::PersonId>(i + 1);
    return all;
}

}  // namespace

int runPeople(const PeopleOptions& options) {
    const gedcom::GedcomData data = readFile(options.file);
    const std::string words = joined(options.words);
    const auto persons = words.empty() ? everybody(data) : gedcom::findPersons(data, words);
    std::string text;
    for (const gedcom::PersonId id : persons) text += personLine(data, id) + "\n";
    writeStandardOutput(text);
    if (!persons.empty()) return 0;
    tell(options.file + ": " +
         (words.empty() ? std::string("no person in this file") : "no person is called '" + words + "'"));
    return 1;
}

}  // namespace olvane::cli
