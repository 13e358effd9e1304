// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomReader.h>

// Small GEDCOM texts for tests, and what came of them as text that a failure can print.
namespace olvane::gedcom::test {

// Records between a 5.5.1 header of that encoding and a trailer.
std::string document(std::string_view records, std::string_view encoding = "UTF-8");

// Records between a 7.0 header and a trailer.
std::string document7(std::string_view records);

// The bytes as a file named "test.ged".
GedcomData read(std::string bytes);

// Display names of all persons, in order, joined with "|".
std::string namesOf(const GedcomData& data);

// "17 42" for a list of ids.
template <typename List>
std::string idsOf(const List& ids) {
    std::string text;
    for (const auto id : ids) {
        if (!text.empty()) text.push_back(' ');
        text.append(std::to_string(id));
    }
    return text;
}

// Diagnostics of a kind as "line: what; done", in order.
std::vector<std::string> reported(const GedcomData& data, DiagnosticKind kind);

// The lines that diagnostics of a kind stand at, as "8 11".
std::string linesReported(const GedcomData& data, DiagnosticKind kind);

// The text of the GedcomError that reading the bytes throws; empty if it throws none.
std::string refusal(std::string bytes);

std::string utf16(std::string_view ascii, bool bigEndian, bool marked);

std::string bytesOfFile(const std::string& path);

}  // namespace olvane::gedcom::test
