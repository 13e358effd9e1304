// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which files are being read, so that nothing is written over them.

#include <cli/InputFiles.h>

#include <algorithm>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cli/UsageError.h>

namespace olvane::cli {

InputFiles::InputFiles(const std::vector<std::string>& paths) {
    for (const std::string& path : paths) addPath(path);
}

void InputFiles::addPath(const std::string& path) {
    const auto found = path == kStandardInput ? identityOf(STDIN_FILENO) : identityOf(path);
    files_.insert(files_.end(), found.begin(), found.end());
}

// Pipes and devices hold nothing that could be lost.
std::vector<InputFiles::Identity> InputFiles::identityOf(const std::string& path) {
    struct stat status = {};
    if (::stat(path.c_str(), &status) != 0 || !S_ISREG(status.st_mode)) return {};
    return {{status.st_dev, status.st_ino}};
}

std::vector<InputFiles::Identity> InputFiles::identityOf(int descriptor) {
    struct stat status = {};
    if (::fstat(descriptor, &status) != 0 || !S_ISREG(status.st_mode)) return {};
    return {{status.st_dev, status.st_ino}};
}

bool InputFiles::has(const Identity& identity) const {
    return std::find(files_.begin(), files_.end(), identity) != files_.end();
}

bool InputFiles::hasPath(const std::string& path) const {
    const auto found = identityOf(path);
    return !found.empty() && has(found.front());
}

bool InputFiles::hasDescriptor(int descriptor) const {
    const auto found = identityOf(descriptor);
    return !found.empty() && has(found.front());
}

void refuseStreamsIntoInputs(const InputFiles& inputs) {
    if (inputs.hasDescriptor(STDERR_FILENO)) {
        const int nowhere = ::open("/dev/null", O_WRONLY | O_CLOEXEC);
        ::dup2(nowhere, STDERR_FILENO);
        throw UsageError("the standard error is an input file");
    }
    if (inputs.hasDescriptor(STDOUT_FILENO)) {
        throw UsageError("the standard output is an input file; nothing was written to it");
    }
}

}  // namespace olvane::cli
