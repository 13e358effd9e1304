// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

// Draws a round chart: a cell for each box, coloured by its line of descent, with the person's name across the
// cell or along the radius, whichever leaves it more room. What has no room is in the cell's title.
SvgPicture drawFan(const DrawingContent& content, const DrawingOptions& options);

}  // namespace olvane::draw
