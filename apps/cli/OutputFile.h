// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace olvane::cli {

// Writes a whole file or nothing: first beside its place, then moved there, so that a failure leaves what was
// there before. "-" is the standard output; a device or pipe is written straight.
// Fails: throws UsageError; no partial file is left.
void writeOutput(const std::string& path, std::string_view content);

class FileBeside;

// Several files that come about together: each is written beside its place, and finish moves them all.
//
// Fails: add and finish throw UsageError. Unless finish has succeeded, none of the files is left behind, and
//        while only add has failed, what was there before stays.
class OutputSet {
public:
    OutputSet();
    OutputSet(const OutputSet&) = delete;
    OutputSet& operator=(const OutputSet&) = delete;
    ~OutputSet();

    // A device or pipe is written straight.
    void add(const std::string& path, std::string_view content);
    void finish();

private:
    struct Part {
        std::string shownPath;
        std::unique_ptr<FileBeside> file;
    };
    std::vector<Part> parts_;
};

// Writes to the standard output and makes sure that it arrived. A signal that is only marked does not cut it.
// Fails: throws UsageError.
void writeStandardOutput(std::string_view content);

}  // namespace olvane::cli
