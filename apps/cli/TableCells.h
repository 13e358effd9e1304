// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <initializer_list>
#include <string>
#include <string_view>

#include <olvane/picture/TextSink.h>

namespace olvane::cli {

// A text as a cell of a table of tab-separated values that a spreadsheet may open. A cell that would be taken for a
// formula, one that begins with = + - @ or their full-width forms, gets an apostrophe in front, and so does one that
// begins with an apostrophe, so that a reader removes one where there is one. A cell that begins with a quotation mark
// is quoted as in RFC 4180. A tab or line end becomes a space.
std::string tableCell(std::string_view text);

// The cells with tabs between, and a line end.
std::string tableLine(std::initializer_list<std::string_view> cells);

// A line of such a table that is written while it is made, so that a long text is never in memory a second time.
//
// Fails: whatever the sink throws passes on.
class TableLineOutput {
public:
    // The sink must live as long as this.
    explicit TableLineOutput(const picture::TextSink& write) : write_(write) {}

    void cell(std::string_view text);
    // What make writes, in pieces of whole characters.
    void cell(const std::function<void(const picture::TextSink& write)>& make);
    // Ends the line.
    void finish();

private:
    const picture::TextSink& write_;
    bool isFirst_ = true;
};

// What a user wrote, on one line and without tabs: \\ \t \r \n, and \xHH for other control characters.
std::string escapedField(std::string_view text);

}  // namespace olvane::cli
