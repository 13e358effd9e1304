// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstdint>
#include <limits>
#include <vector>

#include <olvane/charts/EverybodyOrderInternal.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

using kin::at;

// The outermost ends of a strand, in places along the row above and along the row below. Where it has no end,
// it is left and right of everything.
struct Reach {
    std::int32_t aboveLow = std::numeric_limits<std::int32_t>::max();
    std::int32_t aboveHigh = std::numeric_limits<std::int32_t>::min();
    std::int32_t belowLow = std::numeric_limits<std::int32_t>::max();
    std::int32_t belowHigh = std::numeric_limits<std::int32_t>::min();
};

inline bool isLeftOf(const Reach& a, const Reach& b) {
    return a.aboveHigh <= b.aboveLow && a.belowHigh <= b.belowLow;
}

inline int cross(const Reach& a, const Reach& b) {
    return isLeftOf(a, b) || isLeftOf(b, a) ? 0 : 1;
}

// Every end's place along its row, in subs of all nodes from left to right.
class Places {
public:
    Places(const Rows& rows, const RowOrder& order)
        : rows_(rows), first_(static_cast<std::size_t>(rows.nodeCount())), flipped_(order.flipped) {
        for (const auto& nodes : order.nodes) {
            std::int32_t next = 0;
            for (const std::int32_t node : nodes) {
                first_[at(node)] = next;
                next += rows.size[at(node)];
            }
        }
        flipped_.resize(static_cast<std::size_t>(rows.nodeCount()), 0);
    }

    std::int32_t of(const Rows::End& end) const {
        const std::int32_t sub =
            flipped_[at(end.node)] != 0 ? rows_.size[at(end.node)] - 1 - end.sub : end.sub;
        return first_[at(end.node)] + sub;
    }
    Reach reach(std::int32_t s) const {
        Reach reach;
        const Rows::Strand& strand = rows_.strands[at(s)];
        for (const Rows::End& end : rows_.endsAbove(strand)) {
            const std::int32_t place = of(end);
            reach.aboveLow = std::min(reach.aboveLow, place);
            reach.aboveHigh = std::max(reach.aboveHigh, place);
        }
        for (const Rows::End& end : rows_.endsBelow(strand)) {
            const std::int32_t place = of(end);
            reach.belowLow = std::min(reach.belowLow, place);
            reach.belowHigh = std::max(reach.belowHigh, place);
        }
        return reach;
    }
    std::int32_t& first(std::int32_t node) { return first_[at(node)]; }
    std::uint8_t& flipped(std::int32_t node) { return flipped_[at(node)]; }

private:
    const Rows& rows_;
    std::vector<std::int32_t> first_;
    std::vector<std::uint8_t> flipped_;
};

}  // namespace olvane::charts
