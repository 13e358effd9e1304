// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The rows that the module for JavaScript is tried with as well.

#include <gtest/gtest.h>

#include <fstream>
#include <nlohmann/json.hpp>
#include <string>

#include <olvane/gedcom/GedcomMedia.h>
#include <olvane/gedcom/GedcomPeriod.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/kin/KinshipText.h>
#include <olvane/source/GedcomCheck.h>
#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomLabels.h>

namespace olvane::gedcom {
namespace {

using nlohmann::json;

json fixture(const std::string& name) {
    return json::parse(std::ifstream(OLVANE_FIXTURES "/" + name));
}

const GedcomData& persons() {
    static const GedcomData kData = readGedcomFile(OLVANE_FIXTURES "/persons.ged");
    return kData;
}

PersonId idOf(const std::string& xref) {
    for (PersonId id = 1; id <= persons().personCount(); ++id) {
        if (persons().person(id).xref == xref) return id;
    }
    return 0;
}

kin::Place placeOf(const std::string& xref) {
    return static_cast<kin::Place>(idOf(xref)) - 1;
}

TEST(PersonsFixture, namesAndYearsAreThoseOfTheRows) {
    const GedcomLabels labels(persons());
    const json all = fixture("persons.json");  // outlives the loop
    for (const json& row : all["persons"]) {
        const PersonId id = idOf(row["xref"]);
        const kin::PersonLabel label = labels.ofPerson(id);
        EXPECT_EQ(displayName(persons().firstName(id)), row["name"]);
        EXPECT_EQ(persons().firstName(id).given, row["given"]);
        EXPECT_EQ(persons().firstName(id).surname, row["surname"]);
        EXPECT_EQ(label.surnameFirst, row.value("surnameFirst", false));
        EXPECT_EQ(label.birth, row["birth"]);
        EXPECT_EQ(label.death, row["death"]);
    }
}

TEST(PersonsFixture, aPeriodIsDistinguishedFromAnUncertainDate) {
    const char* const kMarks[] = {"exact", "about", "before", "after", "between"};
    const json all = fixture("persons.json");  // outlives the loop
    for (const json& row : all["periods"]) {
        const std::string written = row["date"];
        const GedcomDate date = parseGedcomDate(written);
        EXPECT_EQ(kMarks[static_cast<std::size_t>(date.mark)], row["mark"]) << written;
        EXPECT_EQ(isPeriod(date), row["period"]) << written;
    }
}

TEST(PersonsFixture, kinshipHasTheWordsOfTheRows) {
    const kin::KinGraph graph = kinGraphOf(persons());
    kin::KinshipFinder finder(graph);
    const json all = fixture("persons.json");  // outlives the loop
    for (const json& row : all["kinship"]) {
        const kin::Kinship kinship = finder.between(placeOf(row["from"]), placeOf(row["to"]));
        for (const kin::Language language : kin::kLanguages) {
            EXPECT_EQ(kin::kinshipText(graph, kinship, language), row[std::string(languageCode(language))]);
        }
    }
}

TEST(PersonsFixture, remarksHaveTheWordsOfTheRows) {
    const json rows = fixture("persons.json")["remarks"];
    const std::vector<FileRemark> remarks = checkData(persons());
    ASSERT_EQ(remarks.size(), rows.size());
    for (std::size_t i = 0; i < rows.size(); ++i) {
        EXPECT_EQ(std::string(remarks[i].kind()), rows[i]["kind"]);
        for (const kin::Language language : kin::kLanguages) {
            const std::string words = rows[i][std::string(languageCode(language))];
            EXPECT_EQ(remarkText(persons(), remarks[i], language), "@" + remarks[i].xrefs[0] + "@ " + words);
        }
    }
}

TEST(MembersFixture, aMediumStandsForTheMemberOfTheRow) {
    const json all = fixture("members.json");  // outlives the loop
    for (const json& row : all["rows"]) {
        const std::string file = row["file"];
        const std::optional<std::string> member = memberOfArchive(file);
        EXPECT_EQ(member ? json(*member) : json(), row["member"]) << file;
    }
}

}  // namespace
}  // namespace olvane::gedcom
