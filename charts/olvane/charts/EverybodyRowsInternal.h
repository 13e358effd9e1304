// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <limits>
#include <span>
#include <vector>

#include <olvane/charts/EverybodyChainsInternal.h>

namespace olvane::charts {

// Which links are drawn as marks instead of lines.
struct MarkedLinks {
    std::vector<std::uint8_t> child;    // by place in Component::children, over all unions in order
    std::vector<std::uint8_t> partner;  // by union: 1 or 2 for partner 0 or 1, who has a mark and no line
};

// The rows as data: nodes in rows, and strands between rows.
//
// A node is a chain or a pass, the place where the line of a union runs down between the boxes of a row.
// A strand is what a union draws between one row and the next: ends at nodes of the row above (a couple, a
// lone parent, a pass) and at nodes of the row below (a child, a pass), joined by one bar. Gap g lies under
// row g; gap -1, above the first row, is used only by somebody who is their own ancestor.
//
//      [a]--[b]     .          row g
//         |         |   gap g: two strands; their ends are three above, three below
//      +--+--+   +--+
//     [c]   [d]  |             row g + 1, with a pass
//
// Two strands of a gap cross, whatever the places of their bars, unless one has all its ends, above and below, left
// of the other's: so a strand counts as the trapezoid between its outermost ends.
struct Rows {
    struct End {
        std::int32_t node;
        std::int32_t sub;  // 2 * slot for a person, 2 * slot + 1 for the couple of slot and slot + 1
    };
    struct Strand {
        std::int32_t unionPlace;
        std::int32_t gap;
        std::uint32_t firstEnd;
        std::uint32_t aboveCount;  // ends at the row above come first
        std::uint32_t belowCount;
    };

    std::vector<std::int32_t> row;        // by node
    std::vector<std::int32_t> size;       // by node: how many different subs
    std::vector<std::int32_t> passUnion;  // by pass: node - chainCount
    std::vector<Strand> strands;
    std::vector<End> ends;
    std::vector<std::int32_t> strandOfEnd;
    NumberLists strandsAbove;  // by node, the strands that end at it from above, each once
    NumberLists strandsBelow;
    NumberLists endsAt;                   // by node
    NumberLists strandsInGap;             // by gap + 1
    std::vector<std::int32_t> firstPass;  // by union: its pass in row passRow[u]; -1 without one
    std::vector<std::int32_t> passRow;
    std::int32_t chainCount = 0;
    std::int32_t rowCount = 0;

    std::int32_t nodeCount() const { return static_cast<std::int32_t>(row.size()); }
    bool isPass(std::int32_t node) const { return node >= chainCount; }
    bool isBelow(std::int32_t e) const {
        const Strand& s = strands[static_cast<std::size_t>(strandOfEnd[static_cast<std::size_t>(e)])];
        return static_cast<std::uint32_t>(e) >= s.firstEnd + s.aboveCount;
    }
    std::span<const End> endsAbove(const Strand& s) const { return {ends.data() + s.firstEnd, s.aboveCount}; }
    std::span<const End> endsBelow(const Strand& s) const {
        return {ends.data() + s.firstEnd + s.aboveCount, s.belowCount};
    }
};

Rows makeRows(const Component& part, const Chains& chains, const std::vector<std::int32_t>& rowOfChain,
              const MarkedLinks& marked);

}  // namespace olvane::charts
