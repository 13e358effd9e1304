// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// A place on the plane. Units: points; x grows to the right, y grows downward.
struct TreePoint {
    float x = 0.0f;
    float y = 0.0f;
};

// Exact, with no tolerance: two ends meet only when both coordinates are the same number.
inline bool operator==(const TreePoint& a, const TreePoint& b) {
    return a.x == b.x && a.y == b.y;
}
