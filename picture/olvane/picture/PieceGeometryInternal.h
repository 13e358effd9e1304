// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/picture/Picture.h>
#include <olvane/picture/RectSweepInternal.h>

namespace olvane::picture {

struct Point {
    double x = 0;
    double y = 0;
};

inline Point startOf(const Line& line) {
    return {line.x1, line.y1};
}
inline Point endOf(const Line& line) {
    return {line.x2, line.y2};
}

// Whether the box, grown by margin on each side, holds the point; its edge does.
bool boxHolds(const Box& box, const Point& p, double margin);

double distance(const Point& p, const Line& line);
double distance(const Line& a, const Line& b);

// At a point that is an end of neither.
bool crossInside(const Line& a, const Line& b);

// Parallel, less than apart from one another over more than length.
bool runBeside(const Line& a, const Line& b, double apart, double length);

// Whether a part of the line lies inside the rectangle, its edges not counted. False for an empty rectangle.
bool runsThrough(const Line& line, const Rect& rect);

}  // namespace olvane::picture
