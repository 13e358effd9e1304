// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/kin/Lives.h>

namespace olvane::cli {

using kin::kLongestLife;
using kin::kOldestFather;
using kin::kOldestMother;
using kin::kYoungestParent;

}  // namespace olvane::cli
