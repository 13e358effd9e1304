// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <string_view>

#include <olvane/draw/LineArtInternal.h>

namespace olvane::draw {

// Each way has a colour and dashes of its own, the first ones unbroken lines; beyond the eighth they begin again.
std::string_view wayColour(const DrawingTheme& theme, std::size_t way);
std::string_view wayDashes(std::size_t way);

// Px, in the picture and in its legend.
constexpr double kWayWidth = 3.4;

// The lines of all ways over those of the families, the nearest way last, so on top; each an element of its own with
// a title.
void appendWays(std::string& svg, const picture::Picture& picture, const DrawingTheme& theme,
                const Frame& frame);

}  // namespace olvane::draw
