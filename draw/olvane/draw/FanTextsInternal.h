// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include <olvane/draw/FanCell.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

// The room for lines of text that stand one below the other around the middle of a cell: a rectangle, one that is cut
// off by the outer arc of the cell, by both arcs and the sides, or a disc.
//
// Units: px. Radii are those between which text may stand, middle is that of the middle of the cell; slope is half of the
// width of the sides at a distance of 1.
struct FanTextRoom {
    enum class Form : std::uint8_t { rectangle, along, across, disc };

    Form form = Form::rectangle;
    double height = 0;
    double breadth = 0;  // of a rectangle
    double inner = 0;
    double middle = 0;
    double outer = 0;
    double slope = 0;         // across; 0 where the cell is too wide for its sides to matter
    bool isReversed = false;  // across: lines go outwards

    // How long a line may be of which the middle is so far below that of the cell, and which is so high.
    double width(double offset, double lineHeight) const;
};

struct FanTextLine {
    std::string text;
    bool isName = false;
    double size = 0;    // px, of its letters
    double offset = 0;  // of its middle below that of the cell
};

struct FanTextLines {
    std::vector<FanTextLine> lines;
    picture::NameLoss loss = picture::NameLoss::letters;
};

// Fits a text in the largest letters, down to a size that can be read, in which the whole name goes in, the surname on a
// line of its own where there is room; if there is no such size, with initials, and only then cut. Letters are smaller
// only where not even two lines have room, and then facts are left out before names. Empty where nothing can be read.
FanTextLines fitFanText(const FanText& text, const FanTextRoom& room);

}  // namespace olvane::draw
