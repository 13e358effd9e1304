// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <stdexcept>
#include <string>

namespace olvane::gedcom {

// Thrown where there is nothing to read: the file cannot be opened, is a directory, is empty, holds nothing
// that looks like GEDCOM, or is an archive that cannot be unpacked.
//
// Holds: what() is one line, "FILE: TEXT", fit to be shown to a user as it is.
class GedcomError : public std::runtime_error {
public:
    GedcomError(const std::string& file, const std::string& text)
        : std::runtime_error(file + ": " + text), file_(file), text_(text) {}

    const std::string& file() const { return file_; }
    const std::string& text() const { return text_; }

private:
    std::string file_;
    std::string text_;
};

}  // namespace olvane::gedcom
