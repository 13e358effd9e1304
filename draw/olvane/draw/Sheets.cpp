// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws sheets. Each is a picture of its own that shows a window of the whole; a strip along the right and the lower
// edge comes again on the next sheet, and a dashed line with ticks shows where that one begins.

#include <olvane/draw/Sheets.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <optional>

#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/PicturePartInternal.h>
#include <olvane/draw/SheetMapInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/kin/shared/MergeSort.h>
#include <olvane/picture/TextFit.h>

namespace olvane::draw {

namespace {

using picture::cleanText;
using picture::cutText;
using picture::fitLine;
using picture::Font;
using picture::kFontFamilies;
using picture::textWidth;

constexpr double kPxOfMm = 96 / 25.4;
constexpr double kTick = 4 * kPxOfMm;
constexpr double kTriangle = 2 * kPxOfMm;
constexpr double kFootSize = 10;
constexpr double kMapAbove = 4;  // millimetres between a map and the picture below it
constexpr const char* kGrey = "#666666";

// One sheet with what stands on it, in px.
class SheetArtist {
public:
    SheetArtist(const SvgPicture& picture, const SheetPlan& plan, const std::string& title,
                kin::Language language)
        : picture_(picture),
          plan_(plan),
          title_(title),
          language_(language),
          width_(plan.paper.width * kPxOfMm),
          height_(plan.paper.height * kPxOfMm),
          margin_(plan.margin * kPxOfMm),
          strip_(plan.strip * kPxOfMm) {}

    SvgPicture draw(std::size_t number, const std::string& map) const {
        const SheetWindow& sheet = plan_.sheets[number];
        SvgPicture drawn;
        drawn.width = static_cast<int>(std::lround(width_));
        drawn.height = static_cast<int>(std::lround(height_));
        drawn.svg =
            "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<svg xmlns=\"http://www.w3.org/2000/svg\" width=\"" +
            px(plan_.paper.width) + "mm\" height=\"" + px(plan_.paper.height) + "mm\" viewBox=\"0 0 " +
            px(width_) + " " + px(height_) + "\">\n<title>" + escaped(cutText(title_)) +
            "</title>\n<rect width=\"100%\" height=\"100%\" fill=\"#ffffff\"/>\n";
        appendPicture(drawn.svg, shownBy(sheet));
        if (plan_.sheets.size() > 1) {
            appendSeams(drawn.svg, sheet);
            appendFoot(drawn.svg, number);
            appendNeighbours(drawn.svg, number);
        }
        drawn.svg += map + "</svg>\n";
        return drawn;
    }

private:
    // A picture on one sheet stands in the middle.
    PictureArea shownBy(const SheetWindow& sheet) const {
        PictureArea window = sheet.window;
        if (plan_.sheets.size() > 1) return window;
        window.x -= std::max(0.0, window.width - picture_.width) / 2;
        window.y -= std::max(0.0, window.height - picture_.height) / 2;
        return window;
    }

    // As a nested picture that shows a window of itself.
    void appendPicture(std::string& svg, const PictureArea& window) const {
        svg += "<svg x=\"" + px(margin_) + "\" y=\"" + px(margin_) + "\" width=\"" +
               px(width_ - 2 * margin_) + "\" height=\"" + px(height_ - 2 * margin_) + "\" viewBox=\"" +
               px(window.x) + " " + px(window.y) + " " + px(window.width) + " " + px(window.height) +
               "\" preserveAspectRatio=\"xMinYMin\">\n" + elementsWithin(picture_, window) + "</svg>\n";
    }

    static std::string line(double x1, double y1, double x2, double y2, bool dashed) {
        return "<path d=\"M" + px(x1) + " " + px(y1) + "L" + px(x2) + " " + px(y2) + "\"" +
               (dashed ? " stroke-dasharray=\"3 4\"" : "") + "/>\n";
    }

    // Ticks in the margin at both ends of a seam, and the seam itself, dashed.
    void appendSeam(std::string& svg, bool upright, double at) const {
        const double end = (upright ? height_ : width_) - margin_;
        const auto add = [&](double a, double b, bool dashed) {
            svg += upright ? line(at, a, at, b, dashed) : line(a, at, b, at, dashed);
        };
        add(margin_ - kTick, margin_, false);
        add(end, end + kTick, false);
        add(margin_, end, true);
    }

