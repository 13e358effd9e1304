// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/kin/SearchTexts.h>

namespace olvane::kin::test {

// The search of PersonIndex a second time, slow and plain: every word of the search is held against every word of every
// person, letter by letter. Answers a line for each person found, in order: "7: name begins ann, place whole kew".
std::vector<std::string> plainSearch(const SearchTexts& texts, const std::string& text);

}  // namespace olvane::kin::test
