// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <string_view>

#include <olvane/draw/FrameInternal.h>
#include <olvane/draw/LinePaths.h>
#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

// Which styles a picture uses, for its legend.
using LineStylesUsed = std::array<bool, kLineStyles>;

// Appends the lines of all families, each an element of its own. A line that crosses another family's jumps
// over it where the picture says so. Labels stand over the marriage lines.
LineStylesUsed appendLines(SvgPicture& svg, const DrawingContent& content, const DrawingOptions& options,
                           const Frame& frame);

}  // namespace olvane::draw
