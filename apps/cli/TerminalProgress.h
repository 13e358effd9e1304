// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <string>

#include <olvane/charts/ChartProgress.h>

namespace olvane::cli {

// How far long work is, in one line of stderr that is rewritten in place and removed at the end. On a terminal alone,
// and not in the first half second, so that quick work prints nothing.
//
// Holds: for one thread. Before a message is printed, clear is called.
class TerminalProgress {
public:
    TerminalProgress();
    TerminalProgress(const TerminalProgress&) = delete;
    TerminalProgress& operator=(const TerminalProgress&) = delete;
    ~TerminalProgress() { clear(); }

    // text: of less than 80 columns.
    void show(const std::string& text);
    // Before one call that is known to take long: also in the first half second.
    void announce(const std::string& text);
    void clear();

    // What shows the steps of a chart; null where there is no terminal. Valid as long as this lives.
    const charts::ChartProgress* ofChart() const { return isTerminal_ ? &chart_ : nullptr; }

private:
    bool isTerminal_;
    std::chrono::steady_clock::time_point start_;
    std::string shown_;
    charts::ChartProgress chart_;
};

}  // namespace olvane::cli
