// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/InputBytes.h>

#include <algorithm>
#include <cerrno>
#include <cstddef>
#include <cstring>

#include <fcntl.h>
#include <unistd.h>

#include <cli/InputFiles.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

[[noreturn]] void refuse(const std::string& path) {
    throw UsageError(inputName(path) + ": cannot be read: " + std::strerror(errno));
}

std::string readDescriptor(int descriptor, const std::string& path) {
    constexpr std::size_t kBlock = 64 * 1024;
    std::string bytes;
    for (ssize_t got = 1; got != 0;) {
        const std::size_t filled = bytes.size();
        bytes.resize(filled + std::max(filled, kBlock));
        do {
            got = ::read(descriptor, bytes.data() + filled, bytes.size() - filled);
        } while (got < 0 && errno == EINTR);
        if (got < 0) refuse(path);
        bytes.resize(filled + static_cast<std::size_t>(got));
    }
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
