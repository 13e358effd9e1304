// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/MapIndex.h>

namespace olvane::charts {

// Of each person of the map, how many descend from them over first unions to lower rows, themselves included: a
// measure of how large a branch is that counts nobody twice.
std::vector<std::uint32_t> branchSizes(const MapIndex& map);

// Fills labels and labelLevels: one label for each part of the map that is large enough for one, at each scale.
void addLabels(MapIndex& map);

}  // namespace olvane::charts
