// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/EverybodyLinesInternal.h>

namespace olvane::charts {

// Ends that must go so that no upright lies on one of another family: of each such pair the end that stands at the box
// of one person, or else that of the later family; none of a pair of which one goes already. Places in Rows::ends.
std::vector<std::int32_t> endsInTheWay(const Rows& rows, const GapLines& lines);

}  // namespace olvane::charts