    // A seam lies in the middle of the strip that two windows share.
    void appendSeams(std::string& svg, const SheetWindow& sheet) const {
        const double half = strip_ / 2;
        const auto row = static_cast<std::size_t>(sheet.row);
        svg += std::string("<g fill=\"none\" stroke=\"") + kGrey + "\" stroke-width=\"0.6\">\n";
        if (sheet.column > 0) appendSeam(svg, true, margin_ + half);
        if (const auto next = startOfNext(sheet)) appendSeam(svg, true, margin_ + *next + half);
        if (sheet.row > 0) appendSeam(svg, false, margin_ + half);
        if (row + 1 < plan_.columnsOfRow.size()) appendSeam(svg, false, margin_ + startBelow(sheet) + half);
        svg += "</g>\n";
    }

    double onPaper(double length) const { return length * plan_.scale * kPxOfMm; }

    // Where the window of the next sheet of the row begins on this one.
    std::optional<double> startOfNext(const SheetWindow& sheet) const {
        if (sheet.column + 1 >= plan_.columnsOfRow[static_cast<std::size_t>(sheet.row)]) return std::nullopt;
        return onPaper(
            plan_.starts[static_cast<std::size_t>(sheet.row)][static_cast<std::size_t>(sheet.column) + 1] -
            sheet.window.x);
    }
    double startBelow(const SheetWindow& sheet) const {
        return onPaper(plan_.tops[static_cast<std::size_t>(sheet.row) + 1] - sheet.window.y);
    }

    void appendFoot(std::string& svg, std::size_t number) const {
        const SheetWindow& sheet = plan_.sheets[number];
        const std::string place = phraseWith(
            Phrase::sheet, language_,
            {std::to_string(number + 1), std::to_string(plan_.sheets.size()), std::to_string(sheet.row + 1),
             std::to_string(plan_.rows), std::to_string(sheet.column + 1),
             std::to_string(plan_.columnsOfRow[static_cast<std::size_t>(sheet.row)])});
        const Font font{kFootSize, false};
        const double room = width_ - 2 * margin_ - textWidth(place, font) - 3 * kFootSize;
        const std::string y = px(height_ - margin_ + kTick + kFootSize);
        svg += "<g font-family=\"" + std::string(kFontFamilies) + "\" font-size=\"" + px(kFootSize) +
               "\" fill=\"#444444\">\n<text x=\"" + px(margin_) + "\" y=\"" + y + "\">" +
               escaped(fitLine(cleanText(cutText(title_)), font, room)) + "</text>\n<text x=\"" +
               px(width_ - margin_) + "\" y=\"" + y + "\" text-anchor=\"end\">" + place + "</text>\n</g>\n";
    }

    enum class Side { left, right, top, bottom };

    // Whether the other sheet lies at that side of this one, and both show a piece of the same edge.
    static bool liesAt(Side side, const SheetWindow& sheet, const SheetWindow& other) {
        const bool across = other.window.x < sheet.window.x + sheet.window.width &&
                            other.window.x + other.window.width > sheet.window.x;
        switch (side) {
            case Side::left:
                return other.row == sheet.row && other.column + 1 == sheet.column;
            case Side::right:
                return other.row == sheet.row && other.column == sheet.column + 1;
            case Side::top:
                return other.row + 1 == sheet.row && across;
            case Side::bottom:
                break;
        }
        return other.row == sheet.row + 1 && across;
    }

    void appendNeighbours(std::string& svg, std::size_t number) const {
        svg += std::string("<g fill=\"") + kGrey + "\" font-family=\"" + std::string(kFontFamilies) +
               "\" font-size=\"" + px(kFootSize) + "\">\n";
        for (const Side side : {Side::left, Side::right, Side::top, Side::bottom})
            appendNeighbours(svg, number, side);
        svg += "</g>\n";
    }

