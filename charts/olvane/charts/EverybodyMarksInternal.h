// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/EverybodyOrderInternal.h>

namespace olvane::charts {

// How many lines there is room for: for boxes of the usual size, as many as there may be at most.
struct LineRoom {
    static constexpr std::int32_t kMostAtBox = 12;
    static constexpr std::int32_t kMostOfCouple = 4;

    explicit LineRoom(std::size_t persons) : atBox(persons, kMostAtBox), marriages(persons, kMostOfCouple) {}

    std::vector<std::int32_t> atBox;        // by person: below the box, and above it
    std::vector<std::int32_t> marriages;    // by person: beside one another, to a partner next to the box
    std::int32_t ofCouple = kMostOfCouple;  // down from between two partners
};

// No link as a mark, but those for which a box has no room: beyond the most lines below a box, or above it.
MarkedLinks marksForWantOfRoom(const Component& part, const Chains& chains, const LineRoom& room);

// The link of an end becomes a mark. Where several links share the end, between partners or on the way past a row, all
// links of the union do, so that nothing of it is left to draw there.
void markLinkOfEnd(const Component& part, const Chains& chains, const Rows& rows, std::int32_t end,
                   MarkedLinks& marked);

// Every second link a mark: each chain keeps the links to the first parents above it, and no line joins partners
// who stand apart. Marks that are there stay.
void markAllSecondLinks(const Component& part, const Chains& chains,
                        const std::vector<std::int32_t>& rowOfChain, MarkedLinks& marked);

// Up to count more marks, at those second links whose lines cross the most. Returns how many.
std::int32_t markWorstLinks(const Component& part, const Chains& chains, const Rows& rows,
                            const RowOrder& order, std::int32_t count, MarkedLinks& marked);

// Up to count marks, but none of forced, are lines again: those that cross the fewest lines in this order, of links to
// the next row and along one. Returns how many.
std::int32_t drawBestLinks(const Component& part, const Chains& chains, const Rows& rows,
                           const RowOrder& order, std::int32_t count, const MarkedLinks& forced,
                           MarkedLinks& marked);

// The same for all links whose lines cross none in this order, and also for links from further up, along lines of the same
// union.
std::int32_t drawFreeLinks(const Component& part, const Chains& chains, const Rows& rows,
                           const RowOrder& order, const MarkedLinks& forced, MarkedLinks& marked);

}  // namespace olvane::charts
