// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::cli {

// A GEDCOM file and how it is to be read.
struct InputOptions {
    std::string file;      // "-" for the standard input
    std::string encoding;  // a label that gedcom::encodingLabelled knows; empty for the file's own
};

// Reads a GEDCOM file, or the standard input, and reports on stderr, by file and line, what was wrong in it: errors and warnings, but
// not notes, at most ten of a kind, and how many more there are.
// Fails: throws UsageError with a hint where there is nothing to read.
gedcom::GedcomData readFile(const InputOptions& input);

// As readFile, and keeps the facts of persons and couples.
gedcom::GedcomData readFileWithFacts(const InputOptions& input);

// As readFileWithFacts, and keeps notes, sources, media and the other details too.
gedcom::GedcomData readFileWithDetails(const InputOptions& input);

// The exit status of a command that has done its work with the data, unless it has one of its own: 1 where the file names an
// encoding that is not known or does not explain the text, so that letters may be wrong; else 0.
int statusOfReading(const gedcom::GedcomData& data);

// As readFile, with the diagnostics in the data and none on stderr: ten thousand of a kind, then their number.
gedcom::GedcomData readFileQuietly(const InputOptions& input);

}  // namespace olvane::cli
