// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Composes a round chart: cells, what they say, and a legend of its lines of descent.

#include <olvane/draw/FanArtInternal.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <vector>

#include <olvane/draw/BoxArtInternal.h>
#include <olvane/draw/DescentColours.h>
#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/FanCell.h>
#include <olvane/draw/LineArtInternal.h>
#include <olvane/draw/MarkArtInternal.h>
#include <olvane/draw/PageArtInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::fitLine;
using picture::runsRightToLeft;
using picture::textWidth;

using picture::Index;

// All in px.
constexpr double kBorder = 1;
constexpr double kFocusBorder = 4;
constexpr int kLegendPitch = 22;
constexpr double kLegendSize = 11.5;

// Fills for lines of descent, dark text on light and light text on dark pages, all with a contrast of 4.5.
constexpr auto kLightFills =
    std::to_array<std::string_view>({"#dbe9f6", "#fde3c8", "#dcefd3", "#f6d9e0", "#e6def2", "#f4edc4",
                                     "#d3eeec", "#e9e4dd", "#bdd0ee", "#f8c6b0", "#c3dba2", "#dcbfe4"});
constexpr auto kDarkFills =
    std::to_array<std::string_view>({"#24405c", "#5a3d1f", "#2b4a26", "#5a2b3a", "#40325a", "#4d4719",
                                     "#1f4a48", "#453f37", "#1c3f80", "#702f22", "#44590f", "#63306f"});

static_assert(kLightFills.size() == DescentColours::kColours &&
              kDarkFills.size() == DescentColours::kColours);

bool isDark(std::string_view colour) {
    return colour.size() == 7 && colour[1] < '8';
}

class FanDrawer {
public:
    FanDrawer(const DrawingContent& content, const DrawingOptions& options)
        : content_(content), fan_(content.picture), options_(options), colours_(fan_) {}

    SvgPicture draw() {
        placeFrame();
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

    std::string_view fillOf(std::size_t i) const {
        const int colour = colours_.of(i);
        if (colour < 0) return coloursOf(i).fill;
        const auto place = static_cast<std::size_t>(colour);
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

    FanCell cellOf(std::size_t i) const {
        FanCell cell = FanCell::of(fan_, i, Frame::kScale);
        cell.middleX = middleX_;
        cell.middleY = middleY_;
        return cell;
    }

    void appendCell(std::size_t i, const std::vector<BoxMark>& marks) {
        const picture::Box& box = fan_.boxes[i];
        const FanCell cell = cellOf(i);
        const bool isFocus = fan_.focus == static_cast<Index>(i);
        const kin::PersonLabel label =
            box.kind == picture::BoxKind::person ? readableLabel(content_, box.id) : kin::PersonLabel();
        const std::size_t start = svg_.svg.size();
        put(svg_.svg, "<g role=\"img\"><title>", Escaped{titleOf(label, isFocus, marks)},
            "</title>\n<path d=\"", outlineOf(cell), "\" fill=\"", fillOf(i), "\" stroke=\"",
            isFocus ? theme().focus : coloursOf(i).border, "\" stroke-width=\"",
            number(isFocus ? kFocusBorder : kBorder), "\"/>\n");
        for (const PlacedFanLine& line : placedTextOf(cell, textOf(label, marks))) appendLine(line);
        svg_.svg += "</g>\n";
        const PictureArea area{frame_.x(box.x), frame_.y(box.y),
                               static_cast<double>(box.width) * Frame::kScale,
                               static_cast<double>(box.height) * Frame::kScale};
        svg_.boxes.push_back({area, start, svg_.svg.size() - start});
    }

    std::string titleOf(const kin::PersonLabel& label, bool isFocus,
                        const std::vector<BoxMark>& marks) const {
        std::string title = kin::fullName(label, options_.language);
        const std::string life = cleanText(kin::lifeWords(label));
        if (!life.empty()) put(title, ", ", life);
        if (isFocus) title += wordsOf(Phrase::focus, options_.language);
        for (const BoxMark& mark : marks) put(title, ". ", mark.title);
        return title;
    }

    // The facts are years, and behind them the signs of marks.
    FanText textOf(const kin::PersonLabel& label, const std::vector<BoxMark>& marks) const {
        FanText text;
        if (label.living) {
            text.given = kin::livingText(options_.language);
        } else {
            text.given = cleanText(label.given);
            text.surname = cleanText(label.surname);
            text.surnameFirst = label.surnameFirst;
            if (text.given.empty() && text.surname.empty()) text.given = kin::unnamedText(options_.language);
            for (const std::string& line : kin::lifeLines(label)) text.facts.push_back(cleanText(line));
        }
        std::string signs;
        for (const BoxMark& mark : marks) put(signs, (signs.empty() ? "" : " "), mark.text);
        if (!signs.empty()) text.facts.push_back(signs);
        return text;
    }

    void appendLine(const PlacedFanLine& line) {
        if (line.isName) {
            svg_.text.addName(line.size);
        } else {
            svg_.text.add(line.size);
        }
        put(svg_.svg, "<text x=\"", number(line.x), "\" y=\"", number(line.y), "\" dy=\"",
            number(line.size * kFanBaseline), "\" text-anchor=\"middle\"");
        if (line.turn != 0)
            put(svg_.svg, " transform=\"rotate(", number(line.turn), " ", number(line.x), " ", number(line.y),
                ")\"");
        put(svg_.svg, (line.isName ? " font-weight=\"bold\"" : ""), " font-size=\"", number(line.size),
            "\" fill=\"", theme().text, "\"", (runsRightToLeft(line.text) ? " direction=\"rtl\"" : ""), ">",
            Escaped{line.text}, "</text>\n");
    }

    void appendLinks() { appendLines(svg_, content_, options_, frame_); }

    // Whose line each colour is, and what the signs in cells mean.
    std::string legendText() {
        if (colours_.lines().empty() && sign_.empty()) return std::string();
        svg_.text.add(kLegendSize);
        std::string legend;
        put(legend, "<g>\n<title>", Escaped{wordsOf(Phrase::legend, options_.language)}, "</title>\n");
        const int top = svg_.height - kMargin + 12;
        double widest = 0;
        int y = top;
        for (std::size_t i = 0; i < colours_.lines().size() + (sign_.empty() ? 0 : 1); ++i) {
            std::string name;
            if (i < colours_.lines().size()) {
                const auto box = static_cast<std::size_t>(colours_.lines()[i]);
                put(legend, "<rect x=\"", whole(kMargin), "\" y=\"", whole(y),
                    "\" width=\"28\" height=\"14\" fill=\"", fillOf(box), "\" stroke=\"", theme().line,
                    "\"/>\n");
                name =
                    cleanText(kin::fullName(readableLabel(content_, fan_.boxes[box].id), options_.language));
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
    const DescentColours colours_;
    SvgPicture svg_;
    Frame frame_;
    double middleX_ = 0;
    double middleY_ = 0;
    std::string sign_;  // of a mark, for the legend
};

}  // namespace

SvgPicture drawFan(const DrawingContent& content, const DrawingOptions& options) {
    return FanDrawer(content, options).draw();
}

}  // namespace olvane::draw
