// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Reading with a person in front: what is wrong in a file goes to stderr, and the rest is used. A text whose encoding is in
// doubt ends the command with a status of its own, since a program that calls it reads no messages.

#include <cli/FileReading.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <map>
#include <system_error>

#include <olvane/gedcom/GedcomReader.h>

#include <cli/InputBytes.h>
#include <cli/InputFiles.h>
#include <cli/Messages.h>
#include <cli/TerminalProgress.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

constexpr std::size_t kPerKind = 10;     // printed on stderr
constexpr std::size_t kCounted = 10000;  // of a kind; those beyond are only counted, for memory's sake

// The first of each kind, and how many were kept back. Notes are for those who ask.
void report(const gedcom::GedcomData& data) {
    std::map<gedcom::DiagnosticKind, std::size_t> seen;
    std::size_t keptBack = 0;
    bool isWhole = true;
    for (const gedcom::Diagnostic& diagnostic : data.diagnostics()) {
        if (diagnostic.severity == gedcom::Severity::note) continue;
        const std::size_t ofKind = ++seen[diagnostic.kind];
        if (ofKind > kPerKind) {
            ++keptBack;
            isWhole = isWhole && ofKind < kCounted;
        } else {
            printMessage(diagnostic);
        }
    }
    if (keptBack == 0) return;
    const std::string command = data.file() == inputName(std::string(kStandardInput))
                                    ? "olvane check"
                                    : "olvane check " + data.file();
    printMessage(data.file() + ": and " + (isWhole ? "" : "at least ") + std::to_string(keptBack) +
                 " more; '" + command + "' lists them all");
}

// A file of this size takes about half a second.
constexpr std::uintmax_t kLargeFile = 32'000'000;

bool isLarge(const std::string& path) {
    std::error_code noSize;
    const std::uintmax_t size = std::filesystem::file_size(path, noSize);
    return !noSize && size >= kLargeFile;
}

gedcom::GedcomData readSource(const std::string& path, const gedcom::ReadOptions& options) {
    TerminalProgress progress;
    if (isLarge(path)) progress.announce("reading the file");
    if (path != kStandardInput) return gedcom::readGedcomFile(path, options);
    return gedcom::readGedcomBytes(readInputBytes(path), inputName(path), options);
}

gedcom::GedcomData read(const InputOptions& input, gedcom::ReadOptions options = {}) {
    options.diagnosticsPerKind = kCounted;
    options.encoding = input.encoding;
    try {
        return readSource(input.file, options);
    } catch (const gedcom::GedcomError& error) {
        throw UsageError(std::string(error.what()) + " (a GEDCOM file is needed, .ged or .gdz)");
    }
}

// The encoding of the file is in doubt: the one that its header names cannot be right, or is not known.
bool isAboutEncoding(const gedcom::Diagnostic& diagnostic) {
    return diagnostic.severity == gedcom::Severity::error &&
           (diagnostic.kind == gedcom::DiagnosticKind::encodingMismatch ||
            diagnostic.kind == gedcom::DiagnosticKind::encodingUnknown);
}

// What to type, below the diagnostic, which says the same in the words of every program.
void suggestEncoding(const gedcom::GedcomData& data) {
    for (const gedcom::Diagnostic& diagnostic : data.diagnostics()) {
        if (!isAboutEncoding(diagnostic)) continue;
        std::string name = "NAME";
        for (const gedcom::DiagnosticPhrase& phrase : diagnostic.done) {
            if (phrase.sentence == gedcom::DiagnosticSentence::looksLike) name = phrase.arguments.front();
        }
        printMessage(data.file() + ": try --encoding " + name);
    }
}

gedcom::GedcomData readAndReport(const InputOptions& input, const gedcom::ReadOptions& options = {}) {
    gedcom::GedcomData data = read(input, options);
    report(data);
    suggestEncoding(data);
    return data;
}

}  // namespace

gedcom::GedcomData readFile(const InputOptions& input) {
    return readAndReport(input);
}

gedcom::GedcomData readFileWithFacts(const InputOptions& input) {
    return readAndReport(input, {.facts = true});
}

gedcom::GedcomData readFileWithDetails(const InputOptions& input) {
    return readAndReport(input, {.details = true});
}

int statusOfReading(const gedcom::GedcomData& data) {
    const auto& diagnostics = data.diagnostics();
    return std::any_of(diagnostics.begin(), diagnostics.end(), isAboutEncoding) ? 1 : 0;
}

gedcom::GedcomData readFileQuietly(const InputOptions& input) {
    return read(input);
}

}  // namespace olvane::cli
