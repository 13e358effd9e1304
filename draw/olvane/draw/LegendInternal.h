// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/draw/FrameInternal.h>
#include <olvane/draw/SvgDrawing.h>
#include <olvane/picture/KinshipPlates.h>

namespace olvane::draw {

// In px.
constexpr double kLegendLetters = 11.5;
constexpr double kLegendLine = 1.6;

// What a line of a kind looks like, and what it means.
struct LegendRow {
    std::string_view colour;
    double width = kLegendLine;
    std::string_view dashes;
    std::string text;
    std::string sign;  // of a badge, instead of a line
    bool hollow = false;
    bool isFrame = false;  // that of a common ancestor, instead of a line
};

// What is drawn of a picture, and where: the frame leads from its points to px.
struct DrawnPicture {
    const picture::Picture& picture;
    const std::vector<picture::KinshipPlate>& plates;
    const Frame& frame;
};

// A list of the signs in a picture: in a lower corner of it where that is free, else below it.
//
// Lifetime: options must outlive it.
class Legend {
public:
    Legend(std::vector<LegendRow> rows, const DrawingOptions& options);

    bool isEmpty() const { return rows_.empty(); }

    // Its area, in px. The page grows where the legend stands below the picture.
    PictureArea placeIn(SvgPicture& page, const DrawnPicture& drawn) const;

    // As SVG, in that area.
    std::string svgIn(const PictureArea& area) const;

private:
    int rowsWidth() const;
    int rowsHeight() const;
    void appendFrameSign(std::string& svg, int x, int y) const;
    void appendRow(std::string& svg, const PictureArea& area, int place, const LegendRow& row) const;

    std::vector<LegendRow> rows_;
    const DrawingOptions& options_;
};

}  // namespace olvane::draw
