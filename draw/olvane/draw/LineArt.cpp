// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws families and marriages as strokes. Strokes along the trunks come first, then a patch of page colour
// wherever a stroke across meets a trunk or marriage that it has no part in, then the strokes across. Strokes
// of one style share a path, and every stroke is drawn once.

#include <olvane/draw/LineArtInternal.h>

#include <algorithm>
#include <utility>
#include <vector>

#include <olvane/draw/LineTracksInternal.h>
#include <olvane/draw/SvgTextInternal.h>

namespace olvane::draw {

namespace {

constexpr double kLineWidth = 1.6;
constexpr double kGapWidth = 8;   // px, across the line that gives way
constexpr double kGapLength = 6;  // px, along the line that passes
constexpr double kTouch = 1.5;    // points; nearer than this, lines meet and do not cross
constexpr std::size_t kNoFamily = static_cast<std::size_t>(-1);

// A straight stroke, in the frame of the trunks: along is x in a downward layout, y in a sideways one.
struct AlongStroke {
    double from;
    double to;
    double across;
    std::size_t family;
    LineStyle style;
};

struct AcrossStroke {
    double along;
    double from;
    double to;
    std::size_t family;
};

// A child's line of a style of its own: along the trunk, then to the child, in one go so that the dashes run
// on.
struct ChildStroke {
    double from;
    double along;
    double across;
    double end;
    LineStyle style;
};

struct Strokes {
    std::vector<AlongStroke> along;
    std::vector<AcrossStroke> across;
    std::vector<ChildStroke> children;
};

LineStyle styleOf(ParentLink link) {
    switch (link) {
        case ParentLink::adopted:
            return LineStyle::adopted;
        case ParentLink::foster:
            return LineStyle::foster;
        case ParentLink::birth:
            break;
    }
    return LineStyle::plain;
}

class StrokeBuilder {
public:
    StrokeBuilder(const DrawingContent& content, const DrawingOptions& options)
        : content_(content), options_(options) {}

    Strokes build() {
        const LayoutLines lines = collectLines(content_.records, options_.direction, options_.box);
        const auto places =
            separateTracks(lines.families, content_.records, options_.direction, options_.box);
        for (const MarriageLine& marriage : lines.marriages) addMarriage(marriage);
        for (std::size_t i = 0; i < lines.families.size(); ++i) addFamily(lines.families[i], i, places[i]);
        for (const LayoutSegment& segment : lines.others) addOther(segment);
        return std::move(strokes_);
    }

private:
    bool sideways() const { return options_.direction == LineDirection::sideways; }

    void addMarriage(const MarriageLine& marriage) {
        const LayoutSegment& s = marriage.segment;
        const double from = sideways() ? s.y1 : s.x1;
        const double to = sideways() ? s.y2 : s.x2;
        const LineStyle style = isDivorced(marriage) ? LineStyle::divorced : LineStyle::plain;
        strokes_.along.push_back({std::min(from, to), std::max(from, to),
                                  static_cast<double>(sideways() ? s.x1 : s.y1), kNoFamily, style});
    }

    bool isDivorced(const MarriageLine& marriage) const {
        if (!content_.isDivorced || marriage.to == FamilyTap::kNoRecord) return false;
        const LayoutRecord& one = content_.records[marriage.from];
        const LayoutRecord& other = content_.records[marriage.to];
        return !one.addNode && !other.addNode && content_.isDivorced(one.id, other.id);
    }

    LineStyle styleOfTap(const FamilyTap& tap) const {
        if (tap.childRecord == FamilyTap::kNoRecord || !content_.parentLinkOf) return LineStyle::plain;
        const LayoutRecord& child = content_.records[tap.childRecord];
        return child.addNode ? LineStyle::plain : styleOf(content_.parentLinkOf(child.id));
    }

    // The trunk is plain as far as it serves plain taps or more than one child. Beyond, it belongs to the
    // last child alone and is drawn in one go with that child's tap, in its style.
    void addFamily(const FamilyLine& family, std::size_t index, double place) {
        std::vector<StyledTap> styled;
        for (const FamilyTap& tap : family.taps) {
            const LineStyle style = styleOfTap(tap);
            if (style != LineStyle::plain) {
                styled.push_back({tap, style});
                continue;
            }
            strokes_.across.push_back(
                {static_cast<double>(tap.at), static_cast<double>(tap.end), place, index});
        }
        const Span trunk = sharedTrunk(family, styled);
        if (trunk.last > trunk.first) {
            strokes_.along.push_back({trunk.first, trunk.last, place, index, LineStyle::plain});
        }
        for (const StyledTap& child : styled) {
            const double at = child.tap.at;
            strokes_.children.push_back({std::clamp(at, trunk.first, trunk.last), at, place,
                                         static_cast<double>(child.tap.end), child.style});
        }
    }

