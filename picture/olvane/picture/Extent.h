// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/picture/Picture.h>

namespace olvane::picture {

// How far a picture reaches, in points.
struct Extent {
    double left = 0;
    double top = 0;
    double right = 0;
    double bottom = 0;

    double width() const { return right - left; }
    double height() const { return bottom - top; }
};

// Around all boxes and lines of families; all 0 for a picture without any. Of a round chart, the boxes are those around
// its cells.
OLVANE_API Extent extentOf(const Picture& picture);

}  // namespace olvane::picture
