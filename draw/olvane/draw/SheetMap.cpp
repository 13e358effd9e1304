// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/draw/SheetMapInternal.h>

#include <algorithm>
#include <cmath>
#include <set>
#include <utility>
#include <vector>

#include <olvane/draw/DrawingWordsInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/TextMetrics.h>

namespace olvane::draw {

namespace {

// Millimetres.
constexpr double kWidest = 60;
constexpr double kNarrowest = 18;
constexpr double kHighest = 60;
constexpr double kStep = 5;
constexpr double kClear = 2;  // around the map
constexpr double kDot = 0.25;

// What the windows cover together, in units of the picture.
PictureArea coveredBy(const SheetPlan& plan) {
    double right = 0;
    double bottom = 0;
    double top = 0;
    for (const SheetWindow& sheet : plan.sheets) {
        right = std::max(right, sheet.window.x + sheet.window.width);
        bottom = std::max(bottom, sheet.window.y + sheet.window.height);
        top = std::min(top, sheet.window.y);
    }
    return {0, top, right, bottom - top};
}

PictureArea sizeOfMap(const SheetPlan& plan, double width) {
    const PictureArea all = coveredBy(plan);
    const double scale = std::min(width / all.width, kHighest / all.height);
    return {0, 0, all.width * scale, all.height * scale};
}

PictureArea onPaper(const PictureArea& area, const SheetPlan& plan) {
    const PictureArea& window = plan.sheets.front().window;
    return {plan.margin + (area.x - window.x) * plan.scale, plan.margin + (area.y - window.y) * plan.scale,
            area.width * plan.scale, area.height * plan.scale};
}

// Which squares of the first sheet, of kStep millimetres, have something in them.
class Occupied {
public:
    Occupied(const SheetSubject& subject, const SheetPlan& plan)
        : columns_(static_cast<std::size_t>(plan.paper.width / kStep) + 1),
          rows_(static_cast<std::size_t>(plan.paper.height / kStep) + 1),
          taken_(columns_ * rows_, 0) {
        for (const PictureArea& area : subject.boxes) take(onPaper(area, plan));
        for (const PictureArea& area : subject.others) take(onPaper(area, plan));
    }

    bool isFree(const PictureArea& area) const {
        bool free = true;
        forSquares(area, [&](std::size_t square) { free = free && taken_[square] == 0; });
        return free;
    }

private:
    template <class Visit>
    void forSquares(const PictureArea& area, const Visit& visit) const {
        const auto clamped = [](double at, std::size_t count) {
            return static_cast<std::size_t>(std::clamp(at / kStep, 0.0, static_cast<double>(count - 1)));
        };
        if (area.x + area.width < 0 || area.y + area.height < 0) return;
        if (area.x / kStep > static_cast<double>(columns_) || area.y / kStep > static_cast<double>(rows_))
            return;
        for (std::size_t y = clamped(area.y, rows_); y <= clamped(area.y + area.height, rows_); ++y) {
            for (std::size_t x = clamped(area.x, columns_); x <= clamped(area.x + area.width, columns_);
                 ++x) {
                visit(y * columns_ + x);
            }
        }
    }
    void take(const PictureArea& area) {
        forSquares(area, [this](std::size_t square) { taken_[square] = 1; });
    }

