// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

namespace olvane::picture {

// The sine of an angle in degrees, to about 1e-15, by Taylor's series: the same bits from every library, which
// std::sin does not promise.
double sineOfDegrees(double degrees);

struct CirclePoint {
    double x = 0;
    double y = 0;
};

// The point at that angle, clockwise from the top, on a circle around (0, 0); y grows down.
CirclePoint onCircle(double degrees, double radius);

struct CircleBounds {
    double left = 0;
    double right = 0;
    double top = 0;
    double bottom = 0;
};

// Around a piece of a ring, in degrees from `from` clockwise to `to`, which is at most a whole turn more. Else, and for angles
// of more than four turns, all of the ring.
CircleBounds boundsOnCircle(double from, double to, double innerRadius, double outerRadius);

}  // namespace olvane::picture
