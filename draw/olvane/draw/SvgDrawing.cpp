// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Composes a picture: page, headline, lines, boxes, legend.

#include <olvane/draw/SvgDrawing.h>

#include <algorithm>
#include <cmath>
#include <optional>
#include <set>
#include <unordered_map>
#include <utility>
#include <vector>

#include <olvane/draw/BoxArtInternal.h>
#include <olvane/draw/BoxPartsInternal.h>
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
constexpr int kWidePicture = 3000;
constexpr int kLegendPlaces = 64;        // tried at the lower edge of a wide picture
constexpr double kLegendClearance = 20;  // to boxes, their frames and marks, and to lines

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
        marks_ = boxMarksOf(content_.picture, options_.language, content_.laterSide);
        numberRepeats();
        findCommonAncestors();
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
        if (picture.boxes.empty()) appendNobody();
        for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
            BoxFrame frame = frameOf(picture.boxes[i]);
            frame.language = options_.language;
            frame.isFocus = picture.focus == static_cast<picture::Index>(i);
            addKinship(frame, static_cast<picture::Index>(i));
            frame.marks = marks_[i];
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
        for (const std::vector<BoxMark>& marks : marks_) {
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
        std::string sign;  // of a badge, instead of a line
        bool hollow = false;
    };

    void addSigns(std::vector<LegendRow>& rows) const {
        const picture::Picture& picture = content_.picture;
        bool hasHidden = false, hasFurther = false;
        std::string elsewhere, folded;
        for (std::size_t i = 0; i < picture.boxes.size(); ++i) {
            const picture::Box& box = picture.boxes[i];
            if (box.kind != picture::BoxKind::person) continue;
            bool isFolded = false;
            for (const BoxMark& mark : marks_[i]) {
                isFolded = isFolded || mark.isFolded;
                std::string& sign = mark.isFolded ? folded : elsewhere;
                if (sign.empty()) sign = mark.text;
            }
            hasHidden = hasHidden || (!isFolded && frameOf(box).hasHidden());
            hasFurther = hasFurther || (box.furtherParents > 0 && !content_.labelOf(box.id).living);
        }
        const std::pair<std::string_view, Phrase> signs[] = {
            {hasHidden ? "+" : "", Phrase::meansHidden},
            {repeats_.empty() ? "" : "=", Phrase::meansSamePerson},
            {elsewhere, Phrase::meansElsewhere},
            {hasFurther ? kTwoUp : "", Phrase::meansFurtherParents},
            {folded, Phrase::meansFolded},
        };
        for (const auto& [sign, meaning] : signs) {
            if (sign.empty()) continue;
            LegendRow& row = rows.emplace_back();
            row.text = wordsOf(meaning, options_.language);
            row.sign = sign;
            row.hollow = meaning != Phrase::meansHidden && meaning != Phrase::meansFolded;
        }
    }

    std::vector<LegendRow> legendRows(const LineStylesUsed& styles) const {
        std::vector<LegendRow> rows;
        const std::vector<picture::Way>& ways = content_.picture.ways;
        for (std::size_t i = 0; i < ways.size(); ++i) {
            rows.push_back({wayColour(theme(), i), kWayWidth, wayDashes(i), ways[i].words, {}, false});
        }
        for (std::size_t i = 1; i < kLineStyles; ++i) {
            const auto style = static_cast<LineStyle>(i);
            if (styles[i])
                rows.push_back({theme().line,
                                kLegendLine,
                                dashesOf(style),
                                std::string(meaningOf(style, options_.language)),
                                {},
                                false});
        }
        addSigns(rows);
        return rows;
    }

    // Lists only what is there: in a lower corner of the picture where that is free, else below it.
    std::string legendFor(const LineStylesUsed& styles) {
        const std::vector<LegendRow> rows = legendRows(styles);
        if (rows.empty()) return std::string();
        picture_.text.add(kLegendSize);
        double width = kLegendWidth;
        for (const LegendRow& row : rows) {
            const double text = textWidth(cleanText(cutText(row.text)), {kLegendSize});
            width = std::max(width, kLegendStroke + 10 + text);
        }
        placeLegend(wholePx(width), kLegendPitch * static_cast<int>(rows.size()));
        std::string legend;
        put(legend, "<g>\n<title>", Escaped{wordsOf(Phrase::legend, options_.language)}, "</title>\n");
        int number = 0;
        for (const LegendRow& row : rows) appendLegendRow(legend, number++, row);
        return legend + "</g>\n";
    }

    void placeLegend(int width, int height) {
        int y = picture_.height - kMargin - height;
        std::optional<int> x = freePlaceOf(width, height, y);
        if (!x) {
            x = kMargin;
            y = picture_.height - kMargin + kLegendGap;
            picture_.height += height + kLegendGap;
            picture_.width = std::max(picture_.width, width + 2 * kMargin);
        }
        picture_.legend = {static_cast<double>(*x), static_cast<double>(y), static_cast<double>(width),
                           static_cast<double>(height)};
    }

    // Where an area at the lower edge is free: a corner, or in a wide picture, of which a corner may lie on another sheet
    // than anything else, the place that is nearest to the focus.
    std::optional<int> freePlaceOf(int width, int height, int top) const {
        const int last = picture_.width - kMargin - width;
        if (picture_.width <= kWidePicture || content_.picture.focus == picture::kNone) {
            for (const int x : {kMargin, last}) {
                if (isFree(x, top, width, height)) return x;
            }
            return std::nullopt;
        }
        const double focus =
            frame_.x(content_.picture.boxes[static_cast<std::size_t>(content_.picture.focus)].x);
        std::optional<int> nearest;
        for (int i = 0; i <= kLegendPlaces; ++i) {
            const int x = kMargin + static_cast<int>(static_cast<double>(last - kMargin) * i / kLegendPlaces);
            const auto distance = [&](int of) { return std::abs(of + width / 2.0 - focus); };
            if (nearest && distance(x) >= distance(*nearest)) continue;
            if (isFree(x, top, width, height)) nearest = x;
        }
        return nearest;
    }

    // Whether nothing is drawn in an area of the picture or close to it.
    bool isFree(int left, int top, int width, int height) const {
        if (left < kMargin || top < kMargin) return false;
        const double x = left - kLegendClearance;
        const double y = top - kLegendClearance;
        const auto covers = [&](double x1, double y1, double x2, double y2) {
            return frame_.x(std::max(x1, x2)) > x &&
                   frame_.x(std::min(x1, x2)) < left + width + kLegendClearance &&
                   frame_.y(std::max(y1, y2)) > y &&
                   frame_.y(std::min(y1, y2)) < top + height + kLegendClearance;
        };
        for (const picture::Box& box : content_.picture.boxes) {
            if (covers(box.x, box.y, box.x + static_cast<double>(box.width),
                       box.y + static_cast<double>(box.height)))
                return false;
        }
        for (const picture::Line& line : content_.picture.lines) {
            if (covers(line.x1, line.y1, line.x2, line.y2)) return false;
        }
        for (const picture::KinshipPlate& plate : plates_) {
            if (covers(plate.x, plate.y, plate.right(), plate.bottom())) return false;
        }
        return true;
    }

    void appendLegendRow(std::string& legend, int place, const LegendRow& row) const {
        const int left = static_cast<int>(picture_.legend.x);
        const int y = static_cast<int>(picture_.legend.y) + kLegendPitch * place + kLegendPitch / 2;
        if (row.sign.empty()) {
            put(legend, "<path d=\"M", whole(left), " ", whole(y), "h", whole(kLegendStroke),
                "\" fill=\"none\" stroke=\"", row.colour, "\" stroke-width=\"", number(row.width), "\"");
            if (!row.dashes.empty()) put(legend, " stroke-dasharray=\"", row.dashes, "\"");
            legend += "/>\n";
        } else {
            Badge badge{row.sign, row.text, row.hollow};
            badge.x = left + (kLegendStroke - badge.width()) / 2;
            appendBadge(legend, y - kBadgeHeight / 2, badge, theme());
        }
        put(legend, "<text x=\"", whole(left + kLegendStroke + 10), "\" y=\"", whole(y + 4),
            "\" font-size=\"", number(kLegendSize), "\" fill=\"", theme().quietText, "\">",
            Escaped{cleanText(cutText(row.text))}, "</text>\n");
    }

    const DrawingContent& content_;
    const DrawingOptions& options_;
    Frame frame_;
    SvgPicture picture_;
    std::unordered_map<std::int64_t, Repeats> repeats_;
    std::set<picture::Index> commonAncestors_;
    std::vector<std::vector<BoxMark>> marks_;  // of each box
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
