// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/draw/FamilyLinesInternal.h>

namespace olvane::draw {

// Moves trunks of different families apart that would run on one track, within the gap between boxes that
// they run in. A trunk that meets no other keeps its place. Among the orders of the tracks one with few
// crossings is taken.
//
// Units: points across the trunk.
// Holds: the answer has one place for each family.
std::vector<double> separateTracks(const std::vector<FamilyLine>& families,
                                   const std::vector<LayoutRecord>& records, LineDirection direction,
                                   const BoxSize& box);

}  // namespace olvane::draw
