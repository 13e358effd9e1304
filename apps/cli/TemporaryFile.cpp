// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Atomic replacement: write beside, flush, exchange names. A rename is atomic on POSIX systems; the exchange of two
// names, where Linux offers it, keeps the old file until everything is in place.

#include <cli/TemporaryFile.h>

#include <cerrno>
#include <cstdio>
#include <system_error>
#include <utility>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace olvane::cli {

namespace fs = std::filesystem;

namespace {

constexpr mode_t kOwnerOnly = 0600;
constexpr mode_t kUpToUmask = 0666;
constexpr mode_t kPermissions = 01777;  // without set-user-id and set-group-id
constexpr int kMostNames = 1000;

[[noreturn]] void fail(int error) {
    throw std::system_error(error, std::generic_category());
}

// Independent of the place's own name, which may be as long as names can be.
fs::path temporaryName(const fs::path& place, int attempt) {
    return place.parent_path() /
           (".olvane-" + std::to_string(::getpid()) + "-" + std::to_string(attempt) + ".part");
}

bool exchangeNames(const fs::path& one, const fs::path& other) {
#ifdef RENAME_EXCHANGE
    return ::renameat2(AT_FDCWD, one.c_str(), AT_FDCWD, other.c_str(), RENAME_EXCHANGE) == 0;
#else
    static_cast<void>(one);
    static_cast<void>(other);
    return false;
#endif
}

}  // namespace

void writeFully(int descriptor, std::string_view content) {
    while (!content.empty()) {
        const ssize_t written = ::write(descriptor, content.data(), content.size());
        if (written < 0 && errno != EINTR) fail(errno);
        if (written > 0) content.remove_prefix(static_cast<std::size_t>(written));
    }
}

TemporaryFile::TemporaryFile(fs::path place, std::string_view content) : place_(std::move(place)) {
    struct stat old = {};
    const bool replaces = ::stat(place_.c_str(), &old) == 0;
    create(replaces);
    try {
        fill(replaces, content);
    } catch (...) {
        ::close(descriptor_);
        ::unlink(path_.c_str());
        throw;
    }
    if (::close(descriptor_) == 0) return;
    const int error = errno;
    ::unlink(path_.c_str());
    fail(error);
}

TemporaryFile::~TemporaryFile() {
    if (state_ == State::kept) return;
    if (state_ == State::exchanged) exchangeNames(path_, place_);
    ::unlink(state_ == State::published ? place_.c_str() : path_.c_str());
}

// Never an existing file, nor what a link leads to.
void TemporaryFile::create(bool replaces) {
    for (int attempt = 0; attempt < kMostNames; ++attempt) {
        path_ = temporaryName(place_, attempt);
        descriptor_ = ::open(path_.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC | O_NOFOLLOW,
                             replaces ? kOwnerOnly : kUpToUmask);
        if (descriptor_ >= 0) return;
        if (errno != EEXIST) fail(errno);
    }
    fail(EEXIST);
}

// What replaces a file is on the disk before it does so.
void TemporaryFile::fill(bool replaces, std::string_view content) const {
    writeFully(descriptor_, content);
    if (!replaces) return;
    takeOverPermissions();
    if (::fsync(descriptor_) != 0 && errno != EINVAL) fail(errno);
}

// Where the group cannot be kept, the new group may do no more than everybody.
void TemporaryFile::takeOverPermissions() const {
    struct stat old = {};
    struct stat own = {};
    if (::stat(place_.c_str(), &old) != 0 || ::fstat(descriptor_, &own) != 0) fail(errno);
    bool groupKept = own.st_gid == old.st_gid;
    if (own.st_uid != old.st_uid && ::fchown(descriptor_, old.st_uid, old.st_gid) == 0) groupKept = true;
    if (!groupKept) groupKept = ::fchown(descriptor_, static_cast<uid_t>(-1), old.st_gid) == 0;
    mode_t mode = old.st_mode & kPermissions;
    if (!groupKept) mode &= ~static_cast<mode_t>(070) | ((mode & 07) << 3);
    if (::fchmod(descriptor_, mode) != 0) fail(errno);
}

void TemporaryFile::publish() {
    struct stat old = {};
    const bool replaces = ::lstat(place_.c_str(), &old) == 0;
    if (replaces && exchangeNames(path_, place_)) {
        state_ = State::exchanged;
        return;
    }
    if (::rename(path_.c_str(), place_.c_str()) != 0) fail(errno);
    state_ = replaces ? State::kept : State::published;
}

void TemporaryFile::keep() {
    if (state_ == State::exchanged) ::unlink(path_.c_str());
    state_ = State::kept;
}

}  // namespace olvane::cli
