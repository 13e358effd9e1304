// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstddef>
#include <string_view>

namespace olvane::kin {

// Looks for words with one slip in them: one letter wrong, missing, too many, or exchanged with its neighbor. Letters beyond
// ASCII have several bytes; only whole ones are alike.
//
// Lifetime: refers to the term.
class SlipFinder {
public:
    // Of one letter or more.
    explicit SlipFinder(std::string_view term);

    // Whether a word of one letter or more is the term but for at most one slip.
    bool fits(std::string_view word) const {
        const std::size_t longer = std::max(word.size(), term_.size());
        if (longer - std::min(word.size(), term_.size()) > kMostLetterBytes) return false;
        // Of three letters and more a slip leaves the first as it was, or the last.
        if (isLong_ && word.front() != term_.front() && word.back() != term_.back()) return false;
        return isOneSlipAway(word);
    }

private:
    static constexpr std::size_t kMostLetterBytes = 4;

    bool isOneSlipAway(std::string_view word) const;

    std::string_view term_;
    bool isLong_;
};

}  // namespace olvane::kin
