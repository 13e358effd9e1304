// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/Export.h>

namespace olvane::kin {

// A word as it stands in a text, and as it is compared.
struct FoldedWord {
    std::string_view written;
    std::string folded;
};

// What a text is compared by in a search: small letters without accents and compatibility forms, letters with strokes
// and the like written plain, apostrophes left out: "O'Brien" is "obrien", "Łukasz" "lukasz", "Straße" "strasse".
// Bytes that are no UTF-8 are kept as they are. The same bytes on every machine.
OLVANE_API std::string foldedForSearch(std::string_view text);

// Calls use with each word of a text, in their order: runs of letters and digits. An apostrophe is part of a word.
// Lifetime: written refers to text; folded lives as long as the call.
OLVANE_API void visitFoldedWords(
    std::string_view text, const std::function<void(std::string_view written, std::string_view folded)>& use);

// The same words as a list.
// Lifetime: written refers to text.
OLVANE_API std::vector<FoldedWord> foldedWords(std::string_view text);

}  // namespace olvane::kin
