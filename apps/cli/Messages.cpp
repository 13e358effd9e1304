// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Messages to the user beside the results.

#include <cli/Messages.h>

#include <cstdlib>
#include <iostream>

#include <unistd.h>

#include <cli/TerminalText.h>

namespace olvane::cli {

namespace {

const char* const kRed = "\x1B[1;31m";
const char* const kYellow = "\x1B[33m";
const char* const kPlain = "\x1B[0m";

bool coloursWanted() {
    static const bool kWanted = [] {
        const char* noColour = std::getenv("NO_COLOR");
        return ::isatty(STDERR_FILENO) != 0 && (noColour == nullptr || *noColour == '\0');
    }();
    return kWanted;
}

void print(const std::string& message, const char* colour) {
    const std::string text = textFor(STDERR_FILENO, message);
    if (coloursWanted()) {
        std::cerr << colour << text << kPlain << '\n';
    } else {
        std::cerr << text << '\n';
    }
}

}  // namespace

void printMessage(const std::string& text) {
    print("olvane: " + text, kRed);
}

void printMessage(const gedcom::Diagnostic& diagnostic) {
    print(gedcom::formatDiagnostic(diagnostic),
          diagnostic.severity == gedcom::Severity::error ? kRed : kYellow);
}

}  // namespace olvane::cli
