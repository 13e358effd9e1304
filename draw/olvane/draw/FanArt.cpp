// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A straight line of text across a cell has to stay within the ring: at radius r its corners reach out to
// sqrt(r^2 + (width / 2)^2), and the sides of the cell close in towards the middle. Text along the radius has
// the depth of the ring. Renderers differ in text on paths, and some have none, so no path is asked for.

#include <olvane/draw/FanArtInternal.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <vector>

#include <olvane/draw/BoxArtInternal.h>
#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/FanTextsInternal.h>
#include <olvane/draw/LineArtInternal.h>
#include <olvane/draw/MarkArtInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/kin/shared/MergeSort.h>
#include <olvane/picture/TextFit.h>
#include <olvane/picture/shared/Circle.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::fitLine;
using picture::runsRightToLeft;
using picture::textWidth;

using picture::Arc;
using picture::Index;

// All in px.
constexpr int kMargin = 28;
constexpr int kHeadlineHeight = 40;
constexpr double kPad = 4;
constexpr double kBorder = 1;
constexpr double kFocusBorder = 4;
constexpr double kLeastAcross = 44;      // less room than this across a cell, and the name follows the radius
constexpr double kUsualTextHeight = 39;  // of two lines of a name and one of years
constexpr int kLegendPitch = 22;
constexpr double kLegendSize = 11.5;

// Fills for lines of descent, dark text on light and light text on dark pages, all with a contrast of 4.5.
constexpr auto kLightFills =
    std::to_array<std::string_view>({"#dbe9f6", "#fde3c8", "#dcefd3", "#f6d9e0", "#e6def2", "#f4edc4",
                                     "#d3eeec", "#e9e4dd", "#bdd0ee", "#f8c6b0", "#c3dba2", "#dcbfe4"});
constexpr auto kDarkFills =
    std::to_array<std::string_view>({"#24405c", "#5a3d1f", "#2b4a26", "#5a2b3a", "#40325a", "#4d4719",
                                     "#1f4a48", "#453f37", "#1c3f80", "#702f22", "#44590f", "#63306f"});

// Enough colours take turns that the last line of descent, which may lie beside the first, has another one.
std::size_t coloursInTurn(std::size_t lines) {
    const std::size_t most = kLightFills.size();
    return lines > 1 && lines % most == 1 ? most - 1 : most;
}

bool isDark(std::string_view colour) {
    return colour.size() == 7 && colour[1] < '8';
}

class FanDrawer {
public:
    FanDrawer(const DrawingContent& content, const DrawingOptions& options)
        : content_(content), fan_(content.picture), options_(options) {}

    SvgPicture draw() {
        placeFrame();
        listLines();
        const auto marks = boxMarksOf(fan_, options_.language);
        for (const std::vector<BoxMark>& ofBox : marks) {
            if (sign_.empty() && !ofBox.empty()) sign_ = ofBox.front().text;
        }
        const std::string legend = legendText();
        openPage(svg_, options_);
        for (std::size_t i = 0; i < fan_.boxes.size(); ++i) appendCell(i, marks[i]);
        if (!fan_.lines.empty()) appendLinks();
        svg_.svg += legend;
        closePage(svg_);
        return std::move(svg_);
    }

private:
    const DrawingTheme& theme() const { return *options_.theme; }

    void placeFrame() {
        double left = fan_.boxes[0].x, top = fan_.boxes[0].y, right = left, bottom = top;
        for (const picture::Box& box : fan_.boxes) {
            left = std::min(left, box.x);
            top = std::min(top, box.y);
            right = std::max(right, box.x + static_cast<double>(box.width));
            bottom = std::max(bottom, box.y + static_cast<double>(box.height));
        }
        const int headline = options_.headline ? kHeadlineHeight : 0;
        frame_ = {left, top, kMargin, kMargin + headline};
        svg_.originX = frame_.x(0);
        svg_.originY = frame_.y(0);
        svg_.width = static_cast<int>(std::ceil(std::min(1e9, (right - left) * Frame::kScale))) + 2 * kMargin;
        svg_.height = static_cast<int>(std::ceil(std::min(1e9, (bottom - top) * Frame::kScale))) +
                      2 * kMargin + headline;
        middleX_ = frame_.x(fan_.middleX);
        middleY_ = frame_.y(fan_.middleY);
    }

    // The boxes at which lines of descent begin, in the order of the boxes.
    void listLines() {
        for (const Arc& arc : fan_.arcs) {
            if (arc.line != picture::kNone) lines_.push_back(arc.line);
        }
        kin::mergeSort(lines_.begin(), lines_.end());
        lines_.erase(std::unique(lines_.begin(), lines_.end()), lines_.end());
    }

