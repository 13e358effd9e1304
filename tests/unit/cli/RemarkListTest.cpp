// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a check lists, in each form.

#include <cli/RemarkList.h>

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include <olvane/gedcom/GedcomReader.h>

#include <cli/CheckJson.h>

namespace olvane::cli {
namespace {

gedcom::GedcomData oddFile() {
    return gedcom::readGedcomBytes(
        "0 HEAD\n1 CHAR UTF-8\n0 @I1@ INDI\n1 NAME Ada /Lund/\n1 FAMC @F9@\n1 BIRT\n2 DATE 1850\n1 DEAT\n2 "
        "DATE 1840\n0 TRLR\n",
        "=odd.ged");
}

TEST(RemarkList, hasTheFileFirstThenTheData) {
    const auto data = oddFile();
    const auto remarks = remarksOf(data, kin::Language::english);
    ASSERT_EQ(remarks.size(), 2U);
    EXPECT_EQ(remarks[0].kind, "danglingPointer");
    EXPECT_EQ(remarks[0].severity, "error");
    EXPECT_EQ(remarks[0].line, 5U);
    EXPECT_EQ(remarks[1].kind, "diedBeforeBirth");
    EXPECT_EQ(remarks[1].severity, "odd");
    EXPECT_EQ(remarksText(data, {remarks[1]}), "=odd.ged:3: odd: @I1@ Ada Lund died before being born\n");
    EXPECT_EQ(remarksText(data, {{"missingTrailer", "warning", 0, {}, "cut off"}}),
              "=odd.ged: warning: cut off\n");
}

// The text begins with an @ and the file's name with a sign of a formula.
TEST(RemarkList, isATableForSpreadsheets) {
    const auto data = oddFile();
    EXPECT_EQ(remarksTable(data, {remarksOf(data, kin::Language::english)[1]}),
              "kind\tseverity\tfile\tline\txrefs\ttext\n"
              "diedBeforeBirth\todd\t'=odd.ged\t3\tI1\t'@I1@ Ada Lund died before being born\n");
}

TEST(RemarkList, isJson) {
    const auto data = oddFile();
    const auto json = nlohmann::json::parse(checkJson(data, remarksOf(data, kin::Language::english), {}));
    EXPECT_EQ(json["remarks"][1]["xrefs"], nlohmann::json::array({"I1"}));
    EXPECT_EQ(json["remarks"][1]["line"], 3);
    EXPECT_FALSE(json.contains("layouts"));
    const auto more =
        nlohmann::json::parse(checkJson(data, {{"missingTrailer", "warning", 0, {}, ""}}, {{1, {}}}));
    EXPECT_FALSE(more["remarks"][0].contains("line"));
    EXPECT_EQ(more["layouts"][0]["focus"], 1);
}

TEST(RemarkList, countsNotesAsNoProblem) {
    EXPECT_FALSE((Remark{"", "note", 0, {}, ""}).isProblem());
    EXPECT_TRUE((Remark{"", "odd", 0, {}, ""}).isProblem());
    EXPECT_TRUE((Remark{"", "warning", 0, {}, ""}).isProblem());
}

}  // namespace
}  // namespace olvane::cli
