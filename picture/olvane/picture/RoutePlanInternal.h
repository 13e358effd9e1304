// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/picture/RowsInternal.h>

namespace olvane::picture {

// An end of a vertical piece: on a bar, whose place is not known yet, or at a place of a row.
struct VerticalEnd {
    Index bar = kNone;
    Index row = kNone;
    double y = 0;
};

// A piece along the generations, in the frame of the router.
struct Vertical {
    Index family = kNone;
    Index child = kNone;
    LineRole role = LineRole::drop;
    double x = 0;
    VerticalEnd top;
    VerticalEnd bottom;
    bool isMerged = false;  // into the one above it
};

// A piece across the generations in a channel: it reaches over all verticals that end on it.
struct Bar {
    Index family = kNone;
    Index channel = 0;  // channel i lies above row i; the last one below all rows
    LineRole role = LineRole::bar;
    double lo = std::numeric_limits<double>::infinity();
    double hi = -std::numeric_limits<double>::infinity();
    std::int32_t track = 0;
    double y = 0;

    bool isStraight = false;  // what it joined has become one piece

    bool isPoint() const { return !(lo < hi); }
    bool isEmpty() const { return lo > hi; }
    bool hasTrack() const { return !isStraight && !isEmpty(); }
};

// A piece across the generations within a row, beside a parent.
struct RowPiece {
    Index family = kNone;
    Index row = 0;
    double y = 0;
    double x1 = 0;
    double x2 = 0;
};

// What leads from whom to whom, with all places but those of the bars across their channels.
//
// Holds: in every channel and row, verticals of different families are at least 2.5 points apart. Ends without
//        a bar have their y in the frame, as the rows stand before they are moved. What the picture's own
//        elsewhere marks express has no pieces.
struct RoutePlan {
    std::vector<Bar> bars;
    std::vector<Vertical> verticals;
    std::vector<RowPiece> rowPieces;
    std::vector<Mark> marks;  // for what found no place; without numbers
};

RoutePlan planRoutes(const Picture& picture, const Rows& rows);

}  // namespace olvane::picture