    struct StyledTap {
        FamilyTap tap;
        LineStyle style;
    };

    struct Span {
        double first;
        double last;
    };

    // All taps but a styled one that is the outermost on its side.
    static Span sharedTrunk(const FamilyLine& family, const std::vector<StyledTap>& styled) {
        std::vector<int> places = {family.joint};
        for (const FamilyTap& tap : family.taps) places.push_back(tap.at);
        std::sort(places.begin(), places.end());
        const auto isStyledAlone = [&](int at) {
            return at != family.joint && std::count(places.begin(), places.end(), at) == 1 &&
                   std::any_of(styled.begin(), styled.end(),
                               [at](const StyledTap& child) { return child.tap.at == at; });
        };
        Span span{static_cast<double>(places.front()), static_cast<double>(places.back())};
        if (isStyledAlone(places.front())) span.first = places[1];
        if (isStyledAlone(places.back())) span.last = places[places.size() - 2];
        return span;
    }

    // A slanting segment would be neither; layouts have none, and such a one is left out of the crossings.
    void addOther(const LayoutSegment& s) {
        const LayoutSegment t = sideways() ? LayoutSegment{s.y1, s.x1, s.y2, s.x2} : s;
        if (t.y1 == t.y2) {
            const auto [from, to] = std::minmax(t.x1, t.x2);
            strokes_.along.push_back({static_cast<double>(from), static_cast<double>(to),
                                      static_cast<double>(t.y1), kNoFamily, LineStyle::plain});
        } else {
            strokes_.across.push_back(
                {static_cast<double>(t.x1), static_cast<double>(t.y1), static_cast<double>(t.y2), kNoFamily});
        }
    }

    const DrawingContent& content_;
    const DrawingOptions& options_;
    Strokes strokes_;
};

// Writes strokes as path data, turned back to the page.
class StrokePen {
public:
    StrokePen(const DrawingOptions& options, const Frame& frame)
        : sideways_(options.direction == LineDirection::sideways), frame_(frame) {}

    std::string moveTo(double along, double across) const {
        return sideways_ ? "M" + px(frame_.x(across)) + " " + px(frame_.y(along))
                         : "M" + px(frame_.x(along)) + " " + px(frame_.y(across));
    }
    std::string alongTo(double along) const {
        return sideways_ ? "V" + px(frame_.y(along)) : "H" + px(frame_.x(along));
    }
    std::string acrossTo(double across) const {
        return sideways_ ? "H" + px(frame_.x(across)) : "V" + px(frame_.y(across));
    }

    void noteAreas(const Strokes& strokes, std::vector<PictureArea>& areas) const {
        for (const AlongStroke& s : strokes.along) areas.push_back(area(s.from, s.across, s.to, s.across));
        for (const AcrossStroke& s : strokes.across) areas.push_back(area(s.along, s.from, s.along, s.to));
        for (const ChildStroke& s : strokes.children) {
            areas.push_back(area(s.from, s.across, s.along, s.across));
            areas.push_back(area(s.along, s.across, s.along, s.end));
        }
    }

    PictureArea area(double along1, double across1, double along2, double across2) const {
        const auto [firstAlong, lastAlong] = std::minmax(along1, along2);
        const auto [firstAcross, lastAcross] = std::minmax(across1, across2);
        const double x = sideways_ ? firstAcross : firstAlong;
        const double y = sideways_ ? firstAlong : firstAcross;
        const double width = sideways_ ? lastAcross - firstAcross : lastAlong - firstAlong;
        const double height = sideways_ ? lastAlong - firstAlong : lastAcross - firstAcross;
        return {frame_.x(x), frame_.y(y), width * Frame::kScale, height * Frame::kScale};
    }

private:
    bool sideways_;
    const Frame& frame_;
};

// The data of a path, with the bytes of each stroke: without some of them the rest is still a path.
struct PathData {
    std::string text;
    std::vector<PictureBox> strokes;

