// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/SlipFinderInternal.h>

#include <algorithm>
#include <cstddef>

namespace olvane::kin {

namespace {

bool beginsLetter(char c) {
    return (static_cast<unsigned char>(c) & 0xC0U) != 0x80U;
}

// Whether the text is whole letters from there on.
bool isBetweenLetters(std::string_view text, std::size_t at) {
    return at >= text.size() || beginsLetter(text[at]);
}

bool isAtMostOneLetter(std::string_view text) {
    return std::count_if(text.begin(), text.end(), beginsLetter) <= 1;
}

// Whether the texts are two letters that have changed places.
bool areExchanged(std::string_view one, std::string_view other) {
    if (one.size() != other.size()) return false;
    std::size_t first = 1;
    while (first < one.size() && !beginsLetter(one[first])) ++first;
    return isAtMostOneLetter(one.substr(first)) && other.ends_with(one.substr(0, first)) &&
           other.starts_with(one.substr(first));
}

// Whether what is left between the same beginnings and ends is one letter at most on each side, or two exchanged ones.
bool isSimilar(std::string_view one, std::string_view other) {
    const std::size_t shorter = std::min(one.size(), other.size());
    std::size_t front = 0;
    while (front < shorter && one[front] == other[front]) ++front;
    while (front > 0 && !(isBetweenLetters(one, front) && isBetweenLetters(other, front))) --front;
    std::size_t back = 0;
    while (back < shorter - front && one[one.size() - 1 - back] == other[other.size() - 1 - back]) ++back;
    while (back > 0 && !beginsLetter(one[one.size() - back])) --back;
    one = one.substr(front, one.size() - front - back);
    other = other.substr(front, other.size() - front - back);
    return (isAtMostOneLetter(one) && isAtMostOneLetter(other)) || areExchanged(one, other);
}

}  // namespace

SlipFinder::SlipFinder(std::string_view term)
    : term_(term), isLong_(std::count_if(term.begin(), term.end(), beginsLetter) >= 3) {}

bool SlipFinder::isOneSlipAway(std::string_view word) const {
    return isSimilar(word, term_);
}

}  // namespace olvane::kin