    std::string_view fillOf(std::size_t i) const {
        const Index own = fan_.arcs[i].line;
        const Index line = own == picture::kNone ? static_cast<Index>(i) : own;
        const auto found = std::lower_bound(lines_.begin(), lines_.end(), line);
        if (found == lines_.end() || *found != line) return coloursOf(i).fill;
        const std::size_t place =
            static_cast<std::size_t>(found - lines_.begin()) % coloursInTurn(lines_.size());
        return isDark(theme().page) ? kDarkFills[place] : kLightFills[place];
    }

    const BoxColours& coloursOf(std::size_t i) const {
        switch (fan_.boxes[i].sex) {
            case kin::Sex::male:
                return theme().coloursOf(kin::Sex::male);
            case kin::Sex::female:
                return theme().coloursOf(kin::Sex::female);
            case kin::Sex::unknown:
                break;
        }
        return theme().coloursOf(kin::Sex::unknown);
    }

    double innerOf(std::size_t i) const { return radius(fan_.arcs[i].ring); }
    double outerOf(std::size_t i) const { return radius(fan_.arcs[i].ring + 1); }
    double radius(std::int32_t ring) const {
        const auto r = static_cast<std::size_t>(std::max(0, ring));
        return r < fan_.ringRadii.size() ? fan_.ringRadii[r] * Frame::kScale : 0;
    }

    void putPoint(std::string& d, double degrees, double r) const {
        const picture::CirclePoint p = picture::onCircle(degrees, r);
        put(d, number(middleX_ + p.x), " ", number(middleY_ + p.y));
    }

    // begin is "M" or "L".
    void putStart(std::string& d, const char* begin, double degrees, double r) const {
        d += begin;
        putPoint(d, degrees, r);
    }

    void putArc(std::string& d, double r, double span, double end, bool clockwise) const {
        put(d, "A", number(r), " ", number(r), " 0 ", span > 180 ? "1 " : "0 ", clockwise ? "1 " : "0 ");
        putPoint(d, end, r);
    }

    std::string shapeOf(std::size_t i) const {
        const Arc& arc = fan_.arcs[i];
        const double r0 = innerOf(i);
        const double r1 = outerOf(i);
        const double span = arc.to - arc.from;
        if (span >= 360) return ringShape(r0, r1);
        std::string d;
        putStart(d, "M", arc.from, r1);
        putArc(d, r1, span, arc.to, true);
        if (r0 > 0) {
            putStart(d, "L", arc.to, r0);
            putArc(d, r0, span, arc.from, false);
        } else {
            put(d, "L", number(middleX_), " ", number(middleY_));
        }
        return d + "Z";
    }

    std::string ringShape(double r0, double r1) const {
        std::string d;
        putRing(d, r1, true);
        if (r0 > 0) putRing(d, r0, false);
        return d;
    }

    void putRing(std::string& d, double r, bool clockwise) const {
        putStart(d, "M", 0, r);
        putArc(d, r, 180, 180, clockwise);
        putArc(d, r, 180, 360, clockwise);
        d += "Z";
    }

    void appendCell(std::size_t i, const std::vector<BoxMark>& marks) {
        const picture::Box& box = fan_.boxes[i];
        const bool isFocus = fan_.focus == static_cast<Index>(i);
        const kin::PersonLabel label =
            box.kind == picture::BoxKind::person ? readableLabel(content_, box.id) : kin::PersonLabel();
        const std::size_t start = svg_.svg.size();
        put(svg_.svg, "<g role=\"img\"><title>", Escaped{titleOf(label, isFocus, marks)},
            "</title>\n<path d=\"", shapeOf(i), "\" fill=\"", fillOf(i), "\" stroke=\"",
            isFocus ? theme().focus : coloursOf(i).border, "\" stroke-width=\"",
            number(isFocus ? kFocusBorder : kBorder), "\"/>\n");
        appendTexts(i, textOf(label, marks));
        svg_.svg += "</g>\n";
        const PictureArea area{frame_.x(box.x), frame_.y(box.y),
                               static_cast<double>(box.width) * Frame::kScale,
                               static_cast<double>(box.height) * Frame::kScale};
        svg_.boxes.push_back({area, start, svg_.svg.size() - start});
    }

    static std::string yearsOf(const kin::PersonLabel& label) {
        std::string years;
        if (label.living) return years;
        if (!label.birth.empty()) years = "* " + cleanText(label.birth);
        if (!label.death.empty())
            put(years, (years.empty() ? "" : "  "), ("\xE2\x80\xA0 " + cleanText(label.death)));
        return years;
    }

