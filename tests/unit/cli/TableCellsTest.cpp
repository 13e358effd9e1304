// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/TableCells.h>

#include <string>

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

// The same cells one after the other, the first in parts of that many bytes.
std::string lineInPieces(std::string_view first, std::string_view second, std::size_t bytes) {
    std::string text;
    const picture::TextSink write = [&text](std::string_view piece) { text += piece; };
    TableLineOutput line(write);
    line.cell([first, bytes](const picture::TextSink& sink) {
        for (std::size_t at = 0; at < first.size(); at += bytes) sink(first.substr(at, bytes));
    });
    line.cell(second);
    line.finish();
    return text;
}

TEST(TableLineOutput, hasTheBytesOfTheWholeLine) {
    const std::string longCell = "\"" + std::string(100'000, '"') + "\t" + std::string(100'000, 'a');
    for (const char* cell : {"", "=1", "\"a\"\tb", "\xEF\xBC\x9D", "a=\"b", "''"}) {
        for (const std::size_t bytes : {3U, 100U}) {
            EXPECT_EQ(lineInPieces(cell, "-x", bytes), tableLine({cell, "-x"})) << cell;
        }
    }
    EXPECT_EQ(lineInPieces(longCell, longCell, 3), tableLine({longCell, longCell}));
}

TEST(EscapedField, hasNeitherTabsNorLineEnds) {
    EXPECT_EQ(escapedField("a\tb\\\r\n\x1b \x7f\xC3\xA9"), "a\\tb\\\\\\r\\n\\x1B \\x7F\xC3\xA9");
}

}  // namespace
}  // namespace olvane::cli
