// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/EverybodyRowsInternal.h>

namespace olvane::charts {

// Where the ends of a strand lie and may lie.
//
// Units: points.
struct EndRange {
    double wanted;
    double low;
    double high;
};

// The lines between rows: where each end lies along its row, and on which track each bar runs.
//
// Holds: two uprights of different strands of one gap are at least kApart apart where their boxes have room, and
//        two bars that overlap are on different tracks.
struct GapLines {
    static constexpr double kApart = 2.5;

    std::vector<double> endX;          // by place in Rows::ends
    std::vector<std::int32_t> track;   // by strand, 0 the top one; -1 for a strand without a bar
    std::vector<std::int32_t> tracks;  // by gap + 1, how many
};

// ends by place in Rows::ends.
GapLines routeGaps(const Rows& rows, std::vector<EndRange> ends);

}  // namespace olvane::charts
