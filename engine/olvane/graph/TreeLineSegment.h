// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/graph/TreePoint.h>

// Which way a walk along a segment goes. Lines of a tree run along the axes, so four directions exist;
// every diagonal has the one code 5, whatever its slope.
enum TreeLineDirection {
    kDirectionNone = 0,      // both ends are the same point
    kDirectionDown = 1,      // toward greater y
    kDirectionUp = 2,        // toward smaller y
    kDirectionLeft = 3,      // toward smaller x
    kDirectionRight = 4,     // toward greater x
    kDirectionDiagonal = 5,  // both coordinates differ
};

// A straight piece of a line, from (x1, y1) to (x2, y2), in points. The order of the ends is kept and reaches
// the host. Comparisons are exact.
struct OLVANE_API TreeLineSegment {
    float x1 = 0.0f;
    float y1 = 0.0f;
    float x2 = 0.0f;
    float y2 = 0.0f;
    bool isSpouseLine = false;  // joins two spouses; carried for the host's own walks, not read here

    // Direction codes (TreeLineDirection) of the walk from the first end to the second, and back.
    int directionFromX1Y1() const;
    int directionFromX2Y2() const;

    // (y1 - y2) / (x1 - x2). A vertical segment gives what float division gives: an infinity, or not-a-number
    // when both ends are one point.
    float slope() const;

    TreePoint firstEnd() const { return TreePoint{x1, y1}; }
    TreePoint secondEnd() const { return TreePoint{x2, y2}; }
};
