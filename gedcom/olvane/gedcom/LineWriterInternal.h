// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <utility>

namespace olvane::gedcom {

// The lines of a GEDCOM file as text. Values are written as version 5.5.1 has them, every @ doubled but those of a
// calendar, on one line each however long, which every reader of ours takes.
//
// Units: level is that of the line, from 0 to 8.
class LineWriter {
public:
    void reserve(std::size_t bytes) { text_.reserve(bytes); }

    void record(std::string_view xref, std::string_view tag);
    // A record with a text of its own, and a text below a record: its lines stand in lines of their own.
    void textRecord(std::string_view xref, std::string_view tag, std::string_view text);
    void text(int level, std::string_view tag, std::string_view text);
    void line(int level, std::string_view tag, std::string_view value = {});
    // A line below a fact, a name or a link, where there is something to write.
    void piece(std::string_view tag, std::string_view value);
    void date(std::string_view date);
    void pointer(int level, std::string_view tag, std::string_view xref);

    std::string take() && { return std::move(text_); }

private:
    void start(int level, std::string_view tag);
    void appendLines(int level, std::string_view text);
    void appendValue(std::string_view value);
    void appendDoubled(std::string_view value);

    std::string text_;
};

}  // namespace olvane::gedcom
