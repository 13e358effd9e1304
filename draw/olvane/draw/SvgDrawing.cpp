// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Composes a picture: page, headline, lines, boxes, legend.

#include <olvane/draw/SvgDrawing.h>

#include <algorithm>
#include <cmath>
#include <set>
#include <unordered_map>
#include <vector>

#include <olvane/draw/BoxArtInternal.h>
#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/FanArtInternal.h>
#include <olvane/draw/LineArtInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/draw/WayArtInternal.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::cutText;
using picture::fitLine;
using picture::Font;
using picture::kFontFamilies;
using picture::textWidth;

// All in px.
constexpr int kMargin = 28;
constexpr int kHeadlineHeight = 40;
constexpr double kHeadlineSize = 20;
constexpr int kLegendPitch = 22;
constexpr int kLegendGap = 12;  // between the last row of boxes and the legend
constexpr double kLegendWidth = 170;
constexpr int kLegendStroke = 44;
constexpr double kLegendSize = 11.5;
constexpr double kLegendLine = 1.6;

struct Bounds {
    double left = 0;
    double top = 0;
    double right = 0;
    double bottom = 0;

    void include(double x, double y) {
        left = std::min(left, x);
        right = std::max(right, x);
        top = std::min(top, y);
        bottom = std::max(bottom, y);
    }
};

// Of boxes, lines and plates; of an empty picture, the room that its sentence needs.
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

// Up to the next whole px; a picture is at most as large as a renderer's numbers.
int wholePx(double size) {
    return static_cast<int>(std::ceil(std::clamp(size, 0.0, 1e9)));
}

class Composer {
public:
    Composer(const DrawingContent& content, const DrawingOptions& options)
        : content_(content), options_(options) {}

    SvgPicture compose() {
        placePlates();
        const Bounds bounds = boundsOf(content_.picture, plates_);
        const int headline = options_.headline ? kHeadlineHeight : 0;
        frame_ = {bounds.left, bounds.top, kMargin, kMargin + headline};
        picture_.originX = frame_.x(0);
        picture_.originY = frame_.y(0);
        picture_.width = wholePx((bounds.right - bounds.left) * Frame::kScale) + 2 * kMargin;
        picture_.height = wholePx((bounds.bottom - bounds.top) * Frame::kScale) + 2 * kMargin + headline;

        SvgPicture lines;
        const LineStylesUsed styles = appendLines(lines, content_, options_, frame_);
        picture_.lines = std::move(lines.lines);
        picture_.text = lines.text;
        const std::string legend = legendFor(styles);
        openPage(picture_, options_);
        for (PictureBox& stroke : lines.strokes) stroke.start += picture_.svg.size();
        picture_.strokes = std::move(lines.strokes);
        picture_.svg += lines.svg;
        appendWays(picture_.svg, content_.picture, theme(), frame_);
        appendBoxes();
        picture_.svg += legend;
        closePage(picture_);
        return std::move(picture_);
    }

private:
    const DrawingTheme& theme() const { return *options_.theme; }

    // The number of each person with several boxes, and how many those are.
    struct Repeats {
        int number = 0;
        int boxes = 0;
    };

    void numberRepeats() {
        std::unordered_map<std::int64_t, int> boxes;
        for (const picture::Box& box : content_.picture.boxes) {
            if (box.kind == picture::BoxKind::person) ++boxes[box.id];
        }
        for (const picture::Mark& mark : content_.picture.marks) {
            if (mark.kind != picture::MarkKind::samePerson || mark.boxes[0] == picture::kNone) continue;
            const std::int64_t id = content_.picture.boxes[static_cast<std::size_t>(mark.boxes[0])].id;
            repeats_.emplace(id, Repeats{mark.number, boxes[id]});
        }
    }

