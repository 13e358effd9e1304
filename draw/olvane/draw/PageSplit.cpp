// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Cuts a picture into sheets. Each sheet is a picture of its own that shows a window of the whole; a strip
// along the right and the lower edge comes again on the next sheet, and a dashed line with ticks shows where
// that one begins.

#include <olvane/draw/PageSplit.h>

#include <algorithm>
#include <cmath>
#include <cstddef>

#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::cutText;
using picture::fitLine;
using picture::Font;
using picture::kFontFamilies;
using picture::textWidth;

constexpr double kPxOfMm = 96 / 25.4;
constexpr double kMargin = 10 * kPxOfMm;  // printers leave as much white
constexpr double kStrip = 15 * kPxOfMm;   // comes again on the next sheet
constexpr double kTick = 4 * kPxOfMm;
constexpr double kLeastScale = 0.5;
constexpr double kFootSize = 10;
constexpr double kStrokeRoom = 8;  // px; more than any stroke is wide

struct Sheet {
    double width = 0;  // of the paper, in px
    double height = 0;

    double roomWidth() const { return width - 2 * kMargin; }
    double roomHeight() const { return height - 2 * kMargin; }
};

struct Grid {
    Sheet sheet;
    double scale = 1;
    int columns = 1;
    int rows = 1;

    int count() const { return columns * rows; }
};

// How many windows of that room cover a length, neighbours sharing a strip.
int windowsFor(double length, double room) {
    if (length <= room) return 1;
    return 1 + static_cast<int>(std::ceil((length - room) / (room - kStrip)));
}

Grid gridOn(const Sheet& sheet, const SvgPicture& picture) {
    const double fit = std::min(sheet.roomWidth() / picture.width, sheet.roomHeight() / picture.height);
    Grid grid;
    grid.sheet = sheet;
    if (fit >= kLeastScale) {
        grid.scale = std::min(1.0, fit);
        return grid;
    }
    grid.columns = windowsFor(picture.width, sheet.roomWidth());
    grid.rows = windowsFor(picture.height, sheet.roomHeight());
    return grid;
}

// Fewer sheets, or else the larger picture; upright where both are equal.
Grid chooseGrid(const Paper& paper, const SvgPicture& picture) {
    const Grid upright = gridOn({paper.width * kPxOfMm, paper.height * kPxOfMm}, picture);
    const Grid across = gridOn({paper.height * kPxOfMm, paper.width * kPxOfMm}, picture);
    if (across.count() != upright.count()) return across.count() < upright.count() ? across : upright;
    return across.scale > upright.scale ? across : upright;
}

std::string line(double x1, double y1, double x2, double y2, bool dashed) {
    return "<path d=\"M" + px(x1) + " " + px(y1) + "L" + px(x2) + " " + px(y2) + "\"" +
           (dashed ? " stroke-dasharray=\"3 4\"" : "") + "/>\n";
}

// Ticks in the margin at both ends of a seam, and the seam itself, dashed.
void appendSeam(std::string& svg, const Sheet& sheet, bool upright, double at) {
    const double from = kMargin - kTick;
    const double end = (upright ? sheet.height : sheet.width) - kMargin;
    const auto add = [&](double a, double b, bool dashed) {
        svg += upright ? line(at, a, at, b, dashed) : line(a, at, b, at, dashed);
    };
    add(from, kMargin, false);
    add(end, end + kTick, false);
    add(kMargin, end, true);
}

void appendSeams(std::string& svg, const Grid& grid, int column, int row) {
    const Sheet& sheet = grid.sheet;
    svg += "<g fill=\"none\" stroke=\"#666666\" stroke-width=\"0.6\">\n";
    if (column > 0) appendSeam(svg, sheet, true, kMargin + kStrip);
    if (column + 1 < grid.columns) appendSeam(svg, sheet, true, sheet.width - kMargin - kStrip);
    if (row > 0) appendSeam(svg, sheet, false, kMargin + kStrip);
    if (row + 1 < grid.rows) appendSeam(svg, sheet, false, sheet.height - kMargin - kStrip);
    svg += "</g>\n";
}

void appendFoot(std::string& svg, const Grid& grid, int column, int row, const std::string& title) {
    const std::string place = "row " + std::to_string(row + 1) + " of " + std::to_string(grid.rows) +
                              ", column " + std::to_string(column + 1) + " of " +
                              std::to_string(grid.columns);
    const Font font{kFootSize, false};
    const double room = grid.sheet.roomWidth() - textWidth(place, font) - 3 * kFootSize;
    const std::string y = px(grid.sheet.height - kMargin + kTick + kFootSize);
    svg += "<g font-family=\"" + std::string(kFontFamilies) + "\" font-size=\"" + px(kFootSize) +
           "\" fill=\"#444444\">\n<text x=\"" + px(kMargin) + "\" y=\"" + y + "\">" +
           escaped(fitLine(cleanText(cutText(title)), font, room)) + "</text>\n<text x=\"" +
           px(grid.sheet.width - kMargin) + "\" y=\"" + y + "\" text-anchor=\"end\">" + place +
           "</text>\n</g>\n";
}

