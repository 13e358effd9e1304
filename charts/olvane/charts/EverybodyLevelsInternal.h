// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/EverybodyChainsInternal.h>

namespace olvane::charts {

// The row of each chain, 0 the top one: parents above their children, and the sum of all parent links as
// short as possible. effort bounds the work in steps of a few nanoseconds; with too little of it the rows are
// still right, but links may be longer.
//
// Holds: a child's row is at least one more than its parents', but for one link of each ring of ancestors.
std::vector<std::int32_t> chooseRows(const Component& part, const Chains& chains, std::int64_t effort);

}  // namespace olvane::charts
