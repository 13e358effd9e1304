// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Encodings by iconv, which every POSIX system has.

#include <olvane/gedcom/PlatformDecoderInternal.h>

#include <array>
#include <cerrno>
#include <cstddef>

#include <iconv.h>

namespace olvane::gedcom {
namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

class Converter {
public:
    explicit Converter(const char* from) : handle_(iconv_open("UTF-8", from)) {}
    ~Converter() {
        if (isOpen()) iconv_close(handle_);
    }
    Converter(const Converter&) = delete;
    Converter& operator=(const Converter&) = delete;

    // iconv_open says so by a pointer that is all ones.
    bool isOpen() const { return reinterpret_cast<std::intptr_t>(handle_) != -1; }

    std::string convert(std::string_view bytes) {
        std::string text;
        text.reserve(bytes.size() + bytes.size() / 2);
        char* from = const_cast<char*>(bytes.data());  // iconv does not write there
        std::size_t left = bytes.size();
        while (left > 0) {
            if (step(&from, &left, text)) continue;
            text += kReplacement;
            ++from;
            --left;
        }
        step(nullptr, nullptr, text);
        return text;
    }

private:
    // One run of iconv. False if it stands before bytes that are no character.
    bool step(char** from, std::size_t* left, std::string& text) {
        char* to = block_.data();
        std::size_t room = block_.size();
        const std::size_t result = iconv(handle_, from, left, &to, &room);
        const bool stuck = result == static_cast<std::size_t>(-1) && errno != E2BIG;
        text.append(block_.data(), block_.size() - room);
        return !stuck;
    }

    iconv_t handle_;
    std::array<char, 16 * 1024> block_{};
};

}  // namespace

std::optional<std::string> decodedByPlatform(const KnownEncoding& encoding, std::string_view bytes) {
    if (encoding.iconvName == nullptr) return {};
    Converter converter(encoding.iconvName);
    if (!converter.isOpen()) return {};
    return converter.convert(bytes);
}

}  // namespace olvane::gedcom
