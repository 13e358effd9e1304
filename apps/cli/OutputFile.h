// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/picture/TextSink.h>

#include <cli/InputFiles.h>

namespace olvane::cli {

// Output that stands for the standard output on the command line.
constexpr std::string_view kStandardOutput = "-";

// What an output must not replace.
struct OutputRules {
    InputFiles inputs;
    // In small letters: ".svg". An existing regular file is replaced only if its name ends in one of these,
    // whatever its capitals; under its own name and under that of a link that leads to it.
    std::vector<std::string> endings;
};

// Refuses a place that must not be written: an input file, an existing file of another ending, a directory, a
// disk, a file that may not be written. Touches nothing. "-" is the standard output and always allowed.
// Fails: throws UsageError.
void checkOutput(const std::string& path, const OutputRules& rules);

// Writes a whole file or nothing: first under a name of its own in the same folder, then renamed, so that a failure
// leaves what was there before. A file that is replaced keeps its permissions and, as far as the system allows,
// its owner and group; a new one has those that the umask leaves. "-" is the standard output; a character device
// or pipe is written straight.
// Fails: throws UsageError, also where checkOutput does; no partial file is left.
void writeOutput(const std::string& path, std::string_view content, const OutputRules& rules);

class TemporaryFile;

// Several files that come about together: each is written under a temporary name, and finish renames them all.
//
// Fails: add and finish throw UsageError. Unless finish has succeeded, none of the new files is left behind, and
//        files that were there before are as they were.
class OutputSet {
public:
    explicit OutputSet(OutputRules rules);
    OutputSet(const OutputSet&) = delete;
    OutputSet& operator=(const OutputSet&) = delete;
    ~OutputSet();

    // A character device or pipe is written straight.
    void add(const std::string& path, std::string_view content);
    void finish();

private:
    struct Part {
        std::string shownPath;
        std::unique_ptr<TemporaryFile> file;
    };
    OutputRules rules_;
    std::vector<Part> parts_;
};

// Writes to the standard output and makes sure that it arrived. A signal that is only marked does not cut it.
// Fails: throws UsageError.
void writeStandardOutput(std::string_view content);

// As writeStandardOutput, for text that holds what a file says: on a terminal it is written as visibleText.
void writeReport(std::string_view text);
// The same for a long report, which goes out while it is made.
void writeReport(const std::function<void(const picture::TextSink& write)>& make);

}  // namespace olvane::cli