    void appendBoxes() {
        const picture::Picture& picture = content_.picture;
        numberRepeats();
        findCommonAncestors();
        if (picture.boxes.empty()) appendNobody();
        const auto marks = boxMarksOf(picture, options_.language, content_.laterSide);
        for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
            BoxFrame frame = frameOf(picture.boxes[i]);
            frame.language = options_.language;
            frame.isFocus = picture.focus == static_cast<picture::Index>(i);
            addKinship(frame, static_cast<picture::Index>(i));
            frame.marks = marks[i];
            frame.leastName = options_.leastNameSize;
            frame.text = &picture_.text;
            appendBox(frame);
        }
    }

    // Of the ends of a kinship what they are to one another; and who is on top.
    void addKinship(BoxFrame& frame, picture::Index place) const {
        const picture::Picture& picture = content_.picture;
        if (picture.other == picture::kNone) return;
        frame.isOther = place == picture.other;
        frame.isCommonAncestor = commonAncestors_.contains(place);
        if (place == picture.other) {
            frame.caption = picture.otherIs;
        } else if (frame.isFocus) {
            frame.caption = picture.focusIs;
        }
        for (const picture::KinshipPlate& plate : plates_) {
            if (plate.box == place) frame.plate = &plate;
        }
    }

    void placePlates() {
        if (content_.picture.other == picture::kNone) return;
        std::vector<picture::MarkedEdges> marked;
        for (const std::vector<BoxMark>& marks :
             boxMarksOf(content_.picture, options_.language, content_.laterSide)) {
            const auto isAt = [&marks](picture::Side side) {
                return std::any_of(marks.begin(), marks.end(),
                                   [side](const BoxMark& mark) { return mark.place == side; });
            };
            marked.push_back({isAt(picture::Side::top), isAt(picture::Side::bottom)});
        }
        plates_ = picture::kinshipPlates(content_.picture, plateStyle(), marked);
    }

    void findCommonAncestors() {
        for (const picture::Way& way : content_.picture.ways) {
            const auto ancestors = content_.picture.ancestorsOf(way);
            commonAncestors_.insert(ancestors.begin(), ancestors.end());
        }
    }

    void appendNobody() {
        put(picture_.svg, "<text x=\"", whole(kMargin), "\" y=\"", whole(picture_.height / 2),
            "\" font-size=\"12\" fill=\"", theme().quietText, "\">",
            Escaped{wordsOf(Phrase::nobody, options_.language)}, "</text>\n");
    }

    BoxFrame frameOf(const picture::Box& box) const {
        BoxFrame frame;
        frame.box = &box;
        frame.x = frame_.x(box.x);
        frame.y = frame_.y(box.y);
        frame.width = static_cast<double>(box.width) * Frame::kScale;
        frame.height = static_cast<double>(box.height) * Frame::kScale;
        frame.countsHidden = content_.countsHidden;
        const auto repeat = repeats_.find(box.id);
        if (box.kind == picture::BoxKind::person && repeat != repeats_.end()) {
            frame.repeatNumber = repeat->second.number;
            frame.repeatCount = repeat->second.boxes;
        }
        return frame;
    }

    void appendBox(const BoxFrame& frame) {
        const std::size_t start = picture_.svg.size();
        if (frame.box->kind == picture::BoxKind::unknownParent) {
            appendUnknownParentBox(picture_.svg, frame, nameOfChild(*frame.box), theme());
        } else {
            appendPersonBox(picture_.svg, frame, readableLabel(content_, frame.box->id), theme());
        }
        picture_.boxes.push_back(
            {{frame.x, frame.y, frame.width, frame.height}, start, picture_.svg.size() - start});
    }

    std::string nameOfChild(const picture::Box& unknown) const {
        if (unknown.childOf == picture::kNone) return fullNameIn(kin::PersonLabel(), options_.language);
        const picture::Box& child = content_.picture.boxes[static_cast<std::size_t>(unknown.childOf)];
        return fullNameIn(
            child.kind == picture::BoxKind::person ? readableLabel(content_, child.id) : kin::PersonLabel(),
            options_.language);
    }

    // What a line of a kind looks like, and what it means.
    struct LegendRow {
        std::string_view colour;
        double width = kLegendLine;
        std::string_view dashes;
        std::string text;
    };

    std::vector<LegendRow> legendRows(const LineStylesUsed& styles) const {
        std::vector<LegendRow> rows;
        const std::vector<picture::Way>& ways = content_.picture.ways;
        for (std::size_t i = 0; i < ways.size(); ++i) {
            rows.push_back({wayColour(theme(), i), kWayWidth, wayDashes(i), ways[i].words});
        }
        for (std::size_t i = 1; i < kLineStyles; ++i) {
            const auto style = static_cast<LineStyle>(i);
            if (styles[i])
                rows.push_back({theme().line, kLegendLine, dashesOf(style),
                                std::string(meaningOf(style, options_.language))});
        }
        return rows;
    }

    // Below the picture, as wide as it needs; lists only what is there.
    std::string legendFor(const LineStylesUsed& styles) {
        const std::vector<LegendRow> rows = legendRows(styles);
        if (rows.empty()) return std::string();
        picture_.text.add(kLegendSize);
        std::string legend;
        put(legend, "<g>\n<title>", Escaped{wordsOf(Phrase::legend, options_.language)}, "</title>\n");
        double width = kLegendWidth;
        int number = 0;
        for (const LegendRow& row : rows) {
            appendLegendRow(legend, number++, row);
            width =
                std::max(width, kLegendStroke + 10 + textWidth(cleanText(cutText(row.text)), {kLegendSize}));
        }
        picture_.height += number * kLegendPitch + kLegendGap;
        picture_.width = std::max(picture_.width, wholePx(width) + 2 * kMargin);
        const double height = number * kLegendPitch;
        picture_.legend = {kMargin, picture_.height - kMargin - height, width, height};
        return legend + "</g>\n";
    }

    void appendLegendRow(std::string& legend, int place, const LegendRow& row) const {
        const int y = picture_.height - kMargin + kLegendGap + kLegendPitch * place + kLegendPitch / 2;
        put(legend, "<path d=\"M", whole(kMargin), " ", whole(y), "h", whole(kLegendStroke),
            "\" fill=\"none\" stroke=\"", row.colour, "\" stroke-width=\"", number(row.width), "\"");
        if (!row.dashes.empty()) put(legend, " stroke-dasharray=\"", row.dashes, "\"");
        put(legend, "/>\n<text x=\"", whole(kMargin + kLegendStroke + 10), "\" y=\"", whole(y + 4),
            "\" font-size=\"", number(kLegendSize), "\" fill=\"", theme().quietText, "\">",
            Escaped{cleanText(cutText(row.text))}, "</text>\n");
    }

    const DrawingContent& content_;
    const DrawingOptions& options_;
    Frame frame_;
    SvgPicture picture_;
    std::unordered_map<std::int64_t, Repeats> repeats_;
    std::set<picture::Index> commonAncestors_;
    std::vector<picture::KinshipPlate> plates_;
};

void appendHeadline(SvgPicture& picture, const DrawingOptions& options) {
    if (!options.headline) return;
    const Font font{kHeadlineSize, true};
    const std::string text = fitLine(cleanText(cutText(options.title)), font, picture.width - 2 * kMargin);
    put(picture.svg, "<text x=\"", whole(kMargin), "\" y=\"", whole(kMargin + 12),
        "\" font-weight=\"bold\" font-size=\"", number(kHeadlineSize), "\" fill=\"", options.theme->text,
        "\">", Escaped{text}, "</text>\n");
}

}  // namespace

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

std::string titleOf(std::string_view view, const DrawingContent& content, kin::Language language) {
    std::string title = viewTitle(view, language);
    const picture::Index focus = content.picture.focus;
    if (focus == picture::kNone) return title;
    const std::int64_t id = content.picture.boxes[static_cast<std::size_t>(focus)].id;
    return phraseWith(Phrase::viewOf, language, {title, fullNameIn(content.labelOf(id), language)});
}

SvgPicture drawSvg(const DrawingContent& content, const DrawingOptions& options) {
    if (content.picture.isRound()) return drawFan(content, options);
    return Composer(content, options).compose();
}

}  // namespace olvane::draw
