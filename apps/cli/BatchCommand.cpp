// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lays out many persons: a line for each line of the input, in the same order, over all cores. Focuses are read in
// blocks; a block is laid out in parallel and then written line by line. An interrupt ends the work behind
// the line being written.

#include <cli/Commands.h>

#include <algorithm>
#include <charconv>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <functional>
#include <iostream>
#include <memory>

#include <unistd.h>

#include <cli/FileReading.h>
#include <cli/InputFiles.h>
#include <cli/Messages.h>
#include <cli/OutputFile.h>
#include <cli/ParallelWork.h>
#include <cli/PictureRun.h>
#include <cli/TableCells.h>
#include <cli/TerminalProgress.h>
#include <cli/UsageError.h>
#include <olvane/source/PersonFinder.h>

namespace olvane::cli {

namespace {

constexpr std::size_t kBlock = 256;
// Bytes of a line that a thread writes ahead; longer ones, of which a block could fill the memory, are written in turn.
constexpr std::size_t kMostOfLine = 256 * 1024;
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

struct BatchFocus {
    std::string written;      // as the stream has it; empty where everybody is taken
    gedcom::PersonId id = 0;  // 0 where the words mean nobody, or several persons
};

// The person of a bare number; 0 for other words and for numbers beyond the last person.
gedcom::PersonId idOfNumber(const gedcom::GedcomData& data, const std::string& written) {
    gedcom::PersonId id = 0;
    const char* const end = written.data() + written.size();
    const auto [stop, error] = std::from_chars(written.data(), end, id);
    return error == std::errc() && stop == end && id <= data.personCount() ? id : 0;
}

// The focuses, one after the other: everybody of the file, or the lines of a stream.
//
// Fails: throws UsageError where the stream cannot be opened or breaks off.
class FocusList {
public:
    // perBlock: how many focuses a block has; with 1, a line is answered before the next one is waited for.
    FocusList(const gedcom::GedcomData& data, const std::string& from, std::size_t perBlock)
        : data_(data), finder_(data), from_(from), perBlock_(perBlock) {
        if (from.empty()) return;
        if (from != "-") {
            if (std::filesystem::is_directory(from)) {
                throw UsageError(from + ": is a directory; a file with an id on each line is needed");
            }
            file_ = std::make_unique<std::ifstream>(from);
            if (!*file_) throw UsageError(from + ": cannot be read");
        }
        lines_ = file_ ? file_.get() : &std::cin;
    }

    // How many there will be; 0 where that cannot be known.
    std::size_t total() const { return lines_ == nullptr ? data_.personCount() : 0; }

    std::vector<BatchFocus> nextBlock() {
        std::vector<BatchFocus> block;
        for (BatchFocus focus; block.size() < perBlock_ && next(focus);) block.push_back(focus);
        return block;
    }

private:
    bool next(BatchFocus& focus) {
        if (lines_ == nullptr) return nextPerson(focus);
        std::string& written = focus.written;
        if (std::getline(*lines_, written)) {
            if (!written.empty() && written.back() == '\r') written.pop_back();
            focus.id = personOf(written);
            return true;
        }
        if (lines_->bad() && interrupted == 0) throw UsageError(from_ + ": cannot be read to its end");
        return false;
    }

    // A number is an id first, as this command itself and the list of persons print it, even where a file has
    // numbers for xrefs. Then xrefs; a name serves where it means one person.
    gedcom::PersonId personOf(const std::string& written) {
        const gedcom::PersonId id = idOfNumber(data_, written);
        if (id != 0 || written.empty()) return id;
        const std::vector<gedcom::PersonId> found = finder_.meant(written);
        return found.size() == 1 ? found.front() : 0;
    }

    bool nextPerson(BatchFocus& focus) {
        if (given_ == data_.personCount()) return false;
        focus.id = ++given_;
        return true;
    }

