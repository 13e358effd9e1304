// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Reading with a person in front: what is wrong in a file goes to stderr, and the rest is used.

#include <cli/FileReading.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <cstddef>
#include <cstdio>
#include <cstring>

#include <olvane/gedcom/GedcomReader.h>

#include <cli/InputFiles.h>
#include <cli/Messages.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

const char* const kStandardInputName = "standard input";  // in messages
constexpr std::size_t kPerKind = 10;                      // told on stderr
constexpr std::size_t kCounted = 10000;  // of a kind; those beyond are told as a number, for memory's sake

// The first of each kind, and how many were kept back. Notes are for those who ask.
void report(const gedcom::GedcomData& data) {
    std::array<std::size_t, static_cast<std::size_t>(gedcom::DiagnosticKind::moreOfAKind) + 1> seen{};
    std::size_t keptBack = 0;
    bool isWhole = true;
    for (const gedcom::Diagnostic& diagnostic : data.diagnostics()) {
        if (diagnostic.severity == gedcom::Severity::note) continue;
        const std::size_t ofKind = ++seen[static_cast<std::size_t>(diagnostic.kind)];
        if (ofKind > kPerKind) {
            ++keptBack;
            isWhole = isWhole && ofKind < kCounted;
        } else {
            tell(diagnostic);
        }
    }
    if (keptBack == 0) return;
    const std::string command =
        data.file() == kStandardInputName ? "olvane check" : "olvane check " + data.file();
    tell(data.file() + ": and " + (isWhole ? "" : "at least ") + std::to_string(keptBack) + " more; '" +
         command + "' lists them all");
}

std::string readStandardInput() {
    constexpr std::size_t kBlock = 64 * 1024;
    std::string bytes;
    for (std::size_t got = 1; got != 0;) {
        const std::size_t filled = bytes.size();
        bytes.resize(filled + std::max(filled, kBlock));
        got = std::fread(bytes.data() + filled, 1, bytes.size() - filled, stdin);
        bytes.resize(filled + got);
    }
    if (std::ferror(stdin) != 0) {
        throw gedcom::GedcomError(kStandardInputName, std::string("cannot be read: ") + std::strerror(errno));
    }
    return bytes;
}

gedcom::GedcomData readSource(const std::string& path, const gedcom::ReadOptions& options) {
    if (path != kStandardInput) return gedcom::readGedcomFile(path, options);
    return gedcom::readGedcomBytes(readStandardInput(), kStandardInputName, options);
}

gedcom::GedcomData read(const InputOptions& input, bool facts = false) {
    gedcom::ReadOptions options;
    options.diagnosticsPerKind = kCounted;
    options.facts = facts;
    options.encoding = input.encoding;
    try {
        return readSource(input.file, options);
    } catch (const gedcom::GedcomError& error) {
        throw UsageError(std::string(error.what()) + " (a GEDCOM file is needed, .ged or .gdz)");
    }
}

}  // namespace

gedcom::GedcomData readFile(const InputOptions& input) {
    gedcom::GedcomData data = read(input);
    report(data);
    return data;
}

gedcom::GedcomData readFileWithFacts(const InputOptions& input) {
    gedcom::GedcomData data = read(input, true);
    report(data);
    return data;
}

gedcom::GedcomData readFileQuietly(const InputOptions& input) {
    return read(input);
}

}  // namespace olvane::cli
