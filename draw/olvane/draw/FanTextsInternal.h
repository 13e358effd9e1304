// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <string>
#include <vector>

#include <olvane/picture/TextFit.h>

namespace olvane::draw {

// What a cell of a fan says: a name, and what stands below it. The facts are parts of one line, or of two.
struct FanText {
    std::string given;
    std::string surname;
    bool surnameFirst = false;
    std::vector<std::string> facts;
};

// The room for lines of text that stand one below the other around the middle of a cell.
//
// Units: px. width says how long a line may be of which the middle is so far below that of the cell, and which is so high.
struct FanTextRoom {
    double height = 0;
    std::function<double(double offset, double height)> width;
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
