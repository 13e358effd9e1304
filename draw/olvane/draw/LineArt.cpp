// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws the lines of each family as one group: a path for the plain pieces, and one for each style that some
// of its pieces have.

#include <olvane/draw/LineArtInternal.h>

#include <algorithm>
#include <utility>
#include <vector>

#include <olvane/draw/LinePathsInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/MarriageLabels.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::cutText;

using picture::Family;
using picture::LabelSide;
using picture::Line;

constexpr double kLineWidth = 1.6;
constexpr double kLabelSize = 9.5;

class FamilyPen {
public:
    FamilyPen(SvgPicture& svg, const DrawingContent& content, const DrawingOptions& options,
              const Frame& frame)
        : svg_(svg), content_(content), picture_(content.picture), options_(options), frame_(frame) {
        if (content.familyLabelOf) labelPlaces_ = marriageLabelPlaces(picture_, kLabelSize / Frame::kScale);
    }

    LineStylesUsed drawAll() {
        put(svg_.svg, "<g fill=\"none\" stroke=\"", options_.theme->line, "\" stroke-width=\"",
            number(kLineWidth), "\" stroke-linejoin=\"round\" stroke-linecap=\"square\">\n");
        for (const Family& family : picture_.families) {
            if (family.lineCount > 0) draw(family);
        }
        svg_.svg += "</g>\n";
        return used_;
    }

private:
    void draw(const Family& family) {
        PictureArea bounds = areaOf(picture_.linesOf(family).front());
        for (const Line& line : picture_.linesOf(family)) {
            const PictureArea area = areaOf(line);
            svg_.lines.push_back(area);
            include(bounds, area);
        }
        const std::size_t start = svg_.svg.size();
        svg_.svg += "<g>";
        for (const LinePath& path : linePathsOf(picture_, family, frame_)) appendPath(path);
        appendLabel(family);
        svg_.svg += "</g>\n";
        svg_.strokes.push_back({bounds, start, svg_.svg.size() - start});
    }

    void appendPath(const LinePath& path) {
        used_[static_cast<std::size_t>(path.style)] = true;
        svg_.svg += "<path";
        if (path.style != LineStyle::plain) {
            put(svg_.svg, " stroke-linecap=\"butt\" stroke-dasharray=\"", dashesOf(path.style), "\"");
        }
        put(svg_.svg, " d=\"", path.data, "\"/>");
    }

    // In page colour around, so that lines below do not show.
    void appendLabel(const Family& family) {
        if (!content_.familyLabelOf || family.number == 0) return;
        const auto& place = labelPlaces_[static_cast<std::size_t>(&family - picture_.families.data())];
        const std::string text = cleanText(cutText(content_.familyLabelOf(family.number)));
        if (text.empty() || place.side == LabelSide::none) return;
        const bool isBeside = place.side == LabelSide::right;
        const picture::LabelOffset offset = picture::labelOffsetOf(place.side, kLabelSize);
        const double x = frame_.x(place.x) + offset.x;
        const double y = frame_.y(place.y) + offset.y;
        svg_.text.add(kLabelSize);
        put(svg_.svg, "<text x=\"", number(x), "\" y=\"", number(y), "\"",
            (isBeside ? "" : " text-anchor=\"middle\""), " font-size=\"", number(kLabelSize), "\" fill=\"",
            options_.theme->quietText, "\" stroke=\"", options_.theme->page,
            "\" stroke-width=\"3\" paint-order=\"stroke\">", Escaped{text}, "</text>");
    }

    PictureArea areaOf(const Line& line) const {
        const double x = frame_.x(std::min(line.x1, line.x2));
        const double y = frame_.y(std::min(line.y1, line.y2));
        return {x, y, frame_.x(std::max(line.x1, line.x2)) - x, frame_.y(std::max(line.y1, line.y2)) - y};
    }

    static void include(PictureArea& bounds, const PictureArea& area) {
        const double right = std::max(bounds.x + bounds.width, area.x + area.width);
        const double bottom = std::max(bounds.y + bounds.height, area.y + area.height);
        bounds.x = std::min(bounds.x, area.x);
        bounds.y = std::min(bounds.y, area.y);
        bounds.width = right - bounds.x;
        bounds.height = bottom - bounds.y;
    }

    SvgPicture& svg_;
    const DrawingContent& content_;
    const picture::Picture& picture_;
    const DrawingOptions& options_;
    const Frame& frame_;
    std::vector<picture::LabelPlace> labelPlaces_;  // of each family, where labels are asked for
    LineStylesUsed used_{};
};

}  // namespace

LineStylesUsed appendLines(SvgPicture& svg, const DrawingContent& content, const DrawingOptions& options,
                           const Frame& frame) {
    return FamilyPen(svg, content, options, frame).drawAll();
}

}  // namespace olvane::draw
