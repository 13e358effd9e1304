// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>

namespace olvane::kin {

// A letter, and where in kFoldedLetters stands what it is compared by. Sorted by letter.
struct FoldedLetter {
    std::uint16_t letter;
    std::uint16_t folded;
};

struct LetterRange {
    std::uint32_t first;
    std::uint32_t last;
};

// One text behind the other, each ended by a zero.
extern const char kFoldedLetters[];
extern const FoldedLetter kFoldings[];
extern const std::size_t kFoldingCount;
// Accents and the like, which are left out. Sorted.
extern const LetterRange kMarks[];
extern const std::size_t kMarkCount;
// Signs that part words. Sorted.
extern const LetterRange kBetweenWords[];
extern const std::size_t kBetweenWordsCount;

}  // namespace olvane::kin
