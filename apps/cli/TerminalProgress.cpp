// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How far long work is, on a terminal.

#include <cli/TerminalProgress.h>

#include <iostream>

#include <unistd.h>

namespace olvane::cli {

namespace {

using charts::ChartStep;

constexpr std::chrono::milliseconds kQuick(500);

std::string sentenceOf(ChartStep step, double share) {
    switch (step) {
        case ChartStep::rows:
            return "choosing rows";
        case ChartStep::order:
            return "ordering rows: " + std::to_string(static_cast<int>(100 * share)) + "%";
        case ChartStep::places:
            return "placing persons";
        case ChartStep::lines:
            break;
    }
    return "routing lines";
}

}  // namespace

TerminalProgress::TerminalProgress()
    : isTerminal_(::isatty(STDERR_FILENO) != 0),
      start_(std::chrono::steady_clock::now()),
      chart_([this](ChartStep step, double share) { show(sentenceOf(step, share)); }) {}

void TerminalProgress::show(const std::string& text) {
    if (std::chrono::steady_clock::now() - start_ >= kQuick) announce(text);
}

void TerminalProgress::announce(const std::string& text) {
    if (!isTerminal_ || text == shown_) return;
    std::cerr << "\r\x1B[K" << text << std::flush;
    shown_ = text;
}

void TerminalProgress::clear() {
    if (shown_.empty()) return;
    std::cerr << "\r\x1B[K" << std::flush;
    shown_.clear();
}

}  // namespace olvane::cli
