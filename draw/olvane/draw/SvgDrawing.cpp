// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Composes a picture: page, headline, lines, boxes, legend. The page takes the bounds of the boxes; lines of
// a layout run between them, but for those that lead around a lone row, so segments count for the bounds too.

#include <olvane/draw/SvgDrawing.h>

#include <algorithm>
#include <unordered_map>

#include <olvane/draw/BoxArtInternal.h>
#include <olvane/draw/LineArtInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/draw/TextFitInternal.h>

namespace olvane::draw {

namespace {

// All in px.
constexpr int kMargin = 28;
constexpr int kHeadlineHeight = 40;
constexpr double kHeadlineSize = 20;
constexpr int kLegendPitch = 22;
constexpr int kLegendGap = 12;  // between the last row of boxes and the legend
constexpr int kLegendWidth = 170;
constexpr int kLegendStroke = 44;
constexpr double kLegendSize = 11.5;

struct Bounds {
    int left = 0;
    int top = 0;
    int right = 0;
    int bottom = 0;

    void include(int x, int y) {
        left = std::min(left, x);
        right = std::max(right, x);
        top = std::min(top, y);
        bottom = std::max(bottom, y);
    }
};

Bounds boundsOf(const std::vector<LayoutRecord>& records, const BoxSize& box) {
    if (records.empty()) return {0, 0, box.width, box.height};
    Bounds bounds{records[0].x, records[0].y, records[0].x, records[0].y};
    for (const LayoutRecord& record : records) {
        bounds.include(record.x, record.y);
        bounds.include(record.x + box.width, record.y + box.height);
        for (const LayoutSegment& segment : record.segments) {
            bounds.include(segment.x1, segment.y1);
            bounds.include(segment.x2, segment.y2);
        }
    }
    return bounds;
}

class Composer {
public:
    Composer(const DrawingContent& content, const DrawingOptions& options)
        : content_(content), options_(options) {}

    SvgPicture compose() {
        const Bounds bounds = boundsOf(content_.records, options_.box);
        const int headline = options_.headline ? kHeadlineHeight : 0;
        frame_ = {bounds.left, bounds.top, kMargin, kMargin + headline};
        picture_.width = (bounds.right - bounds.left) * Frame::kScale + 2 * kMargin;
        picture_.height = (bounds.bottom - bounds.top) * Frame::kScale + 2 * kMargin + headline;

        SvgPicture lines;
        const LineStylesUsed styles = appendLines(lines, content_, options_, frame_);
        picture_.lines = std::move(lines.lines);
        const std::string legend = legendFor(styles);
        openPicture();
        appendHeadline();
        for (PictureBox& stroke : lines.strokes) stroke.start += picture_.svg.size();
        picture_.strokes = std::move(lines.strokes);
        picture_.svg += lines.svg;
        appendBoxes();
        picture_.svg += legend + "</g>\n</svg>\n";
        return std::move(picture_);
    }

private:
    const DrawingTheme& theme() const { return *options_.theme; }

    void openPicture() {
        const std::string width = std::to_string(picture_.width);
        const std::string height = std::to_string(picture_.height);
        picture_.svg +=
            "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"" +
            width + "\" height=\"" + height + "\" viewBox=\"0 0 " + width + " " + height +
            "\" role=\"group\" aria-label=\"" + escaped(options_.title) + "\">\n<title>" +
            escaped(options_.title) + "</title>\n";
        appendBoxDefinitions(picture_.svg);
        picture_.svg += "<rect width=\"" + width + "\" height=\"" + height + "\" fill=\"" +
                        std::string(theme().page) + "\"/>\n<g font-family=\"" + std::string(kFontFamilies) +
                        "\">\n";
    }

    void appendHeadline() {
        if (!options_.headline) return;
        const Font font{kHeadlineSize, true};
        const std::string text = fitLine(cleanText(options_.title), font, picture_.width - 2 * kMargin);
        picture_.svg += "<text x=\"" + std::to_string(kMargin) + "\" y=\"" + std::to_string(kMargin + 12) +
                        "\" font-weight=\"bold\" font-size=\"" + px(kHeadlineSize) + "\" fill=\"" +
                        std::string(theme().text) + "\">" + escaped(text) + "</text>\n";
    }

