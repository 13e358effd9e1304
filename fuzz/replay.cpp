// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Runs one fuzzer's function over every file of the folders named, without libFuzzer, so that what was once
// found stays fixed with every compiler. A file that breaks a promise ends the program; its name is the last
// one printed.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <exception>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t size);

namespace {

using Path = std::filesystem::path;

std::vector<Path> filesOf(const Path& folder) {
    std::vector<Path> files;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
        if (entry.is_regular_file()) files.push_back(entry.path());
    }
    std::sort(files.begin(), files.end());
    return files;
}

// A block of exactly the file's size, so that a sanitizer sees a read past its end.
std::vector<std::uint8_t> bytesOf(const Path& path) {
    std::ifstream file(path, std::ios::binary);
    const std::vector<char> read{std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
    if (file.bad() || !file.is_open()) throw std::runtime_error(path.string() + ": cannot be read");
    return {read.begin(), read.end()};
}

void replayFile(const Path& path) {
    std::printf("%s\n", path.c_str());
    std::fflush(stdout);
    const std::vector<std::uint8_t> bytes = bytesOf(path);
    LLVMFuzzerTestOneInput(bytes.data(), bytes.size());
}

std::size_t replayFolder(const Path& folder) {
    const std::vector<Path> files = filesOf(folder);
    for (const Path& file : files) replayFile(file);
    return files.size();
}

}  // namespace

int main(int argc, char** argv) {
    try {
        std::size_t count = 0;
        for (int i = 1; i < argc; ++i) count += replayFolder(argv[i]);
        std::printf("%zu inputs, all clean\n", count);
        return count == 0 ? 2 : 0;
    } catch (const std::exception& error) {
        std::fprintf(stderr, "%s\n", error.what());
        return 1;
    }
}
