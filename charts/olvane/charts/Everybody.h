// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <span>

#include <olvane/Export.h>
#include <olvane/charts/ChartProgress.h>
#include <olvane/charts/ViewRequest.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// What may be asked of the chart of everybody.
struct EverybodyOptions {
    kin::Place focus = 0;
    // How many second links (to the parents of somebody whose partner has parents as well, or to a partner who
    // stands apart) become marks instead of lines: those that cross the most. -1 for all of them: then no two lines
    // cross.
    std::int32_t marks = 0;
    // With all second links marks: those whose lines cross no others stay lines.
    bool drawFree = false;
    // How long to look for fewer crossings: 0 is quickest, 1 is usual, and each more takes up to twice the time. Steps
    // are counted, not time, so that the result is the same everywhere.
    std::int32_t effort = 1;
    // Only the part of the family that the focus is in; else all parts, the largest first, beside one another.
    bool onePart = true;
    // A generation wider than this share of the picture's height is folded into two or three rows; 0 for none.
    double foldAspect = 0.65;
    // Width by height of the paper that the picture is for: several ways to fold are tried, and the one that can be
    // printed largest is taken. 0 for a picture of no paper, which foldAspect alone decides on.
    double aspect = 0;
    // Lines lie closer together, and gaps between rows are no higher than their lines ask for.
    bool compact = false;
    // An earlier chart of the same family, in the same direction, whose rows, order and places are kept where a change
    // leaves them: who is new is inserted where the fewest lines cross, and what has no room is moved aside. Read
    // during the call only; may be null. A chart that less than half of the family is in is not kept.
    const picture::Picture* earlier = nullptr;
    Direction direction = Direction::down;
    ChartSizes sizes;
    std::span<const BoxSize> boxSizes;        // as in ChartRequest
    const ChartProgress* progress = nullptr;  // as in ChartRequest
};

// Everybody once: each person has one box, couples stand side by side wherever nobody has three neighbours, parents
// stand above their children, and every link is a line or a mark.
//
// Units: points. Time grows about as n log n with the number of persons.
// Holds: the same graph and options give the same picture on every machine. Boxes are in the order of persons.
// Fails: std::out_of_range for a focus that the graph does not have.
OLVANE_API picture::Picture everybodyChart(const kin::KinGraph& graph, const EverybodyOptions& options);

}  // namespace olvane::charts
