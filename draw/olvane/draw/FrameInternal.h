// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

namespace olvane::draw {

// From points of the layout to px of what is drawn: of a file, or with a scale of 1 of a screen that is not zoomed.
struct Frame {
    double left = 0;  // point that lies at px (marginX, marginY)
    double top = 0;
    int marginX = 0;
    int marginY = 0;

    static constexpr int kScale = 2;
    double scale = kScale;  // px of a point

    double x(double points) const { return (points - left) * scale + marginX; }
    double y(double points) const { return (points - top) * scale + marginY; }
};

// Of a screen: px are points.
inline constexpr Frame kScreenFrame{0, 0, 0, 0, 1};

}  // namespace olvane::draw
