// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>

#include <olvane/draw/FamilyLinesInternal.h>
#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

// Which kinds of line a picture holds beside the plain one, for its legend.
struct LineStylesUsed {
    bool divorced = false;
    bool adopted = false;
    bool foster = false;

    bool any() const { return divorced || adopted || foster; }
};

enum class LineStyle : std::uint8_t { plain, divorced, adopted, foster };

// The dashes of a style as a stroke-dasharray; empty for the plain one.
const char* dashesOf(LineStyle style);

// From points of the layout to px of the picture.
struct Frame {
    int left = 0;  // point that lies at px (marginX, marginY)
    int top = 0;
    int marginX = 0;
    int marginY = 0;

    static constexpr int kScale = 2;
    double x(double points) const { return (points - left) * kScale + marginX; }
    double y(double points) const { return (points - top) * kScale + marginY; }
};

// Appends all lines of a layout to the picture. Where a line crosses another family's, that one gives way
// with a small gap, so that a crossing cannot be read as a joint.
LineStylesUsed appendLines(SvgPicture& picture, const DrawingContent& content, const DrawingOptions& options,
                           const Frame& frame);

}  // namespace olvane::draw
