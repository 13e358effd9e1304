// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

enum class MarkPlace : std::uint8_t { top, bottom };

// A sign at the edge of a box, and what it says.
struct BoxMark {
    std::string text;
    std::string title;
    MarkPlace place = MarkPlace::top;
};

// The signs of every box for what is expressed without a line, in the order of the marks. At most three stand
// at one edge; a last one says how many more there are.
std::vector<std::vector<BoxMark>> boxMarksOf(const picture::Picture& picture);

}  // namespace olvane::draw