    // The numbers of the sheets at a side, in the middle of that margin, and a triangle for each line that goes on.
    void appendNeighbours(std::string& svg, std::size_t number, Side side) const {
        const SheetWindow& sheet = plan_.sheets[number];
        std::string numbers;
        for (std::size_t i = 0; i < plan_.sheets.size(); ++i) {
            if (!liesAt(side, sheet, plan_.sheets[i])) continue;
            numbers += (numbers.empty() ? "" : ", ") + std::to_string(i + 1);
        }
        if (numbers.empty()) return;
        numbers = escaped(phraseWith(Phrase::toSheet, language_, {numbers}));
        const bool upright = side == Side::left || side == Side::right;
        const bool far = side == Side::right || side == Side::bottom;
        const double away = kTick + kFootSize;
        const double x = upright ? (far ? width_ - margin_ + away : margin_ - kTick) : width_ / 2;
        const double y = upright ? height_ / 2 : (far ? height_ - margin_ + away : margin_ - kTick);
        svg += "<text x=\"" + px(x) + "\" y=\"" + px(y) + "\" text-anchor=\"middle\"" +
               (upright ? " transform=\"rotate(-90 " + px(x) + " " + px(y) + ")\"" : std::string()) + ">" +
               numbers + "</text>\n";
        appendTriangles(svg, sheet.window, upright, far);
    }

    // Lines that go on less than a triangle apart have one.
    void appendTriangles(std::string& svg, const PictureArea& window, bool upright, bool far) const {
        const double edge =
            upright ? window.x + (far ? window.width : 0) : window.y + (far ? window.height : 0);
        std::vector<double> places;
        for (const PictureArea& stroke : picture_.lines) {
            const double from = upright ? stroke.x : stroke.y;
            const double length = upright ? stroke.width : stroke.height;
            const double place = upright ? stroke.y - window.y : stroke.x - window.x;
            if (from >= edge || from + length <= edge) continue;
            if (place < 0 || place > (upright ? window.height : window.width)) continue;
            places.push_back(margin_ + onPaper(place));
        }
        kin::mergeSort(places.begin(), places.end());
        double last = -2 * kTriangle;
        for (const double place : places) {
            if (place - last < kTriangle) continue;
            last = place;
            appendTriangle(svg, place, upright, far);
        }
    }

    void appendTriangle(std::string& svg, double place, bool upright, bool far) const {
        const double base = far ? (upright ? width_ : height_) - margin_ + 2 : margin_ - 2;
        const double out = far ? kTriangle : -kTriangle;
        const double half = kTriangle / 2;
        const auto at = [upright](double along, double across) {
            return upright ? px(across) + " " + px(along) : px(along) + " " + px(across);
        };
        svg += "<path d=\"M" + at(place - half, base) + "L" + at(place, base + out) + "L" +
               at(place + half, base) + "z\"/>\n";
    }

    const SvgPicture& picture_;
    const SheetPlan& plan_;
    const std::string& title_;
    kin::Language language_;
    double width_;
    double height_;
    double margin_;
    double strip_;
};

}  // namespace

SheetSubject subjectOf(const SvgPicture& picture) {
    SheetSubject subject;
    subject.width = picture.width;
    subject.height = picture.height;
    for (const PictureBox& box : picture.boxes) subject.boxes.push_back(box.area);
    subject.others = picture.lines;
    if (picture.legend.width > 0) subject.others.push_back(picture.legend);
    return subject;
}

SheetDrawing drawSheets(const SvgPicture& picture, const SheetRequest& request, const std::string& title,
                        kin::Language language) {
    const SheetSubject subject = subjectOf(picture);
    SheetDrawing drawing;
    drawing.plan = planSheets(subject, request);
    std::string map;
    if (drawing.plan.sheets.size() > 1) {
        std::optional<PictureArea> place = freePlaceOfMap(subject, drawing.plan);
        if (!place) {
            SheetRequest lower = request;
            lower.headRoom = mapAboveOf(drawing.plan).height + kMapAbove;
            drawing.plan = planSheets(subject, lower);
            place = mapAboveOf(drawing.plan);
        }
        appendSheetMap(map, subject, drawing.plan, *place, kPxOfMm, language);
    }
    const SheetArtist artist(picture, drawing.plan, title, language);
    for (std::size_t i = 0; i < drawing.plan.sheets.size(); ++i) {
        drawing.sheets.push_back(artist.draw(i, i == 0 ? map : std::string()));
        drawing.sheets.back().text = picture.text;
    }
    return drawing;
}

}  // namespace olvane::draw
