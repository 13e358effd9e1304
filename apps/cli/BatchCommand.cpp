// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lays out many persons: a line for each, in the order asked for, over all cores. Focuses are taken in
// blocks; a block is laid out in parallel and then written line by line. An interrupt ends the work behind
// the line being written.

#include <cli/Commands.h>

#include <csignal>
#include <fstream>
#include <iostream>
#include <memory>

#include <unistd.h>

#include <olvane/gedcom/PersonSearch.h>

#include <cli/FileReading.h>
#include <cli/Messages.h>
#include <cli/OutputFile.h>
#include <cli/ParallelWork.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

constexpr std::size_t kBlock = 256;
constexpr int kInterrupted = 130;  // what shells make of an interrupt

volatile std::sig_atomic_t interrupted = 0;

// While it lives, an interrupt or a request to end only sets a mark. A second one ends the command at once.
class InterruptMark {
public:
    InterruptMark() {
        struct sigaction action = {};
        action.sa_handler = [](int) { interrupted = 1; };
        action.sa_flags = static_cast<int>(SA_RESETHAND);
        sigaction(SIGINT, &action, nullptr);
        sigaction(SIGTERM, &action, nullptr);
    }
    InterruptMark(const InterruptMark&) = delete;
    InterruptMark& operator=(const InterruptMark&) = delete;
    ~InterruptMark() {
        std::signal(SIGINT, SIG_DFL);
        std::signal(SIGTERM, SIG_DFL);
    }
};

// The focuses, one after the other: everybody of the file, or the lines of a stream.
class FocusList {
public:
    FocusList(const gedcom::GedcomData& data, const std::string& from) : data_(data) {
        if (from.empty()) return;
        if (from != "-") {
            file_ = std::make_unique<std::ifstream>(from);
            if (!*file_) throw UsageError(from + ": cannot be read");
        }
        lines_ = file_ ? file_.get() : &std::cin;
    }

    // How many there will be; 0 where that cannot be known.
    std::size_t total() const { return lines_ == nullptr ? data_.personCount() : 0; }

    std::vector<std::string> nextBlock() {
        std::vector<std::string> block;
        for (std::string focus; block.size() < kBlock && next(focus);) block.push_back(focus);
        return block;
    }

private:
    bool next(std::string& focus) {
        if (lines_ == nullptr) {
            if (given_ == data_.personCount()) return false;
            focus = std::to_string(++given_);
            return true;
        }
        while (std::getline(*lines_, focus)) {
            if (!focus.empty() && focus.back() == '\r') focus.pop_back();
            if (!focus.empty()) return true;
        }
        return false;
    }

    const gedcom::GedcomData& data_;
    std::unique_ptr<std::ifstream> file_;
    std::istream* lines_ = nullptr;
    std::size_t given_ = 0;
};

// On a terminal alone, and on stderr, so that results stay clean.
class ProgressBar {
public:
    explicit ProgressBar(std::size_t total) : total_(total), shown_(::isatty(STDERR_FILENO) != 0) {}
    ProgressBar(const ProgressBar&) = delete;
    ProgressBar& operator=(const ProgressBar&) = delete;
    ~ProgressBar() {
        if (shown_) std::cerr << "\r\x1B[K" << std::flush;
    }

    void show(std::size_t done) const {
        if (!shown_) return;
        std::cerr << '\r' << done;
        if (total_ > 0) {
            const std::size_t width = 40 * done / total_;
            std::cerr << " of " << total_ << " [" << std::string(width, '=') << std::string(40 - width, ' ')
                      << ']';
        }
        std::cerr << std::flush;
    }

private:
    std::size_t total_;
    bool shown_;
};

struct BatchLine {
    std::string text;
    bool isKnown = false;
};

// Ids and xrefs are what this is for; a name serves where it means one person.
BatchLine lineFor(const gedcom::GedcomData& data, const std::string& focus, const LayoutRequest& request) {
    const auto found = gedcom::findPersons(data, focus, 2);
    if (found.size() != 1) return {focus + "\t\n", false};
    return {std::to_string(found.front()) + "\t" + layoutText(data, found.front(), request) + "\n", true};
}

}  // namespace

int runBatch(const BatchOptions& options) {
    const gedcom::GedcomData data = readFile(options.file);
    FocusList focuses(data, options.focusFrom);
    const ProgressBar progress(focuses.total());
    const InterruptMark mark;
    std::size_t done = 0;
    std::size_t unknown = 0;
    for (auto block = focuses.nextBlock(); !block.empty() && interrupted == 0; block = focuses.nextBlock()) {
        std::vector<BatchLine> lines(block.size());
        inParallel(block.size(), [&](std::size_t i) {
            if (interrupted == 0) lines[i] = lineFor(data, block[i], options.request);
        });
        for (std::size_t i = 0; i < lines.size() && interrupted == 0; ++i, ++done) {
            writeStandardOutput(lines[i].text);
            if (lines[i].isKnown) continue;
            ++unknown;
            tell(options.file + ": '" + block[i] + "' is not one person");
        }
        progress.show(done);
    }
    if (interrupted != 0) return kInterrupted;
    return unknown == 0 ? 0 : 1;
}

}  // namespace olvane::cli
