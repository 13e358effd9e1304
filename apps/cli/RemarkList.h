// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/Language.h>

namespace olvane::cli {

// Something that a check has to say of a file.
struct Remark {
    std::string kind;        // of gedcom::kindName or of kin::nameOf
    std::string severity;    // "note", "warning" and "error" of what was read, "odd" of what the data say
    std::uint32_t line = 0;  // from 1; 0 for the file as a whole
    std::vector<std::string> xrefs;  // of records concerned, without their @
    std::string text;

    // Whether the file has a problem; a note is none.
    bool isProblem() const { return severity != "note"; }
};

// First what was wrong in the file, then what is odd in its data, each in the order of the lines.
std::vector<Remark> remarksOf(const gedcom::GedcomData& data, kin::Language language);

// "tree.ged:12: odd: TEXT", a line for each.
std::string remarksText(const gedcom::GedcomData& data, const std::vector<Remark>& remarks);

// Tab-separated values, a heading first: kind, severity, file, line, xrefs (with spaces between), text. Cells are as
// tableCell makes them; line is empty for the file as a whole.
std::string remarksTable(const gedcom::GedcomData& data, const std::vector<Remark>& remarks);

}  // namespace olvane::cli