    const gedcom::GedcomData& data_;
    gedcom::PersonFinder finder_;
    std::string from_;
    std::size_t perBlock_;
    std::unique_ptr<std::ifstream> file_;
    std::istream* lines_ = nullptr;
    gedcom::PersonId given_ = 0;
};

// "12 of 80 [======        ]"; without a total, the number alone.
std::string barOf(std::size_t done, std::size_t total) {
    if (total == 0) return std::to_string(done);
    const std::size_t width = 40 * done / total;
    return std::to_string(done) + " of " + std::to_string(total) + " [" + std::string(width, '=') +
           std::string(40 - width, ' ') + "]";
}

// Writes text.
using Writing = std::function<void(const picture::TextSink& write)>;
// Works out what follows the id on a line, and leaves the writing to be done: once or several times, on any thread.
using Answer = std::function<Writing(gedcom::PersonId id)>;

struct BatchLine {
    std::string text;
    bool isKnown = false;
    Writing
        rest;  // set where the line is longer than a thread may hold: what stands between text and the line end
};

// JSON has line ends between its values alone.
class OneLine {
public:
    explicit OneLine(const picture::TextSink& write) : write_(write) {}

    void add(std::string_view json) {
        while (!json.empty()) {
            if (isAfterLineEnd_) json.remove_prefix(std::min(json.find_first_not_of(' '), json.size()));
            if (json.empty()) return;
            const std::size_t end = std::min(json.find('\n'), json.size());
            write_(json.substr(0, end));
            isAfterLineEnd_ = end < json.size();
            json.remove_prefix(end + (isAfterLineEnd_ ? 1 : 0));
        }
    }

private:
    const picture::TextSink& write_;
    bool isAfterLineEnd_ = false;
};

BatchLine lineFor(const BatchFocus& focus, const Answer& answer) {
    if (focus.id == 0) return {escapedField(focus.written) + "\t\n", false, nullptr};
    BatchLine line{std::to_string(focus.id) + "\t", true, answer(focus.id)};
    const std::size_t start = line.text.size();
    bool isWhole = true;
    line.rest([&](std::string_view piece) {
        isWhole = isWhole && line.text.size() + piece.size() <= kMostOfLine;
        if (isWhole) line.text += piece;
    });
    if (isWhole) {
        line.rest = nullptr;
        line.text += '\n';
    } else {
        line.text.resize(start);
        line.text.shrink_to_fit();
    }
    return line;
}

void writeLine(const BatchLine& line) {
    if (!line.rest) return writeReport(line.text);
    writeReport([&line](const picture::TextSink& write) {
        write(line.text);
        line.rest(write);
        write("\n");
    });
}

// The result text of a view of the engine, or else the picture.
Answer answerOf(const gedcom::GedcomData& data, const LayoutRequest& request) {
    if (isEngineView(request.view())) {
        return [&](gedcom::PersonId id) {
            return [text = layoutText(data, id, request)](const picture::TextSink& write) { write(text); };
        };
    }
    const auto run = std::make_shared<PictureRun>(data, request, std::vector<bool>());
    return [run](gedcom::PersonId id) {
        const auto picture = std::make_shared<const picture::Picture>(run->pictureOf(id));
        return [run, picture](const picture::TextSink& write) {
            OneLine line(write);
            run->writeJson(*picture, [&line](std::string_view piece) { line.add(piece); });
        };
    };
}

}  // namespace

int runBatch(const BatchOptions& options) {
    if (options.input.file == kStandardInput && options.focusFrom == kStandardInput) {
        throw UsageError(
            "the standard input cannot hold both the family and the focuses; name a file for one");
    }
    const gedcom::GedcomData data = readFile(options.input);
    const Answer answer = answerOf(data, options.request);
    FocusList focuses(data, options.focusFrom, options.unbuffered ? 1 : kBlock);
    TerminalProgress progress;
    const InterruptMark mark;
    std::size_t done = 0;
    std::size_t unknown = 0;
    for (auto block = focuses.nextBlock(); !block.empty() && interrupted == 0; block = focuses.nextBlock()) {
        std::vector<BatchLine> lines(block.size());
        inParallel(block.size(), [&](std::size_t i) {
            if (interrupted == 0) lines[i] = lineFor(block[i], answer);
        });
        for (std::size_t i = 0; i < lines.size() && interrupted == 0; ++i, ++done) {
            writeLine(lines[i]);
            if (lines[i].isKnown) continue;
            ++unknown;
            progress.clear();
            printMessage(options.input.file + ": '" + block[i].written + "' is not one person");
        }
        progress.show(barOf(done, focuses.total()));
    }
    if (interrupted != 0) return kInterrupted;
    return unknown == 0 ? statusOfReading(data) : 1;
}

}  // namespace olvane::cli
