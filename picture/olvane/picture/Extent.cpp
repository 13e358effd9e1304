// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/Extent.h>

#include <algorithm>
#include <limits>

namespace olvane::picture {

Extent extentOf(const Picture& picture) {
    if (picture.boxes.empty() && picture.lines.empty()) return {};
    constexpr double kFar = std::numeric_limits<double>::infinity();
    Extent extent{kFar, kFar, -kFar, -kFar};
    const auto include = [&extent](double x, double y) {
        extent.left = std::min(extent.left, x);
        extent.top = std::min(extent.top, y);
        extent.right = std::max(extent.right, x);
        extent.bottom = std::max(extent.bottom, y);
    };
    for (const Box& box : picture.boxes) {
        include(box.x, box.y);
        include(box.x + static_cast<double>(box.width), box.y + static_cast<double>(box.height));
    }
    for (const Line& line : picture.lines) {
        include(line.x1, line.y1);
        include(line.x2, line.y2);
    }
    return extent;
}

}  // namespace olvane::picture
