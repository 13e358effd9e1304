// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/PeopleList.h>

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <olvane/gedcom/GedcomReader.h>

#include <cli/PersonJson.h>

namespace olvane::cli {
namespace {

gedcom::GedcomData read(const std::string& records) {
    gedcom::ReadOptions options;
    options.facts = true;
    return gedcom::readGedcomBytes("0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n" + records + "0 TRLR\n",
                                   "a.ged", options);
}

using Ids = std::vector<gedcom::PersonId>;

std::string peopleTable(const gedcom::GedcomData& data, const Ids& persons) {
    std::string text;
    writePeopleTable(data, persons, [&text](std::string_view piece) { text += piece; });
    return text;
}

std::string peopleJson(const gedcom::GedcomData& data, const Ids& persons) {
    std::string text;
    writePeopleJson(data, persons, [&text](std::string_view piece) { text += piece; });
    return text;
}

TEST(PeopleList, hasEveryFieldApart) {
    const auto data = read(
        "0 @I1@ INDI\n1 NAME Ada /Lund/\n1 SEX F\n1 BIRT\n2 DATE 3 MAY 1801\n2 PLAC Bern\n1 DEAT\n2 DATE ABT "
        "1870\n"
        "2 PLAC Thun\n0 @I2@ INDI\n");
    EXPECT_EQ(peopleTable(data, {1, 2}),
              "id\txref\tsex\tname\tgiven\tsurname\tdead\tbirth\tbirth_sort\tbirth_place\tdeath\tdeath_"
              "sort\tdeath_place\n"
              "1\tI1\tfemale\tAda Lund\tAda\tLund\ttrue\t3 MAY 1801\t1801-05-03\tBern\tABT 1870\t1870\tThun\n"
              "2\tI2\tother\t\t\t\tfalse\t\t\t\t\t\t\n");
    const auto json = nlohmann::json::parse(peopleJson(data, {1}));
    EXPECT_EQ(json["persons"].size(), 1U);
    EXPECT_EQ(json["persons"][0]["birthPlace"], "Bern");
    EXPECT_EQ(json["persons"][0]["death"]["sort"], "1870");
}

TEST(PeopleList, takesThePlaceOfTheEventWhoseDateIsGiven) {
    const auto data = read(
        "0 @I1@ INDI\n1 BIRT\n2 PLAC Bern\n1 BIRT\n2 DATE 1801\n2 PLAC Thun\n0 @I2@ INDI\n1 BIRT\n2 PLAC "
        "Bern\n1 BIRT\n"
        "2 DATE 1801\n0 @I3@ INDI\n1 BIRT\n1 BIRT\n2 PLAC Bern\n");
    EXPECT_EQ(placeOf(data, 1, "BIRT"), "Thun");
    EXPECT_EQ(placeOf(data, 2, "BIRT"), "Bern");
    EXPECT_EQ(placeOf(data, 3, "BIRT"), "Bern");
    EXPECT_EQ(placeOf(data, 1, "DEAT"), "");
}

}  // namespace
}  // namespace olvane::cli
