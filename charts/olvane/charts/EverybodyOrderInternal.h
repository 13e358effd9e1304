// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <functional>
#include <vector>

#include <olvane/charts/EverybodyRowsInternal.h>

namespace olvane::charts {

// The nodes of each row from left to right, and which chains stand the other way round.
struct RowOrder {
    std::vector<std::vector<std::int32_t>> nodes;  // by row
    std::vector<std::uint8_t> flipped;             // by chain
};

// How many pairs of strands cross; a pair of unions that cross in two gaps counts twice.
std::int64_t countCrossings(const Rows& rows, const RowOrder& order);

// The order in which a walk over the drawn links meets the nodes: from those without parents, each subtree whole
// before the next. Where every chain hangs from one union at most, no strands cross.
RowOrder walkOrder(const Rows& rows);

// Sorts every row so that all links together lie as straight as can be: by the second eigenvector of the family,
// which repeated averaging of each node with its strands approaches, from the order as it is.
void straightenOrder(const Rows& rows, RowOrder& order, int rounds);

// Is called with the share of the work that is done, from 0 to 1; may be empty.
using ShareDone = std::function<void(double share)>;

// Moves nodes along their rows, and turns chains round, for as long as that removes crossings. Returns what is
// left of the effort.
std::int64_t reduceCrossings(const Rows& rows, RowOrder& order, std::int64_t effort,
                             const ShareDone& done = {});

// Moves these nodes alone along their rows, each to the nearest place where it crosses the fewest lines.
void siftNodes(const Rows& rows, RowOrder& order, const std::vector<std::int32_t>& nodes);

// The order with the fewest crossings that any of `starts` starts ends in: a walk, straightened more or less.
RowOrder findOrder(const Rows& rows, std::int64_t effort, int starts, const ShareDone& done = {});

}  // namespace olvane::charts
