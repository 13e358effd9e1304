// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <vector>

// The folder that OLVANE_GEDCOM_DIR names; empty where it is not set.
inline std::filesystem::path realGedcomFolder() {
    const char* const folder = std::getenv("OLVANE_GEDCOM_DIR");
    return folder == nullptr ? "" : folder;
}

// The GEDCOM files below a folder, in order of their paths.
inline std::vector<std::filesystem::path> gedcomFilesBelow(const std::filesystem::path& folder) {
    std::vector<std::filesystem::path> files;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
        if (entry.path().extension() == ".ged") files.push_back(entry.path());
    }
    std::sort(files.begin(), files.end());
    return files;
}
