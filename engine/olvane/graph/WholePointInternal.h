// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cmath>
#include <limits>

namespace olvane {

// The whole number of a coordinate, cut toward zero and never rounded: -27.5 gives -27. A box left of the
// focus would otherwise shift by one point against its own lines.
//
// Defined for every value: what an int cannot hold becomes the nearest int, and not-a-number becomes 0.
// Every cut from a floating value to an int in the engine is this one.
inline int wholePoint(double value) {
    constexpr double kLeast = std::numeric_limits<int>::min();
    constexpr double kGreatest = std::numeric_limits<int>::max();
    if (value > kLeast && value < kGreatest) return static_cast<int>(value);
    if (std::isnan(value)) return 0;
    return value < 0.0 ? std::numeric_limits<int>::min() : std::numeric_limits<int>::max();
}

// The same of a float, for which fewer comparisons do: every float below 2^31 is at most 2^31 - 128.
inline int wholePoint(float value) {
    constexpr float kBeyond = 2147483648.0f;
    if (value > -kBeyond && value < kBeyond) return static_cast<int>(value);
    return wholePoint(static_cast<double>(value));
}

// The same cut, handed back as a coordinate: where a line ends on whole points.
inline float cutToWholePoint(double value) {
    return static_cast<float>(wholePoint(value));
}

}  // namespace olvane
