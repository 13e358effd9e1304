// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include <olvane/picture/Picture.h>

namespace olvane::draw {

// A piece of a ring of a round chart.
//
// Units: degrees clockwise from the top; px. A screen that shows one px for each point has the cells of the picture.
struct FanCell {
    double from = 0;
    double to = 0;
    double inner = 0;  // radius
    double outer = 0;
    double middleX = 0;  // of the chart
    double middleY = 0;
    bool isCentre = false;  // the disc in the middle of the chart

    // The cell of a box in a round picture, with `scale` px for a point and the middle of the chart at (0, 0).
    static FanCell of(const picture::Picture& fan, std::size_t box, double scale = 1);
};

// The outline of the cell as the data of an SVG path.
std::string outlineOf(const FanCell& cell);

// What a cell says: a name, and what stands below it. The facts are parts of one line, or of two.
struct FanText {
    std::string given;
    std::string surname;
    bool surnameFirst = false;
    std::vector<std::string> facts;
};

// A line of text with its middle at (x, y), turned around it by `turn` degrees. The baseline is below the middle by
// kFanBaseline of the size.
struct PlacedFanLine {
    std::string text;
    bool isName = false;
    double size = 0;  // px, of its letters
    double x = 0;
    double y = 0;
    double turn = 0;
};

inline constexpr double kFanBaseline = 0.36;

// Places the text in a cell: across it where it is broader than deep, else along the radius; the other way where less is
// lost so. Straight, since renderers differ in text on paths. Empty where nothing can be read.
std::vector<PlacedFanLine> placedTextOf(const FanCell& cell, const FanText& text);

}  // namespace olvane::draw
