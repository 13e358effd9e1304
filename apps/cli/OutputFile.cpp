// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Output that is whole or not there, and never in the place of anything but an earlier output.

#include <cli/OutputFile.h>

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cli/JoinedTexts.h>
#include <cli/TemporaryFile.h>
#include <cli/TerminalText.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace fs = std::filesystem;

namespace {

[[noreturn]] void refuse(const std::string& path, int error) {
    throw UsageError(path + ": cannot be written: " + std::strerror(error));
}

// Into a character device or pipe, which has nothing to lose.
void writeStraight(const std::string& path, std::string_view content) {
    const int descriptor = ::open(path.c_str(), O_WRONLY | O_CLOEXEC);
    if (descriptor < 0) refuse(path, errno);
    int error = 0;
    try {
        writeFully(descriptor, content);
    } catch (const std::system_error& failure) {
        error = failure.code().value();
    }
    if (::close(descriptor) != 0 && error == 0) error = errno;
    if (error != 0) refuse(path, error);
}

bool isStream(const std::string& path) {
    struct stat status = {};
    return ::stat(path.c_str(), &status) == 0 && (S_ISCHR(status.st_mode) || S_ISFIFO(status.st_mode));
}

// Where a link leads to, so that the link stays; also where nothing is there yet.
fs::path withoutLinks(fs::path path) {
    constexpr int kMostLinks = 40;  // as the system's own
    std::error_code error;
    fs::path existing = fs::canonical(path, error);
    if (!error) return existing;
    for (int i = 0; i < kMostLinks && fs::is_symlink(fs::symlink_status(path, error)); ++i) {
        const fs::path target = fs::read_symlink(path, error);
        path = target.is_absolute() ? target : path.parent_path() / target;
    }
    return path;
}

bool hasEnding(const fs::path& path, const std::vector<std::string>& endings) {
    std::string name = path.filename().string();
    for (char& c : name) {
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    }
    return std::any_of(endings.begin(), endings.end(), [&name](const std::string& ending) {
        return name.size() > ending.size() && name.ends_with(ending);
    });
}

void checkRegularFile(const std::string& path, const OutputRules& rules) {
    if (rules.inputs.hasPath(path)) {
        throw UsageError(path + ": is the input file, which is never written to; name another file");
    }
    const fs::path place = withoutLinks(path);
    if (!hasEnding(path, rules.endings) || !hasEnding(place, rules.endings)) {
        throw UsageError(path + ": is there already and is not replaced, since its name does not end in " +
                         joined(rules.endings, " or ") + "; name another file");
    }
    if (::faccessat(AT_FDCWD, place.c_str(), W_OK, AT_EACCESS) != 0) refuse(path, errno);
}

}  // namespace

void checkOutput(const std::string& path, const OutputRules& rules) {
    if (path == kStandardOutput) return;
    struct stat status = {};
    if (::stat(path.c_str(), &status) != 0) return;
    if (S_ISDIR(status.st_mode)) refuse(path, EISDIR);
    if (S_ISREG(status.st_mode)) return checkRegularFile(path, rules);
    if (!isStream(path)) throw UsageError(path + ": is a disk or a socket, and is not written to");
}

OutputSet::OutputSet(OutputRules rules) : rules_(std::move(rules)) {}
OutputSet::~OutputSet() = default;

void OutputSet::add(const std::string& path, std::string_view content) {
    checkOutput(path, rules_);
    if (isStream(path)) return writeStraight(path, content);
    try {
        parts_.push_back({path, std::make_unique<TemporaryFile>(withoutLinks(path), content)});
    } catch (const std::system_error& error) {
        refuse(path, error.code().value());
    }
}

void OutputSet::finish() {
    for (const Part& part : parts_) {
        try {
            checkOutput(part.shownPath, rules_);
            part.file->publish();
        } catch (const std::system_error& error) {
            refuse(part.shownPath, error.code().value());
        }
    }
    for (const Part& part : parts_) part.file->keep();
}

void writeOutput(const std::string& path, std::string_view content, const OutputRules& rules) {
    if (path == kStandardOutput) return writeStandardOutput(content);
    OutputSet set(rules);
    set.add(path, content);
    set.finish();
}

// Past the stream of the C library, which loses its place when a signal breaks into a write.
void writeStandardOutput(std::string_view content) {
    if (std::fflush(stdout) != 0) refuse("standard output", errno);
    try {
        writeFully(STDOUT_FILENO, content);
    } catch (const std::system_error& error) {
        refuse("standard output", error.code().value());
    }
}

void writeReport(std::string_view text) {
    writeReport([text](const picture::TextSink& write) { write(text); });
}

void writeReport(const std::function<void(const picture::TextSink& write)>& make) {
    TextPieces pieces(STDOUT_FILENO, writeStandardOutput);
    make([&pieces](std::string_view piece) { pieces.add(piece); });
    pieces.finish();
}

}  // namespace olvane::cli
