// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lists persons: number, xref, name and years, with tabs between; or all fields, for other programs.

#include <cli/Commands.h>

#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/JoinedTexts.h>
#include <cli/Messages.h>
#include <cli/OutputFile.h>
#include <cli/PeopleList.h>
#include <olvane/source/PersonFinder.h>

namespace olvane::cli {

namespace {

std::vector<gedcom::PersonId> everybody(const gedcom::GedcomData& data) {
    std::vector<gedcom::PersonId> all(data.personCount());
    for (std::size_t i = 0; i < all.size(); ++i) all[i] = static_cast<gedcom::PersonId>(i + 1);
    return all;
}

void writePeople(const gedcom::GedcomData& data, const std::vector<gedcom::PersonId>& persons,
                 ListFormat format, const picture::TextSink& write) {
    if (format == ListFormat::tsv) return writePeopleTable(data, persons, write);
    if (format == ListFormat::json) return writePeopleJson(data, persons, write);
    for (const gedcom::PersonId id : persons) write(personLine(data, id) + "\n");
}

}  // namespace

int runPeople(const PeopleOptions& options) {
    const std::string words = joined(options.words, " ");
    const bool needsFacts = options.format != ListFormat::text || !words.empty();
    const gedcom::GedcomData data = needsFacts ? readFileWithFacts(options.input) : readFile(options.input);
    const auto persons = words.empty() ? everybody(data) : gedcom::PersonFinder(data).find(words);
    writeReport([&](const picture::TextSink& write) { writePeople(data, persons, options.format, write); });
    if (!persons.empty()) return statusOfReading(data);
    printMessage(
        options.input.file + ": " +
        (words.empty() ? std::string("no person in this file") : "no person is called '" + words + "'"));
    return 1;
}

}  // namespace olvane::cli
