// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/TableCells.h>

#include <gtest/gtest.h>

namespace olvane::cli {
namespace {

TEST(TableCells, keepAFormulaFromASpreadsheet) {
    for (const char* text : {"=1+1", "+1", "-1", "@SUM(A1)", "'quoted",
                             "\xEF\xBC\x9D"
                             "1",
                             "\xEF\xBC\xA0"
                             "a"}) {
        EXPECT_EQ(tableCell(text), "'" + std::string(text));
    }
    EXPECT_EQ(tableCell("\t=1"), " =1");
}

TEST(TableCells, areTheTextItselfOtherwise) {
    for (const char* text : {"", "Ada", "a=b", "1901-05", "O'Neill", "Ada \"the first\""}) {
        EXPECT_EQ(tableCell(text), text);
    }
}

TEST(TableCells, areQuotedWhereTheyBeginWithAQuotationMark) {
    EXPECT_EQ(tableCell("\"a\" b"), "\"\"\"a\"\" b\"");
}

TEST(TableCells, areOneLineWithTabsBetween) {
    EXPECT_EQ(tableLine({"a", "b\tc\nd", ""}), "a\tb c d\t\n");
}

TEST(EscapedField, hasNeitherTabsNorLineEnds) {
    EXPECT_EQ(escapedField("a\tb\\\r\n\x1b \x7f\xC3\xA9"), "a\\tb\\\\\\r\\n\\x1B \\x7F\xC3\xA9");
}

}  // namespace
}  // namespace olvane::cli
