// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/gedcom/GedcomError.h>

namespace olvane::gedcom {

struct ReadOptions {
    // The most diagnostics of one kind that are listed singly; one more then states how many there were.
    std::size_t diagnosticsPerKind = 100;
    // Whether events and attributes are kept beyond birth, death and marriage, with their places. They take
    // memory, and a layout needs none of them.
    bool facts = false;
    // Whether notes, sources, media, addresses, causes, ages and links are kept too, with the records that they lie in.
    // Implies facts.
    bool details = false;
    // The encoding of the file, by any name that GedcomEncodings.h knows. Empty: as the file says and its bytes allow.
    std::string encoding = {};
    // Called every some thousand lines with how many bytes have been read, and of how many. May be null.
    void (*progress)(std::size_t done, std::size_t all) = nullptr;
};

// Reads the bytes of a GEDCOM file, 5.5 to 7.0, or of a .gdz archive, in any encoding that is known.
// name stands for the file in diagnostics and errors. Time and memory grow with the size of the bytes alone;
// nesting depth and length of lines have no limit.
// Fails: throws GedcomError as stated there, std::bad_alloc. Everything else is a diagnostic in the result.
GedcomData readGedcomBytes(std::string bytes, const std::string& name, const ReadOptions& options = {});

// Reads a file, or whatever a pipe of that name gives. Fails as readGedcomBytes does.
GedcomData readGedcomFile(const std::string& path, const ReadOptions& options = {});

}  // namespace olvane::gedcom
