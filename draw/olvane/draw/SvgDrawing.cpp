// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Composes a picture: page, headline, lines, boxes, legend.

#include <olvane/draw/SvgDrawing.h>

#include <algorithm>
#include <set>
#include <unordered_map>
#include <utility>
#include <vector>

#include <olvane/draw/BoxArtInternal.h>
#include <olvane/draw/BoxPartsInternal.h>
#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/FanArtInternal.h>
#include <olvane/draw/LegendInternal.h>
#include <olvane/draw/LineArtInternal.h>
#include <olvane/draw/PageArtInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/draw/WayArtInternal.h>

namespace olvane::draw {

namespace {

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
        const int ownWidth = wholePx((bounds.right - bounds.left) * Frame::kScale) + 2 * kMargin;
        const int width = std::max(ownWidth, headlineWidth(options_));
        frame_ = {bounds.left, bounds.top, kMargin + (width - ownWidth) / 2, kMargin + headline};
        picture_.originX = frame_.x(0);
        picture_.originY = frame_.y(0);
        picture_.width = width;
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
            frame.leastName = content_.photoOf ? 0 : options_.leastNameSize;
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
            appendPerson(frame);
        }
        picture_.boxes.push_back(
            {{frame.x, frame.y, frame.width, frame.height}, start, picture_.svg.size() - start});
    }

    void appendPerson(BoxFrame frame) {
        const kin::PersonLabel label = readableLabel(content_, frame.box->id);
        const bool mayHavePhoto = content_.photoOf && !label.living;
        const std::string photo = mayHavePhoto ? content_.photoOf(frame.box->id) : std::string();
        frame.photo = photo;
        appendPersonBox(picture_.svg, frame, label, theme());
    }

    std::string nameOfChild(const picture::Box& unknown) const {
        if (unknown.childOf == picture::kNone) return kin::fullName(kin::PersonLabel(), options_.language);
        const picture::Box& child = content_.picture.boxes[static_cast<std::size_t>(unknown.childOf)];
        return kin::fullName(
            child.kind == picture::BoxKind::person ? readableLabel(content_, child.id) : kin::PersonLabel(),
            options_.language);
    }

    void addAncestorFrame(std::vector<LegendRow>& rows) const {
        const picture::Picture& picture = content_.picture;
        const bool isDrawn = std::any_of(
            commonAncestors_.begin(), commonAncestors_.end(),
            [&picture](picture::Index place) { return place != picture.focus && place != picture.other; });
        if (!isDrawn) return;
        LegendRow& row = rows.emplace_back();
        row.text = wordsOf(Phrase::commonAncestor, options_.language);
        row.isFrame = true;
    }

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
        addAncestorFrame(rows);
        addSigns(rows);
        return rows;
    }

    // Lists only what is there.
    std::string legendFor(const LineStylesUsed& styles) {
        const Legend legend(legendRows(styles), options_);
        if (legend.isEmpty()) return std::string();
        picture_.text.add(kLegendLetters);
        picture_.legend = legend.placeIn(picture_, {content_.picture, plates_, frame_});
        return legend.svgIn(picture_.legend);
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

}  // namespace

std::string titleOf(std::string_view view, const DrawingContent& content, kin::Language language) {
    std::string title = viewTitle(view, language);
    const picture::Index focus = content.picture.focus;
    if (focus == picture::kNone) return title;
    const std::int64_t id = content.picture.boxes[static_cast<std::size_t>(focus)].id;
    return phraseWith(Phrase::viewOf, language, {title, kin::fullName(content.labelOf(id), language)});
}

SvgPicture drawSvg(const DrawingContent& content, const DrawingOptions& options) {
    if (content.picture.isRound()) return drawFan(content, options);
    return Composer(content, options).compose();
}

}  // namespace olvane::draw
