// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/Circle.h>

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

}  // namespace olvane::picture
