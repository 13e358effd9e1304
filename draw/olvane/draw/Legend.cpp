// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/draw/LegendInternal.h>

#include <algorithm>
#include <cmath>
#include <utility>

#include <olvane/draw/BoxPartsInternal.h>
#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/PageArtInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::cutText;
using picture::textWidth;

// All in px.
constexpr int kPitch = 22;
constexpr int kGap = 12;  // between the last row of boxes and the legend
constexpr double kLeastWidth = 170;
constexpr int kStroke = 44;
constexpr int kTextGap = 10;
constexpr int kWidePicture = 3000;
constexpr int kPlaces = 64;        // tried at the lower edge of a wide picture
constexpr double kClearance = 20;  // to boxes, their frames and marks, and to lines

// Looks for room at the lower edge of a page.
class FreePlace {
public:
    FreePlace(const SvgPicture& page, const DrawnPicture& drawn) : page_(page), drawn_(drawn) {}

    // Where an area at the lower edge is free: a corner, or in a wide picture, of which a corner may lie on another sheet
    // than anything else, the place that is nearest to the focus.
    std::optional<int> find(int width, int height, int top) const {
        const int last = page_.width - kMargin - width;
        if (page_.width <= kWidePicture || drawn_.picture.focus == picture::kNone) {
            for (const int x : {kMargin, last}) {
                if (isFree(x, top, width, height)) return x;
            }
            return std::nullopt;
        }
        const double focus =
            drawn_.frame.x(drawn_.picture.boxes[static_cast<std::size_t>(drawn_.picture.focus)].x);
        std::optional<int> nearest;
        for (int i = 0; i <= kPlaces; ++i) {
            const int x = kMargin + static_cast<int>(static_cast<double>(last - kMargin) * i / kPlaces);
            const auto distance = [&](int of) { return std::abs(of + width / 2.0 - focus); };
            if (nearest && distance(x) >= distance(*nearest)) continue;
            if (isFree(x, top, width, height)) nearest = x;
        }
        return nearest;
    }

private:
    // Whether nothing is drawn in an area of the picture or close to it.
    bool isFree(int left, int top, int width, int height) const {
        if (left < kMargin || top < kMargin) return false;
        const double x = left - kClearance;
        const double y = top - kClearance;
        const auto covers = [&](double x1, double y1, double x2, double y2) {
            return drawn_.frame.x(std::max(x1, x2)) > x &&
                   drawn_.frame.x(std::min(x1, x2)) < left + width + kClearance &&
                   drawn_.frame.y(std::max(y1, y2)) > y &&
                   drawn_.frame.y(std::min(y1, y2)) < top + height + kClearance;
        };
        for (const picture::Box& box : drawn_.picture.boxes) {
            if (covers(box.x, box.y, box.x + static_cast<double>(box.width),
                       box.y + static_cast<double>(box.height)))
                return false;
        }
        for (const picture::Line& line : drawn_.picture.lines) {
            if (covers(line.x1, line.y1, line.x2, line.y2)) return false;
        }
        for (const picture::KinshipPlate& plate : drawn_.plates) {
            if (covers(plate.x, plate.y, plate.right(), plate.bottom())) return false;
        }
        return true;
    }

    const SvgPicture& page_;
    const DrawnPicture& drawn_;
};

}  // namespace

Legend::Legend(std::vector<LegendRow> rows, const DrawingOptions& options)
    : rows_(std::move(rows)), options_(options) {}

int Legend::rowsWidth() const {
    double width = kLeastWidth;
    for (const LegendRow& row : rows_) {
        const double text = textWidth(cleanText(cutText(row.text)), {kLegendLetters});
        width = std::max(width, kStroke + kTextGap + text);
    }
    return wholePx(width);
}

int Legend::rowsHeight() const {
    return kPitch * static_cast<int>(rows_.size());
}

PictureArea Legend::placeIn(SvgPicture& page, const DrawnPicture& drawn) const {
    const int width = rowsWidth();
    const int height = rowsHeight();
    int y = page.height - kMargin - height;
    std::optional<int> x = FreePlace(page, drawn).find(width, height, y);
    if (!x) {
        x = kMargin;
        y = page.height - kMargin + kGap;
        page.height += height + kGap;
        page.width = std::max(page.width, width + 2 * kMargin);
    }
    return {static_cast<double>(*x), static_cast<double>(y), static_cast<double>(width),
            static_cast<double>(height)};
}

std::string Legend::svgIn(const PictureArea& area) const {
    std::string svg;
    put(svg, "<g>\n<title>", Escaped{wordsOf(Phrase::legend, options_.language)}, "</title>\n");
    int number = 0;
    for (const LegendRow& row : rows_) appendRow(svg, area, number++, row);
    return svg + "</g>\n";
}

// A small box within its frame, around a point.
void Legend::appendFrameSign(std::string& svg, int x, int y) const {
    put(svg, "<path d=\"M", whole(x - 7), " ", whole(y - 5),
        "h14v10h-14zm-3 -3h20v16h-20z\" fill=\"none\" stroke=\"", options_.theme->badge,
        "\" stroke-width=\"2\"/>\n");
}

void Legend::appendRow(std::string& svg, const PictureArea& area, int place, const LegendRow& row) const {
    const int left = static_cast<int>(area.x);
    const int y = static_cast<int>(area.y) + kPitch * place + kPitch / 2;
    if (row.isFrame) {
        appendFrameSign(svg, left + kStroke / 2, y);
    } else if (row.sign.empty()) {
        put(svg, "<path d=\"M", whole(left), " ", whole(y), "h", whole(kStroke), "\" fill=\"none\" stroke=\"",
            row.colour, "\" stroke-width=\"", number(row.width), "\"");
        if (!row.dashes.empty()) put(svg, " stroke-dasharray=\"", row.dashes, "\"");
        svg += "/>\n";
    } else {
        Badge badge{row.sign, row.text, row.hollow};
        badge.x = left + (kStroke - badge.width()) / 2;
        appendBadge(svg, y - kBadgeHeight / 2, badge, *options_.theme);
    }
    put(svg, "<text x=\"", whole(left + kStroke + kTextGap), "\" y=\"", whole(y + 4), "\" font-size=\"",
        number(kLegendLetters), "\" fill=\"", options_.theme->quietText, "\">",
        Escaped{cleanText(cutText(row.text))}, "</text>\n");
}

}  // namespace olvane::draw
