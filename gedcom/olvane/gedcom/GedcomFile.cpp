// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Reading files, apart from the rest, since not every host has a file system. A pipe has no size beforehand,
// so the size is a guess that saves copying and no more.

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <memory>
#include <system_error>
#include <utility>

#include <olvane/gedcom/GedcomReader.h>

namespace olvane::gedcom {
namespace {

struct CloseFile {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

// Throws if the path is nothing that can be read to an end.
void refuseUnreadable(const std::string& path) {
    std::error_code error;
    const std::filesystem::file_status status = std::filesystem::status(path, error);
    switch (status.type()) {
        case std::filesystem::file_type::not_found:
            throw GedcomError(path, "does not exist");
        case std::filesystem::file_type::directory:
            throw GedcomError(path, "is a directory");
        case std::filesystem::file_type::block:
        case std::filesystem::file_type::character:
        case std::filesystem::file_type::socket:
            throw GedcomError(path, "is a device, not a file");
        default:
            return;
    }
}

std::size_t expectedSize(const std::string& path) {
    std::error_code error;
    const auto size = std::filesystem::file_size(path, error);
    return error ? 0 : static_cast<std::size_t>(size);
}

std::string readAll(std::FILE* file, const std::string& path) {
    constexpr std::size_t kLeastBlock = 64 * 1024;
    std::string bytes(expectedSize(path) + 1, '\0');
    std::size_t filled = 0;
    for (;;) {
        if (filled == bytes.size()) bytes.resize(bytes.size() + std::max(bytes.size(), kLeastBlock));
        const std::size_t got = std::fread(bytes.data() + filled, 1, bytes.size() - filled, file);
        filled += got;
        if (got == 0) break;
    }
    if (std::ferror(file) != 0)
        throw GedcomError(path, std::string("cannot be read: ") + std::strerror(errno));
    bytes.resize(filled);
    return bytes;
}

}  // namespace

GedcomData readGedcomFile(const std::string& path, const ReadOptions& options) {
    refuseUnreadable(path);
    const std::unique_ptr<std::FILE, CloseFile> file(std::fopen(path.c_str(), "rb"));
    if (file == nullptr) throw GedcomError(path, std::string("cannot be opened: ") + std::strerror(errno));
    return readGedcomBytes(readAll(file.get(), path), path, options);
}

}  // namespace olvane::gedcom
