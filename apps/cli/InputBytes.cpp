// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/InputBytes.h>

#include <cerrno>
#include <cstddef>
#include <cstring>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cli/InputFiles.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

[[noreturn]] void refuse(const std::string& path) {
    throw UsageError(inputName(path) + ": cannot be read: " + std::strerror(errno));
}

// What a file has, so that it is read in one go, and a byte that then finds its end.
std::size_t roomFor(int descriptor) {
    constexpr std::size_t kBlock = 64 * 1024;
    struct stat status = {};
    const bool isFile = ::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode) && status.st_size > 0;
    return isFile ? static_cast<std::size_t>(status.st_size) + 1 : kBlock;
}

std::string readDescriptor(int descriptor, const std::string& path) {
    std::string bytes(roomFor(descriptor), '\0');
    std::size_t filled = 0;
    for (ssize_t got = 1; got != 0; filled += static_cast<std::size_t>(got)) {
        if (filled == bytes.size()) bytes.resize(2 * filled);
        do {
            got = ::read(descriptor, bytes.data() + filled, bytes.size() - filled);
        } while (got < 0 && errno == EINTR);
        if (got < 0) refuse(path);
    }
    bytes.resize(filled);
    return bytes;
}

class OpenFile {
public:
    explicit OpenFile(const std::string& path) : descriptor_(::open(path.c_str(), O_RDONLY | O_CLOEXEC)) {
        if (descriptor_ < 0) refuse(path);
    }
    OpenFile(const OpenFile&) = delete;
    OpenFile& operator=(const OpenFile&) = delete;
    ~OpenFile() { ::close(descriptor_); }
    int descriptor() const { return descriptor_; }

private:
    int descriptor_;
};

}  // namespace

std::string inputName(const std::string& path) {
    return path == kStandardInput ? "standard input" : path;
}

std::string readInputBytes(const std::string& path) {
    if (path == kStandardInput) return readDescriptor(STDIN_FILENO, path);
    const OpenFile file(path);
    return readDescriptor(file.descriptor(), path);
}

}  // namespace olvane::cli
