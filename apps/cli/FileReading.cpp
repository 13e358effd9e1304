// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Reading with a person in front: what is wrong in a file goes to stderr, and the rest is used.

#include <cli/FileReading.h>

#include <olvane/gedcom/GedcomReader.h>

#include <cli/Messages.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

constexpr std::size_t kPerKind = 10;

void report(const gedcom::GedcomData& data) {
    for (const gedcom::Diagnostic& diagnostic : data.diagnostics()) {
        if (diagnostic.severity == gedcom::Severity::note) continue;
        tell(diagnostic);
    }
}

gedcom::GedcomData read(const std::string& path, const gedcom::ReadOptions& options) {
    try {
        return gedcom::readGedcomFile(path, options);
    } catch (const gedcom::GedcomError& error) {
        throw UsageError(std::string(error.what()) + " (a GEDCOM file is needed, .ged or .gdz)");
    }
}

}  // namespace

gedcom::GedcomData readFile(const std::string& path) {
    gedcom::ReadOptions options;
    options.diagnosticsPerKind = kPerKind;
    gedcom::GedcomData data = read(path, options);
    report(data);
    return data;
}

gedcom::GedcomData readFileQuietly(const std::string& path) {
    return read(path, gedcom::ReadOptions());
}

}  // namespace olvane::cli
