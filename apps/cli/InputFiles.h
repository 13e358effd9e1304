// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>
#include <vector>

#include <sys/types.h>

namespace olvane::cli {

// Input that stands for the standard input on the command line.
constexpr std::string_view kStandardInput = "-";

// The regular files that a command reads, known by device and inode, so that a file is recognised by whatever name
// it is reached: another path, a symbolic or hard link, /dev/stdin, a redirection.
class InputFiles {
public:
    InputFiles() = default;
    // "-" is the standard input, an empty path is no file.
    explicit InputFiles(const std::vector<std::string>& paths);

    // Whether the path leads to one of the files.
    bool hasPath(const std::string& path) const;
    // Whether the descriptor is open on one of the files.
    bool hasDescriptor(int descriptor) const;

private:
    struct Identity {
        dev_t device;
        ino_t inode;
        bool operator==(const Identity&) const = default;
    };

    void addPath(const std::string& path);
    bool has(const Identity& identity) const;
    static std::vector<Identity> identityOf(const std::string& path);
    static std::vector<Identity> identityOf(int descriptor);

    std::vector<Identity> files_;
};

// Refuses to run where the standard output or the standard error would be written into one of the inputs, as with
// "olvane people tree.ged >> tree.ged". The standard error is closed to such a file before anything is printed.
// Fails: throws UsageError.
void refuseStreamsIntoInputs(const InputFiles& inputs);

}  // namespace olvane::cli
