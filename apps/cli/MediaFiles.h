// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace olvane::cli {

// The media files that a GEDCOM file links to: members of the archive that it lies in, or files in its own folder and the
// folders below it.
//
// Holds: nothing outside these is read, by whatever path, address or symbolic link, and nothing is fetched.
class MediaFiles {
public:
    // The .ged or .gdz; "-" has no files. Fails: throws UsageError where an archive cannot be read.
    explicit MediaFiles(const std::string& gedcomPath);

    // file is as the GEDCOM file has it: a relative path, one with backslashes, a file: address. Nothing for what does not
    // exist, lies elsewhere, is no regular file or larger than that limit.
    // Fails: throws GedcomError for a damaged archive.
    std::optional<std::string> bytesOf(std::string_view file, std::size_t mostBytes) const;

private:
    std::optional<std::string> bytesInFolder(std::string_view file, std::size_t mostBytes) const;

    std::string archive_;  // its bytes; empty for none
    std::string path_;
    std::string folder_;  // without symbolic links; empty for none
};

}  // namespace olvane::cli