    std::string titleOf(const kin::PersonLabel& label, bool isFocus,
                        const std::vector<BoxMark>& marks) const {
        std::string title = fullNameIn(label, options_.language);
        const std::string years = yearsOf(label);
        if (!years.empty()) put(title, ", ", years);
        if (isFocus) title += wordsOf(Phrase::focus, options_.language);
        for (const BoxMark& mark : marks) put(title, ". ", mark.title);
        return title;
    }

    // The facts are years, and behind them the signs of marks.
    FanText textOf(const kin::PersonLabel& label, const std::vector<BoxMark>& marks) const {
        FanText text;
        if (label.living) {
            text.given = wordsOf(Phrase::living, options_.language);
        } else {
            text.given = cleanText(label.given);
            text.surname = cleanText(label.surname);
            text.surnameFirst = label.surnameFirst;
            if (text.given.empty() && text.surname.empty()) text.given = "?";
            if (!label.birth.empty()) text.facts.push_back("* " + cleanText(label.birth));
            if (!label.death.empty()) text.facts.push_back("\xE2\x80\xA0 " + cleanText(label.death));
        }
        std::string signs;
        for (const BoxMark& mark : marks) put(signs, (signs.empty() ? "" : " "), mark.text);
        if (!signs.empty()) text.facts.push_back(signs);
        return text;
    }

    // Across the cell where it is broader than deep, else along the radius; the other way where less is lost so.
    void appendTexts(std::size_t i, const FanText& text) {
        if (fan_.arcs[i].ring == 0) return appendMiddle(fitFanText(text, roomInMiddle(i)));
        const double depth = outerOf(i) - innerOf(i) - 2 * kPad;
        const double broad = roomOfAcross(i).width(0, kUsualTextHeight);
        bool isAcross = broad >= depth;
        const auto linesOf = [&](bool across) {
            return fitFanText(text, across ? roomOfAcross(i) : roomOfAlong(i));
        };
        FanTextLines lines = linesOf(isAcross);
        if (broad >= std::min(depth, kLeastAcross) &&
            (lines.lines.empty() || lines.loss == picture::NameLoss::letters)) {
            FanTextLines others = linesOf(!isAcross);
            if (!others.lines.empty() && (lines.lines.empty() || others.loss < lines.loss)) {
                lines = std::move(others);
                isAcross = !isAcross;
            }
        }
        if (isAcross) {
            appendAcross(i, lines);
        } else {
            appendAlong(i, lines);
        }
    }

    double middleOf(std::size_t i) const { return (innerOf(i) + outerOf(i)) / 2; }
    double angleOf(std::size_t i) const { return (fan_.arcs[i].from + fan_.arcs[i].to) / 2; }
    bool isBelow(std::size_t i) const { return picture::sineOfDegrees(angleOf(i) + 90) < -1e-9; }

    FanTextRoom roomInMiddle(std::size_t i) const {
        FanTextRoom room = roomOf(i, FanTextRoom::Form::disc);
        room.height = 2 * room.outer;
        return room;
    }

    FanTextRoom roomOfAcross(std::size_t i) const {
        FanTextRoom room = roomOf(i, FanTextRoom::Form::across);
        room.height = room.outer - room.inner;
        room.isReversed = isBelow(i);
        const double span = fan_.arcs[i].to - fan_.arcs[i].from;
        if (span < 170) room.slope = slopeOf(span / 2);
        return room;
    }

    // As high as the cell is broad at its inner end.
    FanTextRoom roomOfAlong(std::size_t i) const {
        FanTextRoom room = roomOf(i, FanTextRoom::Form::along);
        room.height = 2 * room.inner * slopeOf(std::min(89.0, (fan_.arcs[i].to - fan_.arcs[i].from) / 2)) - 2;
        return room;
    }

    FanTextRoom roomOf(std::size_t i, FanTextRoom::Form form) const {
        FanTextRoom room;
        room.form = form;
        room.inner = innerOf(i) + kPad;
        room.middle = middleOf(i);
        room.outer = outerOf(i) - kPad;
        return room;
    }

    static double slopeOf(double degrees) {
        return picture::sineOfDegrees(degrees) / picture::sineOfDegrees(degrees + 90);
    }

    void appendMiddle(const FanTextLines& text) {
        for (const FanTextLine& line : text.lines) appendLine(line, middleX_, middleY_ + line.offset, 0);
    }

