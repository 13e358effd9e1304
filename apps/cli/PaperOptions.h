// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane/draw/SheetPlan.h>

namespace CLI {
class App;
}

namespace olvane::cli {

// How large a drawing is, and on what paper.
struct PaperOptions {
    std::string fit;     // a paper, as draw::paperOf takes it; empty for a picture of its own size
    std::string sheets;  // "ROWSxCOLUMNS"; empty for one
    double scale = 0;    // by the size at 96 px an inch; 0 for what fits, and without paper for 1
    double dpi = 0;      // pixels an inch in PNG; 0 for 96, and on paper for 192

    bool onPaper() const { return !fit.empty(); }
    double pixelsOfPx() const;
};

void addPaperOptions(CLI::App& command, PaperOptions& options);

// Fails: throws UsageError for options that exclude one another or change nothing.
void checkPaperOptions(const PaperOptions& options, const std::string& output);

// In millimetres for each px. Fails: throws UsageError where it is no paper or no number of sheets.
draw::SheetRequest sheetRequestOf(const PaperOptions& options);

}  // namespace olvane::cli
