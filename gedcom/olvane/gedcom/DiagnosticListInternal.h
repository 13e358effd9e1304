// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/gedcom/GedcomDiagnostic.h>

namespace olvane::gedcom {

// Gathers diagnostics while a file is read.
//
// Holds: no more than a limit of one kind are listed, the rest are counted: memory does not grow with the trouble.
class DiagnosticList {
public:
    DiagnosticList(std::string file, std::size_t listedPerKind);

    // quoted is raw text from the file, shown behind what in part and made fit to print.
    void add(DiagnosticKind kind, Severity severity, std::uint32_t line, DiagnosticPhrase what,
             DiagnosticPhrase done, std::string_view quoted = {});
    void add(DiagnosticKind kind, Severity severity, std::uint32_t line, DiagnosticPhrase what,
             std::vector<DiagnosticPhrase> done, std::string_view quoted = {});

    // Counts one that is listed only once for the whole file, with its number, when all is read.
    void count(DiagnosticKind kind, std::uint32_t line);

    // Everything in the order of the lines, counts behind. Leaves the list empty.
    std::vector<Diagnostic> take();

private:
    static constexpr std::size_t kKinds = kDiagnosticKinds;

    struct Tally {
        std::size_t seen = 0;
        std::size_t onlyCounted = 0;
        std::uint32_t firstCountedLine = 0;
    };

    void listUnlisted();
    void listCounted();

    std::string file_;
    std::size_t listedPerKind_;
    std::array<Tally, kKinds> tallies_{};
    std::vector<Diagnostic> listed_;
};

}  // namespace olvane::gedcom
