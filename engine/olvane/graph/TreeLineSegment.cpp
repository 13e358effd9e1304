// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One straight piece of a line: which way it runs and how steeply. Everything compares exactly, since a
// tree's lines are built from the very numbers that their neighbours use.

#include <olvane/graph/TreeLineSegment.h>

namespace {

int directionOfWalk(const TreePoint& from, const TreePoint& to) {
    if (from.x == to.x && from.y == to.y) return kDirectionNone;
    if (from.x == to.x) return to.y > from.y ? kDirectionDown : kDirectionUp;
    if (from.y == to.y) return to.x < from.x ? kDirectionLeft : kDirectionRight;
    return kDirectionDiagonal;
}

}  // namespace

int TreeLineSegment::directionFromX1Y1() const {
    return directionOfWalk(firstEnd(), secondEnd());
}

int TreeLineSegment::directionFromX2Y2() const {
    return directionOfWalk(secondEnd(), firstEnd());
}

float TreeLineSegment::slope() const {
    return (y1 - y2) / (x1 - x2);
}