    void add(const std::string& stroke, const PictureArea& area) {
        strokes.push_back({area, text.size(), stroke.size()});
        text += stroke;
    }
};

bool crosses(const AcrossStroke& tap, const AlongStroke& trunk) {
    if (tap.family == trunk.family && tap.family != kNoFamily) return false;
    const auto [low, high] = std::minmax(tap.from, tap.to);
    return tap.along > trunk.from + kTouch && tap.along < trunk.to - kTouch && trunk.across > low + kTouch &&
           trunk.across < high - kTouch;
}

// A short stroke of page colour for each crossing, along the stroke that passes.
PathData crossingGaps(const Strokes& strokes, const StrokePen& pen) {
    std::vector<const AcrossStroke*> taps;
    for (const AcrossStroke& tap : strokes.across) taps.push_back(&tap);
    std::stable_sort(taps.begin(), taps.end(),
                     [](const AcrossStroke* a, const AcrossStroke* b) { return a->along < b->along; });
    constexpr double kHalf = kGapLength / 2 / Frame::kScale;
    PathData path;
    for (const AlongStroke& trunk : strokes.along) {
        auto tap = std::lower_bound(taps.begin(), taps.end(), trunk.from,
                                    [](const AcrossStroke* a, double from) { return a->along < from; });
        for (; tap != taps.end() && (*tap)->along <= trunk.to; ++tap) {
            if (!crosses(**tap, trunk)) continue;
            const double at = (*tap)->along;
            path.add(pen.moveTo(at, trunk.across - kHalf) + pen.acrossTo(trunk.across + kHalf),
                     pen.area(at, trunk.across - kHalf, at, trunk.across + kHalf));
        }
    }
    return path;
}

PathData pathOfAlong(const Strokes& strokes, LineStyle style, const StrokePen& pen) {
    PathData path;
    for (const AlongStroke& stroke : strokes.along) {
        if (stroke.style != style) continue;
        path.add(pen.moveTo(stroke.from, stroke.across) + pen.alongTo(stroke.to),
                 pen.area(stroke.from, stroke.across, stroke.to, stroke.across));
    }
    return path;
}

PathData pathOfAcross(const Strokes& strokes, const StrokePen& pen) {
    PathData path;
    for (const AcrossStroke& stroke : strokes.across) {
        path.add(pen.moveTo(stroke.along, stroke.from) + pen.acrossTo(stroke.to),
                 pen.area(stroke.along, stroke.from, stroke.along, stroke.to));
    }
    return path;
}

PathData pathOfChildren(const Strokes& strokes, LineStyle style, const StrokePen& pen) {
    PathData path;
    for (const ChildStroke& stroke : strokes.children) {
        if (stroke.style != style) continue;
        path.add(
            pen.moveTo(stroke.from, stroke.across) + pen.alongTo(stroke.along) + pen.acrossTo(stroke.end),
            pen.area(stroke.from, stroke.across, stroke.along, stroke.end));
    }
    return path;
}

void appendPath(SvgPicture& picture, const PathData& path, const std::string& attributes) {
    if (path.text.empty()) return;
    picture.svg += "<path" + attributes + " d=\"";
    for (PictureBox stroke : path.strokes) {
        stroke.start += picture.svg.size();
        picture.strokes.push_back(stroke);
    }
    picture.svg += path.text + "\"/>\n";
}

std::string dashAttribute(LineStyle style) {
    return std::string(" stroke-dasharray=\"") + dashesOf(style) + "\"";
}

}  // namespace

const char* dashesOf(LineStyle style) {
    switch (style) {
        case LineStyle::divorced:
            return "7 5";
        case LineStyle::adopted:
            return "2 4";
        case LineStyle::foster:
            return "9 3 2 3";
        case LineStyle::plain:
            break;
    }
    return "";
}

LineStylesUsed appendLines(SvgPicture& picture, const DrawingContent& content, const DrawingOptions& options,
                           const Frame& frame) {
    const Strokes strokes = StrokeBuilder(content, options).build();
    const StrokePen pen(options, frame);
    std::string& svg = picture.svg;
    pen.noteAreas(strokes, picture.lines);
    const PathData divorced = pathOfAlong(strokes, LineStyle::divorced, pen);
    const PathData adopted = pathOfChildren(strokes, LineStyle::adopted, pen);
    const PathData foster = pathOfChildren(strokes, LineStyle::foster, pen);
    svg += "<g fill=\"none\" stroke=\"" + std::string(options.theme->line) + "\" stroke-width=\"" +
           px(kLineWidth) + "\" stroke-linejoin=\"round\">\n";
    appendPath(picture, pathOfAlong(strokes, LineStyle::plain, pen), " stroke-linecap=\"square\"");
    appendPath(picture, divorced, dashAttribute(LineStyle::divorced));
    appendPath(picture, crossingGaps(strokes, pen),
               " stroke=\"" + std::string(options.theme->page) + "\" stroke-width=\"" + px(kGapWidth) + "\"");
    appendPath(picture, pathOfAcross(strokes, pen), "");
    appendPath(picture, adopted, dashAttribute(LineStyle::adopted));
    appendPath(picture, foster, dashAttribute(LineStyle::foster));
    svg += "</g>\n";
    return {!divorced.text.empty(), !adopted.text.empty(), !foster.text.empty()};
}

}  // namespace olvane::draw
