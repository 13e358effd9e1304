// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>

#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

enum class LineStyle : std::uint8_t { plain, divorced, unmarried, adopted, foster, step, sealing };
inline constexpr std::size_t kLineStyles = 7;

// Which styles a picture uses, for its legend.
using LineStylesUsed = std::array<bool, kLineStyles>;

// The dashes of a style as a stroke-dasharray, and what it means; empty for the plain one.
std::string_view dashesOf(LineStyle style);
std::string_view meaningOf(LineStyle style, kin::Language language);

// From points of the layout to px of the picture.
struct Frame {
    double left = 0;  // point that lies at px (marginX, marginY)
    double top = 0;
    int marginX = 0;
    int marginY = 0;

    static constexpr int kScale = 2;
    double x(double points) const { return (points - left) * kScale + marginX; }
    double y(double points) const { return (points - top) * kScale + marginY; }
};

// Appends the lines of all families, each an element of its own. A line that crosses another family's jumps
// over it where the picture says so. Labels stand over the marriage lines.
LineStylesUsed appendLines(SvgPicture& svg, const DrawingContent& content, const DrawingOptions& options,
                           const Frame& frame);

}  // namespace olvane::draw
