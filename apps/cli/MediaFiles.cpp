// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Paths in GEDCOM files come from other machines. They are followed only where they stay within the folder of the file
// once every symbolic link is resolved.

#include <cli/MediaFiles.h>

#include <algorithm>
#include <array>
#include <filesystem>
#include <fstream>
#include <system_error>

#include <olvane/gedcom/GedcomMedia.h>

#include <cli/InputBytes.h>
#include <cli/InputFiles.h>

namespace olvane::cli {

namespace {

namespace fs = std::filesystem;

constexpr std::string_view kArchiveBegin = "PK\x03\x04";

bool beginsAsArchive(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    std::array<char, kArchiveBegin.size()> bytes{};
    file.read(bytes.data(), bytes.size());
    return file && std::string_view(bytes.data(), bytes.size()) == kArchiveBegin;
}

bool isWithin(const fs::path& folder, const fs::path& path) {
    const auto [inFolder, inPath] = std::mismatch(folder.begin(), folder.end(), path.begin(), path.end());
    return inFolder == folder.end() && inPath != path.end();
}

std::string withoutFileScheme(std::string_view file) {
    constexpr std::string_view kScheme = "file://";
    std::string path(file.starts_with(kScheme) ? file.substr(kScheme.size()) : file);
    std::replace(path.begin(), path.end(), '\\', '/');
    return path;
}

}  // namespace

MediaFiles::MediaFiles(const std::string& gedcomPath) : path_(gedcomPath) {
    if (gedcomPath == kStandardInput) return;
    if (beginsAsArchive(gedcomPath)) {
        archive_ = readInputBytes(gedcomPath);
        return;
    }
    std::error_code error;
    const fs::path folder = fs::canonical(fs::path(gedcomPath), error).parent_path();
    if (!error) folder_ = folder.string();
}

std::optional<std::string> MediaFiles::bytesOf(std::string_view file, std::size_t mostBytes) const {
    if (!archive_.empty()) return gedcom::readFromArchive(archive_, path_, file, mostBytes);
    if (folder_.empty() || file.find('\0') != std::string_view::npos) return {};
    return bytesInFolder(file, mostBytes);
}

// A path as it is written comes first, then as an address with percent signs.
std::optional<std::string> MediaFiles::bytesInFolder(std::string_view file, std::size_t mostBytes) const {
    const std::string written = withoutFileScheme(file);
    for (const std::string& path : {written, gedcom::memberOfArchive(written).value_or("")}) {
        if (path.empty()) continue;
        std::error_code error;
        const fs::path found = fs::canonical(fs::path(folder_) / path, error);
        if (error || !isWithin(folder_, found) || !fs::is_regular_file(found, error)) continue;
        if (fs::file_size(found, error) > mostBytes || error) return {};
        std::string bytes = readInputBytes(found.string());
        if (bytes.size() <= mostBytes) return bytes;
    }
    return {};
}

}  // namespace olvane::cli
