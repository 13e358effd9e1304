// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/draw/PageArtInternal.h>

#include <algorithm>
#include <cmath>
#include <string>

#include <olvane/draw/BoxArtInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::cutText;
using picture::fitLine;
using picture::Font;
using picture::kFontFamilies;

constexpr double kHeadlineSize = 20;
constexpr int kMostHeadline = 600;  // px of a title that widens a small picture

std::string headlineOf(const DrawingOptions& options) {
    return cleanText(cutText(options.title));
}

void appendHeadline(SvgPicture& picture, const DrawingOptions& options) {
    if (!options.headline) return;
    const Font font{kHeadlineSize, true};
    const std::string text = fitLine(headlineOf(options), font, picture.width - 2 * kMargin);
    put(picture.svg, "<text x=\"", whole(kMargin), "\" y=\"", whole(kMargin + 12),
        "\" font-weight=\"bold\" font-size=\"", number(kHeadlineSize), "\" fill=\"", options.theme->text,
        "\">", Escaped{text}, "</text>\n");
}

}  // namespace

void Bounds::include(double x, double y) {
    left = std::min(left, x);
    right = std::max(right, x);
    top = std::min(top, y);
    bottom = std::max(bottom, y);
}

Bounds boundsOf(const picture::Picture& picture, const std::vector<picture::KinshipPlate>& plates) {
    if (picture.boxes.empty()) return {0, 0, 55, 80};
    const picture::Box& first = picture.boxes.front();
    Bounds bounds{first.x, first.y, first.x, first.y};
    for (const picture::Box& box : picture.boxes) {
        bounds.include(box.x, box.y);
        bounds.include(box.x + static_cast<double>(box.width), box.y + static_cast<double>(box.height));
    }
    for (const picture::Line& line : picture.lines) {
        bounds.include(line.x1, line.y1);
        bounds.include(line.x2, line.y2);
    }
    for (const picture::KinshipPlate& plate : plates) {
        bounds.include(plate.x, plate.y);
        bounds.include(plate.right(), plate.bottom());
    }
    return bounds;
}

int wholePx(double size) {
    return static_cast<int>(std::ceil(std::clamp(size, 0.0, 1e9)));
}

int headlineWidth(const DrawingOptions& options) {
    if (!options.headline) return 0;
    const double text = picture::textWidth(headlineOf(options), {kHeadlineSize, true});
    return std::min(wholePx(text), kMostHeadline) + 2 * kMargin;
}

void openPage(SvgPicture& picture, const DrawingOptions& options) {
    const Whole width = whole(picture.width);
    const Whole height = whole(picture.height);
    const std::string title = escaped(cutText(options.title));
    put(picture.svg,
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"",
        number(picture.width * options.scale), "\" height=\"", number(picture.height * options.scale),
        "\" viewBox=\"0 0 ", width, " ", height, "\" role=\"group\" aria-label=\"", title, "\">\n<title>",
        title, "</title>\n");
    appendBoxDefinitions(picture.svg);
    put(picture.svg, "<rect width=\"", width, "\" height=\"", height, "\" fill=\"", options.theme->page,
        "\"/>\n<g font-family=\"", kFontFamilies, "\">\n");
    appendHeadline(picture, options);
}

void closePage(SvgPicture& picture) {
    picture.svg += "</g>\n</svg>\n";
}

}  // namespace olvane::draw