    // One below the other as it is read; in the lower half of the circle that is from the inside out.
    void appendAcross(std::size_t i, const FanTextLines& text) {
        const double angle = angleOf(i);
        for (const FanTextLine& line : text.lines) {
            const double r = middleOf(i) + (isBelow(i) ? line.offset : -line.offset);
            const picture::CirclePoint p = picture::onCircle(angle, r);
            appendLine(line, middleX_ + p.x, middleY_ + p.y, isBelow(i) ? angle + 180 : angle);
        }
    }

    // Along the radius, read from the left.
    void appendAlong(std::size_t i, const FanTextLines& text) {
        const double angle = angleOf(i);
        const bool onTheRight = picture::sineOfDegrees(angle) >= -1e-9;
        const picture::CirclePoint p = picture::onCircle(angle, middleOf(i));
        for (const FanTextLine& line : text.lines) {
            const picture::CirclePoint side = picture::onCircle(angle + (onTheRight ? 90 : -90), line.offset);
            appendLine(line, middleX_ + p.x + side.x, middleY_ + p.y + side.y,
                       onTheRight ? angle - 90 : angle + 90);
        }
    }

    void appendLine(const FanTextLine& line, double x, double y, double turn) {
        if (line.text.empty()) return;
        if (line.isName) {
            svg_.text.addName(line.size);
        } else {
            svg_.text.add(line.size);
        }
        put(svg_.svg, "<text x=\"", number(x), "\" y=\"", number(y), "\" dy=\"", number(line.size * 0.36),
            "\" text-anchor=\"middle\"");
        if (turn != 0)
            put(svg_.svg, " transform=\"rotate(", number(turn), " ", number(x), " ", number(y), ")\"");
        put(svg_.svg, (line.isName ? " font-weight=\"bold\"" : ""), " font-size=\"", number(line.size),
            "\" fill=\"", theme().text, "\"", (runsRightToLeft(line.text) ? " direction=\"rtl\"" : ""), ">",
            Escaped{line.text}, "</text>\n");
    }

    void appendLinks() { appendLines(svg_, content_, options_, frame_); }

    // Whose line each colour is, and what the signs in cells mean.
    std::string legendText() {
        if (lines_.empty() && sign_.empty()) return std::string();
        svg_.text.add(kLegendSize);
        std::string legend;
        put(legend, "<g>\n<title>", Escaped{wordsOf(Phrase::legend, options_.language)}, "</title>\n");
        const int top = svg_.height - kMargin + 12;
        double widest = 0;
        int y = top;
        for (std::size_t i = 0; i < lines_.size() + (sign_.empty() ? 0 : 1); ++i) {
            std::string name;
            if (i < lines_.size()) {
                const auto box = static_cast<std::size_t>(lines_[i]);
                put(legend, "<rect x=\"", whole(kMargin), "\" y=\"", whole(y),
                    "\" width=\"28\" height=\"14\" fill=\"", fillOf(box), "\" stroke=\"", theme().line,
                    "\"/>\n");
                name = cleanText(fullNameIn(readableLabel(content_, fan_.boxes[box].id), options_.language));
            } else {
                put(legend, "<text x=\"", whole(kMargin + 14), "\" y=\"", whole(y + 11),
                    "\" text-anchor=\"middle\" font-size=\"", number(kLegendSize), "\" fill=\"", theme().text,
                    "\">", Escaped{sign_}, "</text>\n");
                name = wordsOf(Phrase::meansElsewhere, options_.language);
            }
            const std::string text = fitLine(name, {kLegendSize, false}, 300);
            widest = std::max(widest, textWidth(text, {kLegendSize, false}));
            put(legend, "<text x=\"", whole(kMargin + 38), "\" y=\"", whole(y + 11), "\" font-size=\"",
                number(kLegendSize), "\" fill=\"", theme().quietText, "\">", Escaped{text}, "</text>\n");
            y += kLegendPitch;
        }
        svg_.height += y - top + 12;
        svg_.width = std::max(svg_.width, static_cast<int>(widest) + 38 + 2 * kMargin);
        svg_.legend = {kMargin, static_cast<double>(top), widest + 38, static_cast<double>(y - top)};
        return legend + "</g>\n";
    }

    const DrawingContent& content_;
    const picture::Picture& fan_;
    const DrawingOptions& options_;
    SvgPicture svg_;
    Frame frame_;
    double middleX_ = 0;
    double middleY_ = 0;
    std::vector<Index> lines_;
    std::string sign_;  // of a mark, for the legend
};

}  // namespace

SvgPicture drawFan(const DrawingContent& content, const DrawingOptions& options) {
    return FanDrawer(content, options).draw();
}

}  // namespace olvane::draw
