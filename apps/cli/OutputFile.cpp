// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Output that is whole or not there.

#include <cli/OutputFile.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <system_error>

#include <unistd.h>

#include <cli/UsageError.h>

namespace olvane::cli {

namespace fs = std::filesystem;

namespace {

[[noreturn]] void refuse(const std::string& path, int error) {
    throw UsageError(path + ": cannot be written: " + std::strerror(error));
}

void writeStraight(const std::string& shownPath, const std::string& path, std::string_view content) {
    std::FILE* file = std::fopen(path.c_str(), "wb");
    if (file == nullptr) refuse(shownPath, errno);
    const bool written = std::fwrite(content.data(), 1, content.size(), file) == content.size();
    const int writeError = errno;
    const bool closed = std::fclose(file) == 0;
    if (!written) refuse(shownPath, writeError);
    if (!closed) refuse(shownPath, errno);
}

bool isSpecial(const fs::path& path) {
    std::error_code ignored;
    const fs::file_status status = fs::status(path, ignored);
    return fs::exists(status) && !fs::is_regular_file(status) && !fs::is_directory(status);
}

// Where a link leads to, so that the link stays.
fs::path withoutLinks(const fs::path& path) {
    std::error_code error;
    const fs::path target = fs::canonical(path, error);
    return error ? path : target;
}

}  // namespace

// Removes the file beside the place unless it was moved there.
class FileBeside {
public:
    explicit FileBeside(const fs::path& place) : place_(place), path_(place) {
        path_ += ".part" + std::to_string(::getpid());
    }
    FileBeside(const FileBeside&) = delete;
    FileBeside& operator=(const FileBeside&) = delete;
    ~FileBeside() {
        std::error_code ignored;
        if (!moved_) fs::remove(path_, ignored);
    }

    const fs::path& path() const { return path_; }

    void move(const std::string& shownPath) {
        std::error_code error;
        fs::rename(path_, place_, error);
        if (error) refuse(shownPath, error.value());
        moved_ = true;
    }

    void removeMoved() {
        std::error_code ignored;
        if (moved_) fs::remove(place_, ignored);
    }

private:
    fs::path place_;
    fs::path path_;
    bool moved_ = false;
};

OutputSet::OutputSet() = default;
OutputSet::~OutputSet() = default;

void OutputSet::add(const std::string& path, std::string_view content) {
    if (fs::is_directory(path)) refuse(path, EISDIR);
    if (isSpecial(path)) return writeStraight(path, path, content);
    parts_.push_back({path, std::make_unique<FileBeside>(withoutLinks(path))});
    writeStraight(path, parts_.back().file->path().string(), content);
}

void OutputSet::finish() {
    try {
        for (const Part& part : parts_) part.file->move(part.shownPath);
    } catch (...) {
        for (const Part& part : parts_) part.file->removeMoved();
        throw;
    }
}

void writeOutput(const std::string& path, std::string_view content) {
    if (path == "-") return writeStandardOutput(content);
    OutputSet set;
    set.add(path, content);
    set.finish();
}

// Past the stream of the C library, which loses its place when a signal breaks into a write.
void writeStandardOutput(std::string_view content) {
    if (std::fflush(stdout) != 0) refuse("standard output", errno);
    while (!content.empty()) {
        const ssize_t written = ::write(STDOUT_FILENO, content.data(), content.size());
        if (written < 0 && errno != EINTR) refuse("standard output", errno);
        if (written > 0) content.remove_prefix(static_cast<std::size_t>(written));
    }
}

}  // namespace olvane::cli
