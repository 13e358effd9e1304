// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace olvane::cli {

// Writes all of it, however often a signal breaks in. Fails: std::system_error.
void writeFully(int descriptor, std::string_view content);

// A file on its way to its place: written under a name of its own in the same folder, then renamed over the place.
//
// Holds: while it is written, nobody may read it who could not read the file that it replaces.
// Fails: the constructor and publish throw std::system_error. Until keep is called, the destructor removes what was
//        written and puts back what stood in the place.
class TemporaryFile {
public:
    // Writes the content. place: where the file goes in the end; no symbolic link.
    TemporaryFile(std::filesystem::path place, std::string_view content);
    TemporaryFile(const TemporaryFile&) = delete;
    TemporaryFile& operator=(const TemporaryFile&) = delete;
    ~TemporaryFile();

    // Puts the file into its place; what stood there is kept under the temporary name where the file system can
    // exchange two names.
    void publish();
    // Makes it final.
    void keep();

private:
    enum class State { written, published, exchanged, kept };

    void create(bool replaces);
    void fill(bool replaces, std::string_view content) const;
    void takeOverPermissions() const;

    std::filesystem::path place_;
    std::filesystem::path path_;
    State state_ = State::written;
    int descriptor_ = -1;
};

}  // namespace olvane::cli
