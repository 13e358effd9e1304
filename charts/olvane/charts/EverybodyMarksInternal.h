// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/EverybodyOrderInternal.h>

namespace olvane::charts {

// No link as a mark, but those for which a box has no room: beyond so many lines below a box, or above it.
MarkedLinks marksForWantOfRoom(const Component& part, const Chains& chains);

// Every second link a mark: each chain keeps the links to the first parents above it, and no line joins partners
// who stand apart. Marks that are there stay.
void markAllSecondLinks(const Component& part, const Chains& chains,
                        const std::vector<std::int32_t>& rowOfChain, MarkedLinks& marked);

// Up to count more marks, at those second links whose lines cross the most. Returns how many.
std::int32_t markWorstLinks(const Component& part, const Chains& chains, const Rows& rows,
                            const RowOrder& order, std::int32_t count, MarkedLinks& marked);

}  // namespace olvane::charts
