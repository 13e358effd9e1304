// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/shared/Circle.h>

#include <algorithm>
#include <cmath>

namespace olvane::picture {

namespace {

constexpr double kPi = 3.14159265358979323846;

// From -90 to 90 degrees.
double sineOfQuarter(double degrees) {
    const double x = degrees * (kPi / 180);
    double term = x;
    double sum = x;
    for (int n = 1; n <= 12; ++n) {
        term = -term * x * x / ((2.0 * n) * (2.0 * n + 1));
        sum += term;
    }
    return sum;
}

}  // namespace

double sineOfDegrees(double degrees) {
    double d = degrees - std::floor((degrees + 180) / 360) * 360;  // -180 to 180
    if (d > 90) d = 180 - d;
    if (d < -90) d = -180 - d;
    return sineOfQuarter(d);
}

CirclePoint onCircle(double degrees, double radius) {
    return {radius * sineOfDegrees(degrees), -radius * sineOfDegrees(degrees + 90)};
}

CircleBounds boundsOnCircle(double from, double to, double innerRadius, double outerRadius) {
    constexpr double kMostTurns = 4 * 360;
    if (!(std::abs(from) <= kMostTurns && to >= from && to - from <= 360)) {
        return {-outerRadius, outerRadius, -outerRadius, outerRadius};
    }
    // The corners, and where the outer edge meets an axis.
    CircleBounds bounds{outerRadius, -outerRadius, outerRadius, -outerRadius};
    const auto include = [&bounds](double degrees, double radius) {
        const CirclePoint p = onCircle(degrees, radius);
        bounds.left = std::min(bounds.left, p.x);
        bounds.right = std::max(bounds.right, p.x);
        bounds.top = std::min(bounds.top, p.y);
        bounds.bottom = std::max(bounds.bottom, p.y);
    };
    for (const double degrees : {from, to}) {
        include(degrees, innerRadius);
        include(degrees, outerRadius);
    }
    for (double axis = std::ceil(from / 90) * 90; axis <= to; axis += 90) include(axis, outerRadius);
    return bounds;
}

}  // namespace olvane::picture
