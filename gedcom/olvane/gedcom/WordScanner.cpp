// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the words of a date end: at a space, and where letters and digits meet.

#include <olvane/gedcom/WordScannerInternal.h>

#include <array>

#include <olvane/gedcom/DateWordsInternal.h>

namespace olvane::gedcom {

namespace {

enum class CharacterSort : unsigned char { other, space, letter, digit, separator };

constexpr auto kSorts = [] {
    std::array<CharacterSort, 256> sorts{};
    for (std::size_t c = 0; c < sorts.size(); ++c) {
        const char character = static_cast<char>(c);
        if (isSpace(character)) sorts[c] = CharacterSort::space;
        if (isDigit(character)) sorts[c] = CharacterSort::digit;
        if (isWordLetter(character)) sorts[c] = CharacterSort::letter;
        if (isSeparator(character)) sorts[c] = CharacterSort::separator;
    }
    return sorts;
}();

}  // namespace

bool WordScanner::skipIf(std::initializer_list<std::string_view> choices) {
    if (isDigit(front()) || !DateWord(peek()).isOneOf(choices)) return false;
    skip();
    return true;
}

void WordScanner::findWord() {
    while (!rest_.empty() && isSpace(rest_.front())) rest_.remove_prefix(1);
    CharacterSort last = CharacterSort::space;  // of the last letter or digit
    bool isClose = false;                       // it stands here but for one separator, or one behind a point
    for (wordLength_ = 0; wordLength_ < rest_.size(); ++wordLength_) {
        const CharacterSort sort = kSorts[static_cast<unsigned char>(rest_[wordLength_])];
        if (sort == CharacterSort::space) return;
        if (sort == CharacterSort::letter || sort == CharacterSort::digit) {
            if (isClose && sort != last) return;
            last = sort;
            isClose = true;
        } else {
            isClose = isClose && sort == CharacterSort::separator &&
                      (!isSeparator(rest_[wordLength_ - 1]) || rest_[wordLength_ - 1] == '.');
        }
    }
}

}  // namespace olvane::gedcom
