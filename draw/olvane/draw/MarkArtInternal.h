// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

// A sign at the edge of a box, and what it says.
struct BoxMark {
    std::string text;
    std::string title;
    picture::Side place = picture::Side::top;
    bool isFolded = false;  // counts whom a folded branch has
};

// The signs of every box for what is expressed without a line, in the order of the marks: at most three stand at one
// edge, and a last one says how many more there are. Then those of its folded branches. Arrows lead to children on
// laterSide, and away from it to parents.
std::vector<std::vector<BoxMark>> boxMarksOf(const picture::Picture& picture, kin::Language language,
                                             picture::Side laterSide = picture::Side::bottom);

}  // namespace olvane::draw
