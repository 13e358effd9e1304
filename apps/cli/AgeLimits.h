// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

namespace olvane::cli {

// The ages that all judgements on dates share, in years.
constexpr int kLongestLife = 110;    // nobody older is taken to be living, and a longer life is odd
constexpr int kYoungestParent = 12;  // at the birth of a child
constexpr int kOldestMother = 60;
constexpr int kOldestFather = 90;

}  // namespace olvane::cli
