// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Documents for tests: the header and trailer that every test would repeat, and short forms of what was read.

#include "GedcomText.h"

#include <fstream>
#include <iterator>
#include <utility>

namespace olvane::gedcom::test {

std::string document(std::string_view records, std::string_view encoding) {
    std::string text = "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n2 FORM LINEAGE-LINKED\n1 CHAR ";
    text.append(encoding).append("\n").append(records).append("0 TRLR\n");
    return text;
}

std::string document7(std::string_view records) {
    std::string text = "0 HEAD\n1 GEDC\n2 VERS 7.0\n";
    text.append(records).append("0 TRLR\n");
    return text;
}

GedcomData read(std::string bytes) {
    return readGedcomBytes(std::move(bytes), "test.ged");
}

std::string namesOf(const GedcomData& data) {
    std::string text;
    for (PersonId id = 1; id <= data.personCount(); ++id) {
        if (id > 1) text.push_back('|');
        text.append(displayName(data.firstName(id)));
    }
    return text;
}

std::vector<std::string> reported(const GedcomData& data, DiagnosticKind kind) {
    std::vector<std::string> texts;
    for (const Diagnostic& diagnostic : data.diagnostics()) {
        if (diagnostic.kind != kind) continue;
        std::string text = std::to_string(diagnostic.line);
        texts.push_back(
            text.append(": ").append(whatText(diagnostic)).append("; ").append(doneText(diagnostic)));
    }
    return texts;
}

std::string linesReported(const GedcomData& data, DiagnosticKind kind) {
    std::vector<std::uint32_t> lines;
    for (const Diagnostic& diagnostic : data.diagnostics()) {
        if (diagnostic.kind == kind) lines.push_back(diagnostic.line);
    }
    return idsOf(lines);
}

std::string refusal(std::string bytes) {
    try {
        read(std::move(bytes));
    } catch (const GedcomError& error) {
        return error.text();
    }
    return {};
}

std::string utf16(std::string_view ascii, bool bigEndian, bool marked) {
    std::string bytes;
    if (marked) bytes.append(bigEndian ? "\xFE\xFF" : "\xFF\xFE");
    for (const char c : ascii) {
        if (bigEndian) bytes.push_back('\0');
        bytes.push_back(c);
        if (!bigEndian) bytes.push_back('\0');
    }
    return bytes;
}

std::string bytesOfFile(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

}  // namespace olvane::gedcom::test