    std::size_t columns_;
    std::size_t rows_;
    std::vector<std::uint8_t> taken_;
};

PictureArea inPx(const PictureArea& area, double pxOfMm) {
    return {area.x * pxOfMm, area.y * pxOfMm, area.width * pxOfMm, area.height * pxOfMm};
}

std::string rectangle(const PictureArea& area, const char* attributes) {
    return "<rect x=\"" + px(area.x) + "\" y=\"" + px(area.y) + "\" width=\"" + px(area.width) +
           "\" height=\"" + px(area.height) + "\" " + attributes + "/>\n";
}

// Boxes that would lie on one another in so small a picture are drawn once.
void appendDots(std::string& svg, const SheetSubject& subject, const PictureArea& all, double scale,
                const PictureArea& place, double pxOfMm) {
    std::set<std::pair<long, long>> drawn;
    svg += "<path fill=\"#999999\" d=\"";
    for (const PictureArea& box : subject.boxes) {
        const double x = place.x + (box.x - all.x) * scale;
        const double y = place.y + (box.y - all.y) * scale;
        if (!drawn.insert({std::lround(x / kDot), std::lround(y / kDot)}).second) continue;
        const double width = std::max(box.width * scale, kDot) * pxOfMm;
        svg += "M" + px(x * pxOfMm) + " " + px(y * pxOfMm) + "h" + px(width) + "v" +
               px(std::max(box.height * scale, kDot) * pxOfMm) + "h" + px(-width) + "z";
    }
    svg += "\"/>\n";
}

}  // namespace

PictureArea mapAboveOf(const SheetPlan& plan) {
    PictureArea map = sizeOfMap(plan, std::min(kWidest, plan.roomWidth() / 2));
    map.x = plan.margin;
    map.y = plan.margin;
    return map;
}

// The largest map that has room; of its places the highest, and of those the one furthest left.
std::optional<PictureArea> freePlaceOfMap(const SheetSubject& subject, const SheetPlan& plan) {
    const Occupied occupied(subject, plan);
    for (double width = std::min(kWidest, plan.roomWidth() / 2); width >= kNarrowest; width *= 0.8) {
        PictureArea map = sizeOfMap(plan, width);
        for (map.y = plan.margin; map.y + map.height <= plan.paper.height - plan.margin; map.y += kStep) {
            for (map.x = plan.margin; map.x + map.width <= plan.paper.width - plan.margin; map.x += kStep) {
                const PictureArea clear{map.x - kClear, map.y - kClear, map.width + 2 * kClear,
                                        map.height + 2 * kClear};
                if (occupied.isFree(clear)) return map;
            }
        }
    }
    return std::nullopt;
}

void appendSheetMap(std::string& svg, const SheetSubject& subject, const SheetPlan& plan,
                    const PictureArea& place, double pxOfMm, kin::Language language) {
    const PictureArea all = coveredBy(plan);
    const double scale = place.width / all.width;
    svg += "<g><title>" + escaped(wordsOf(Phrase::mapOfSheets, language)) + "</title>\n";
    svg += rectangle(inPx(place, pxOfMm), "fill=\"#ffffff\" stroke=\"#444444\" stroke-width=\"0.8\"");
    appendDots(svg, subject, all, scale, place, pxOfMm);
    const double letters = std::clamp(place.width / std::max(plan.columns, plan.rows) / 2, 1.6, 6.0) * pxOfMm;
    for (std::size_t i = 0; i < plan.sheets.size(); ++i) {
        const PictureArea& window = plan.sheets[i].window;
        const PictureArea part =
            inPx({place.x + (window.x - all.x) * scale, place.y + (window.y - all.y) * scale,
                  window.width * scale, window.height * scale},
                 pxOfMm);
        svg += rectangle(
            part, i == 0 ? "fill=\"#1f6feb\" fill-opacity=\"0.15\" stroke=\"#444444\" stroke-width=\"0.6\""
                         : "fill=\"none\" stroke=\"#444444\" stroke-width=\"0.6\"");
        svg += "<text x=\"" + px(part.x + part.width / 2) + "\" y=\"" +
               px(part.y + part.height / 2 + letters / 3) + "\" text-anchor=\"middle\" font-family=\"" +
               std::string(picture::kFontFamilies) + "\" font-weight=\"bold\" font-size=\"" + px(letters) +
               "\" fill=\"#000000\">" + std::to_string(i + 1) + "</text>\n";
    }
    svg += "</g>\n";
}

}  // namespace olvane::draw