// What a sheet shows of the picture.
PictureArea windowOf(const Grid& grid, int column, int row) {
    PictureArea window;
    window.width = grid.sheet.roomWidth() / grid.scale;
    window.height = grid.sheet.roomHeight() / grid.scale;
    window.x = column * (window.width - kStrip / grid.scale);
    window.y = row * (window.height - kStrip / grid.scale);
    return window;
}

bool shows(const PictureArea& window, const PictureArea& area) {
    return area.x <= window.x + window.width && area.x + area.width >= window.x &&
           area.y <= window.y + window.height && area.y + area.height >= window.y;
}

bool showsAnything(const PictureArea& window, const SvgPicture& picture) {
    const auto isShown = [&window](const PictureArea& area) { return shows(window, area); };
    return std::any_of(picture.boxes.begin(), picture.boxes.end(),
                       [&](const PictureBox& box) { return isShown(box.area); }) ||
           std::any_of(picture.lines.begin(), picture.lines.end(), isShown) ||
           (picture.legend.width > 0 && isShown(picture.legend));
}

// With the halves of its width beside it.
PictureArea inked(const PictureArea& stroke) {
    return {stroke.x - kStrokeRoom, stroke.y - kStrokeRoom, stroke.width + 2 * kStrokeRoom,
            stroke.height + 2 * kStrokeRoom};
}

// The elements of a picture, without its prologue, so that another one can hold it, and without the strokes
// and boxes that the window does not show.
std::string elementsWithin(const SvgPicture& picture, const PictureArea& window) {
    std::size_t done = picture.svg.find("<svg");
    std::string elements;
    const auto leaveOut = [&](const PictureBox& piece) {
        elements.append(picture.svg, done, piece.start - done);
        done = piece.start + piece.length;
    };
    for (const PictureBox& stroke : picture.strokes) {
        if (!shows(window, inked(stroke.area))) leaveOut(stroke);
    }
    for (const PictureBox& box : picture.boxes) {
        if (!shows(window, box.area)) leaveOut(box);
    }
    return elements.append(picture.svg, done);
}

// The picture as a nested one that shows a window of itself on the sheet.
std::string nestedPicture(const SvgPicture& picture, const Sheet& sheet, const PictureArea& window) {
    return "<svg x=\"" + px(kMargin) + "\" y=\"" + px(kMargin) + "\" width=\"" + px(sheet.roomWidth()) +
           "\" height=\"" + px(sheet.roomHeight()) + "\" viewBox=\"" + px(window.x) + " " + px(window.y) +
           " " + px(window.width) + " " + px(window.height) + "\" preserveAspectRatio=\"xMinYMin\">\n" +
           elementsWithin(picture, window) + "</svg>\n";
}

SvgPicture sheetOf(const SvgPicture& picture, const Grid& grid, int column, int row,
                   const std::string& title) {
    SvgPicture sheet;
    sheet.width = static_cast<int>(std::lround(grid.sheet.width));
    sheet.height = static_cast<int>(std::lround(grid.sheet.height));
    sheet.svg =
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"" +
        px(grid.sheet.width / kPxOfMm) + "mm\" height=\"" + px(grid.sheet.height / kPxOfMm) +
        "mm\" viewBox=\"0 0 " + px(grid.sheet.width) + " " + px(grid.sheet.height) + "\">\n<title>" +
        escaped(cutText(title)) + "</title>\n<rect width=\"100%\" height=\"100%\" fill=\"#ffffff\"/>\n";
    sheet.svg += nestedPicture(picture, grid.sheet, windowOf(grid, column, row));
    if (grid.count() > 1) {
        appendSeams(sheet.svg, grid, column, row);
        appendFoot(sheet.svg, grid, column, row, title);
    }
    sheet.svg += "</svg>\n";
    return sheet;
}

}  // namespace

std::optional<Paper> paperOfName(std::string_view name) {
    if (name == "A4") return Paper{210, 297};
    if (name == "A3") return Paper{297, 420};
    if (name == "letter") return Paper{215.9, 279.4};
    return std::nullopt;
}

std::vector<SvgPicture> splitPages(const SvgPicture& picture, const Paper& paper, const std::string& title) {
    const Grid grid = chooseGrid(paper, picture);
    std::vector<SvgPicture> sheets;
    for (int row = 0; row < grid.rows; ++row) {
        for (int column = 0; column < grid.columns; ++column) {
            const bool isFirst = row == 0 && column == 0;  // a headline would stand here
            if (isFirst || showsAnything(windowOf(grid, column, row), picture))
                sheets.push_back(sheetOf(picture, grid, column, row, title));
        }
    }
    return sheets;
}

}  // namespace olvane::draw
