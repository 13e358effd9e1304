// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws the lines of each family as one group: a path for the plain pieces, and one for each style that some
// of its pieces have. A piece that lies flat jumps over another family's line with a small arc.

#include <olvane/draw/LineArtInternal.h>

#include <algorithm>
#include <utility>
#include <vector>

#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/kin/shared/MergeSort.h>
#include <olvane/picture/MarriageLabels.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::cutText;

using picture::Family;
using picture::LabelSide;
using picture::Line;
using picture::LineRole;

constexpr double kLineWidth = 1.6;
constexpr double kBridge = 4;  // px, the radius of a jump
constexpr double kLabelSize = 9.5;

LineStyle styleOf(kin::UnionState state) {
    switch (state) {
        case kin::UnionState::divorced:
            return LineStyle::divorced;
        case kin::UnionState::unmarried:
            return LineStyle::unmarried;
        case kin::UnionState::married:
        case kin::UnionState::unknown:
            break;
    }
    return LineStyle::plain;
}

LineStyle styleOf(kin::ChildKind kind) {
    switch (kind) {
        case kin::ChildKind::adopted:
            return LineStyle::adopted;
        case kin::ChildKind::foster:
            return LineStyle::foster;
        case kin::ChildKind::step:
            return LineStyle::step;
        case kin::ChildKind::sealing:
            return LineStyle::sealing;
        case kin::ChildKind::birth:
        case kin::ChildKind::unknown:
            break;
    }
    return LineStyle::plain;
}

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
        std::array<std::string, kLineStyles> paths;
        PictureArea bounds = areaOf(picture_.linesOf(family).front());
        for (const Line& line : picture_.linesOf(family)) {
            const LineStyle style = styleOfPiece(family, line);
            paths[static_cast<std::size_t>(style)] += pathOf(line);
            const PictureArea area = areaOf(line);
            svg_.lines.push_back(area);
            include(bounds, area);
        }
        const std::size_t start = svg_.svg.size();
        svg_.svg += "<g>";
        for (std::size_t s = 0; s < kLineStyles; ++s) appendPath(paths[s], static_cast<LineStyle>(s));
        appendLabel(family);
        svg_.svg += "</g>\n";
        svg_.strokes.push_back({bounds, start, svg_.svg.size() - start});
    }

    LineStyle styleOfPiece(const Family& family, const Line& line) const {
        if (line.role == LineRole::marriage) return styleOf(family.style);
        if (line.child == picture::kNone) return LineStyle::plain;
        const auto children = picture_.children(family);
        const auto found = std::find(children.begin(), children.end(), line.child);
        if (found == children.end()) return LineStyle::plain;
        return styleOf(picture_.kinds(family)[static_cast<std::size_t>(found - children.begin())]);
    }

    void appendPath(const std::string& path, LineStyle style) {
        if (path.empty()) return;
        used_[static_cast<std::size_t>(style)] = true;
        svg_.svg += "<path";
        if (style != LineStyle::plain) {
            put(svg_.svg, " stroke-linecap=\"butt\" stroke-dasharray=\"", dashesOf(style), "\"");
        }
        put(svg_.svg, " d=\"", path, "\"/>");
    }

    std::string pathOf(const Line& line) const {
        const double x1 = frame_.x(std::min(line.x1, line.x2));
        const double x2 = frame_.x(std::max(line.x1, line.x2));
        if (line.x1 == line.x2) {
            return joined("M", number(x1), " ", number(frame_.y(std::min(line.y1, line.y2))), "V",
                          number(frame_.y(std::max(line.y1, line.y2))));
        }
        if (line.y1 != line.y2) {
            return joined("M", number(frame_.x(line.x1)), " ", number(frame_.y(line.y1)), "L",
                          number(frame_.x(line.x2)), " ", number(frame_.y(line.y2)));
        }
        std::string path = joined("M", number(x1), " ", number(frame_.y(line.y1)));
        appendJumps(path, line);
        put(path, "H", number(x2));
        return path;
    }

    // Up in a quarter of a circle, over one line or several that are close, and down again.
    void appendJumps(std::string& path, const Line& line) const {
        std::vector<double> places;
        for (const double place : picture_.bridgesOf(line)) places.push_back(frame_.x(place));
        kin::mergeSort(places.begin(), places.end());
        const Number r = number(kBridge);
        for (std::size_t i = 0, next = 0; i < places.size(); i = next) {
            while (next < places.size() && places[next] - places[i == next ? i : next - 1] <= 2 * kBridge)
                ++next;
            put(path, "H", number(places[i] - kBridge), "a", r, " ", r, " 0 0 1 ", r, " -", r);
            if (next - i > 1) put(path, "H", number(places[next - 1]));
            put(path, "a", r, " ", r, " 0 0 1 ", r, " ", r);
        }
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

std::string_view dashesOf(LineStyle style) {
    constexpr auto kDashes =
        std::to_array<std::string_view>({"", "7 5", "3 3", "2 4", "9 3 2 3", "12 3", "1 3"});
    return kDashes[static_cast<std::size_t>(style)];
}

std::string_view meaningOf(LineStyle style, kin::Language language) {
    constexpr auto kMeanings = std::to_array<Phrase>({Phrase::divorced, Phrase::unmarried, Phrase::adopted,
                                                      Phrase::foster, Phrase::step, Phrase::sealing});
    if (style == LineStyle::plain) return {};
    return wordsOf(kMeanings[static_cast<std::size_t>(style) - 1], language);
}

LineStylesUsed appendLines(SvgPicture& svg, const DrawingContent& content, const DrawingOptions& options,
                           const Frame& frame) {
    return FamilyPen(svg, content, options, frame).drawAll();
}

}  // namespace olvane::draw