    // How often each person has a box, and a number for each who has several, in the order of the records.
    void numberRepeats() {
        for (const LayoutRecord& record : content_.records) {
            if (!record.addNode) ++boxCount_[record.id];
        }
        for (const LayoutRecord& record : content_.records) {
            if (record.addNode || boxCount_[record.id] < 2) continue;
            repeatNumber_.emplace(record.id, static_cast<int>(repeatNumber_.size()) + 1);
        }
    }

    void appendBoxes() {
        numberRepeats();
        if (content_.records.empty()) appendNobody();
        bool focusSeen = false;
        for (const LayoutRecord& record : content_.records) {
            Box box = boxOf(record);
            box.isFocus = !focusSeen && record.id == content_.focusId;
            focusSeen = focusSeen || box.isFocus;
            appendBox(record, box);
        }
    }

    void appendNobody() {
        picture_.svg += "<text x=\"" + std::to_string(kMargin) + "\" y=\"" +
                        std::to_string(picture_.height / 2) + "\" font-size=\"12\" fill=\"" +
                        std::string(theme().quietText) + "\">Nobody to show</text>\n";
    }

    Box boxOf(const LayoutRecord& record) const {
        Box box;
        box.record = &record;
        box.x = frame_.x(record.x);
        box.y = frame_.y(record.y);
        box.width = options_.box.width * Frame::kScale;
        box.height = options_.box.height * Frame::kScale;
        const auto repeat = repeatNumber_.find(record.id);
        if (repeat != repeatNumber_.end()) {
            box.repeatNumber = repeat->second;
            box.repeatCount = boxCount_.at(record.id);
        }
        return box;
    }

    void appendBox(const LayoutRecord& record, const Box& box) {
        const std::size_t start = picture_.svg.size();
        if (record.addNode) {
            appendPlaceholderBox(picture_.svg, box, fullName(content_.labelOf(record.addNode->childId)),
                                 theme());
        } else {
            appendPersonBox(picture_.svg, box, content_.labelOf(record.id), theme());
        }
        picture_.boxes.push_back({{box.x, box.y, box.width, box.height}, start, picture_.svg.size() - start});
    }

    // Below the picture, as wide as it needs; tells only what is there.
    std::string legendFor(const LineStylesUsed& styles) {
        if (!styles.any()) return std::string();
        std::string legend = "<g>\n<title>Legend</title>\n";
        int row = 0;
        if (styles.divorced) appendLegendLine(legend, row++, LineStyle::divorced, "divorced");
        if (styles.adopted) appendLegendLine(legend, row++, LineStyle::adopted, "adopted child");
        if (styles.foster) appendLegendLine(legend, row++, LineStyle::foster, "foster child");
        picture_.height += row * kLegendPitch + kLegendGap;
        picture_.width = std::max(picture_.width, kLegendWidth + 2 * kMargin);
        const double height = row * kLegendPitch;
        picture_.legend = {kMargin, picture_.height - kMargin - height, kLegendWidth, height};
        return legend + "</g>\n";
    }

    void appendLegendLine(std::string& legend, int row, LineStyle style, const char* meaning) const {
        const int y = picture_.height - kMargin + kLegendGap + kLegendPitch * row + kLegendPitch / 2;
        legend += "<path d=\"M" + std::to_string(kMargin) + " " + std::to_string(y) + "h" +
                  std::to_string(kLegendStroke) + "\" fill=\"none\" stroke=\"" + std::string(theme().line) +
                  "\" stroke-width=\"1.6\" stroke-dasharray=\"" + dashesOf(style) + "\"/>\n<text x=\"" +
                  std::to_string(kMargin + kLegendStroke + 10) + "\" y=\"" + std::to_string(y + 4) +
                  "\" font-size=\"" + px(kLegendSize) + "\" fill=\"" + std::string(theme().quietText) +
                  "\">" + meaning + "</text>\n";
    }

    const DrawingContent& content_;
    const DrawingOptions& options_;
    Frame frame_;
    SvgPicture picture_;
    std::unordered_map<std::int64_t, int> boxCount_;
    std::unordered_map<std::int64_t, int> repeatNumber_;
};

}  // namespace

SvgPicture drawSvg(const DrawingContent& content, const DrawingOptions& options) {
    return Composer(content, options).compose();
}

}  // namespace olvane::draw
