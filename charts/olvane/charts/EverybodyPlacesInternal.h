// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/EverybodyOrderInternal.h>

namespace olvane::charts {

// How wide everything in a row is.
//
// Units: points.
struct RowSizes {
    std::vector<double> width;  // by node; 0 for a pass
    std::vector<double>
        endPlace;            // by place in Rows::ends: where the end lies in its node, from its left edge
    double gap = 25;         // between neighbours in a chain, and between chains
    double passRoom = 12.5;  // between a pass and a box
    double passGap = 8;      // between two passes

    double grid = 0;  // chains stand at whole multiples of it; 0 for anywhere

    double between(const Rows& rows, std::int32_t left, std::int32_t right) const {
        if (!rows.isPass(left) && !rows.isPass(right)) return gap;
        return rows.isPass(left) && rows.isPass(right) ? passGap : passRoom;
    }
};

// The left edge of each node: in the given order, with the given gaps, in no more than the width of the widest row
// or leastWidth, and bars as short as sweeps of averaging make them.
std::vector<double> placeNodes(const Rows& rows, const RowOrder& order, const RowSizes& sizes,
                               double leastWidth, int sweeps);

// Puts chains on whole multiples of a 1024th of a point, where sums of places, widths and gaps are exact: so that boxes
// without a gap between them touch, and do not overlap by what a sum is rounded by.
void makePlacesExact(const Rows& rows, const RowOrder& order, const RowSizes& sizes,
                     std::vector<double>& left);

}  // namespace olvane::charts
