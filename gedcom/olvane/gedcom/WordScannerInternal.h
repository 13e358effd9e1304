// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <initializer_list>
#include <string_view>

namespace olvane::gedcom {

// Characters of dates. Letters are those of ASCII, and all bytes of longer characters.
constexpr bool isSpace(char c) {
    return c == ' ' || c == '\t' || c == '\n' || c == '\r';
}

constexpr bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

constexpr bool isWordLetter(char c) {
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || static_cast<unsigned char>(c) >= 0x80;
}

constexpr bool isSeparator(char c) {
    return c == '.' || c == '-' || c == '/';
}

// Words of a value from left to right. A word ends at a space, and between letters and digits: "12MAY1900", "c.1590",
// "972B.C.", "24-JAN-1915".
//
// Lifetime: the text outlives the scanner.
class WordScanner {
public:
    explicit WordScanner(std::string_view text) : rest_(text) { findWord(); }

    bool atEnd() const { return rest_.empty(); }
    char front() const { return rest_.empty() ? '\0' : rest_.front(); }
    std::string_view peek() const { return rest_.substr(0, wordLength_); }
    std::string_view rest() const { return rest_; }
    void skip() { drop(wordLength_); }
    void drop(std::size_t bytes) {
        rest_.remove_prefix(bytes);
        findWord();
    }
    // Skips the word if it is one of these. No choice begins with a digit.
    bool skipIf(std::initializer_list<std::string_view> choices);

private:
    void findWord();

    std::string_view rest_;
    std::size_t wordLength_ = 0;
};

}  // namespace olvane::gedcom
