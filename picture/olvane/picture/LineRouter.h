// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

#include <olvane/picture/Picture.h>

namespace olvane::picture {

// Where children stand, seen from their parents.
enum class Direction : std::uint8_t { down, up, left, right };

struct RouteOptions {
    Direction direction = Direction::down;
    // Whether whole rows may be moved apart, so that all lines between them find room.
    bool growGaps = false;
    // Points between neighbouring bars where rows are moved apart, and outside of the first and last row.
    double trackDistance = 5;
};

// Draws the lines of all families again, from the places of the boxes and the members of the families.
//
// Boxes stand in rows (in columns where the picture runs sideways): what overlaps in y is one row. A couple
// that stands together has a straight marriage line; where somebody stands between, the line runs over the
// row between, from the space beside one partner to the space beside the other, never behind a box. From the
// marriage line, or from the foot of a lone parent, a drop leads to the space between the rows, there one bar
// leads over the children, and a stem to each. Families that reach over several rows have a bar in each space
// and lead through the free places of the rows between.
//
//        [A]--[B]   [C]        spaces between rows are channels, with tracks for bars;
//           |        |         free places within rows are taken by drops and by lines that pass
//           |    +---+---+
//        +--+--+ |       |
//       [D]   [E][F]    [G]
//
// In every channel and row, vertical pieces of different families get places at least 2.5 points apart, so
// that bars can be put into any order; the order of least crossings is sought by preferences of pairs: a
// greedy linear ordering (Eades, Lin, Smyth 1993), improved by moving single bars, as in the routing of
// hyperedges in layered drawing (Sander 2004). Bars that do not overlap share a track (left-edge colouring).
//
// Holds: lines and bridges are replaced. What a parentsElsewhere or partnersElsewhere mark of the picture
//        expresses gets no line. Where boxes stand in rows that do not overlap, hits, tracks, touches and
//        unjoined of the result are 0; where a space has no free place left, a new mark stands for the line,
//        behind those that are there. Only growGaps moves boxes, whole rows, along the direction alone. A round
//        chart is left as it is.
// Time:  O(n log n) in boxes and pieces, and the number of pairs of bars that overlap, up to a bound for each.
void routeLines(Picture& picture, const RouteOptions& options = RouteOptions());

}  // namespace olvane::picture
