// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/gedcom/GedcomPeriod.h>

#include <algorithm>

namespace olvane::gedcom {

namespace {

bool isLetter(char c) {
    const char small = static_cast<char>(static_cast<unsigned char>(c) | 0x20u);
    return small >= 'a' && small <= 'z';
}

// word is in capitals.
bool isWord(std::string_view text, std::string_view word) {
    return text.size() == word.size() &&
           std::equal(text.begin(), text.end(), word.begin(), [](char a, char b) {
               return a == b || (isLetter(a) && static_cast<char>(a ^ 0x20) == b);
           });
}

}  // namespace

bool isPeriod(const GedcomDate& date) {
    std::string_view text = date.written;
    text.remove_prefix(std::min(text.find_first_not_of(" \t"), text.size()));
    const auto end = std::find_if_not(text.begin(), text.end(), isLetter);
    const std::string_view first = text.substr(0, static_cast<std::size_t>(end - text.begin()));
    return date.isRead() && (isWord(first, "FROM") || isWord(first, "TO"));
}

}  // namespace olvane::gedcom
