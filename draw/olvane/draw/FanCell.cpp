// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A straight line of text across a cell has to stay within the ring: at radius r its corners reach out to
// sqrt(r^2 + (width / 2)^2), and the sides of the cell close in towards the middle. Text along the radius has
// the depth of the ring.

#include <olvane/draw/FanCell.h>

#include <algorithm>
#include <utility>

#include <olvane/draw/FanTextsInternal.h>
#include <olvane/draw/SvgTextInternal.h>
#include <olvane/picture/shared/Circle.h>

namespace olvane::draw {

namespace {

using picture::CirclePoint;
using picture::onCircle;

// All in px.
constexpr double kPad = 4;
constexpr double kLeastAcross = 44;      // less room than this across a cell, and the name follows the radius
constexpr double kUsualTextHeight = 39;  // of two lines of a name and one of years

class OutlinePen {
public:
    explicit OutlinePen(const FanCell& cell) : cell_(cell) {}

    std::string draw() {
        const double span = cell_.to - cell_.from;
        if (span >= 360) {
            putRing(cell_.outer, true);
            if (cell_.inner > 0) putRing(cell_.inner, false);
            return std::move(path_);
        }
        putStart("M", cell_.from, cell_.outer);
        putArc(cell_.outer, span, cell_.to, true);
        if (cell_.inner > 0) {
            putStart("L", cell_.to, cell_.inner);
            putArc(cell_.inner, span, cell_.from, false);
        } else {
            put(path_, "L", number(cell_.middleX), " ", number(cell_.middleY));
        }
        path_ += 'Z';
        return std::move(path_);
    }

private:
    void putPoint(double degrees, double radius) {
        const CirclePoint p = onCircle(degrees, radius);
        put(path_, number(cell_.middleX + p.x), " ", number(cell_.middleY + p.y));
    }

    // begin is "M" or "L".
    void putStart(const char* begin, double degrees, double radius) {
        path_ += begin;
        putPoint(degrees, radius);
    }

    void putArc(double radius, double span, double end, bool clockwise) {
        put(path_, "A", number(radius), " ", number(radius), " 0 ", span > 180 ? "1 " : "0 ",
            clockwise ? "1 " : "0 ");
        putPoint(end, radius);
    }

    void putRing(double radius, bool clockwise) {
        putStart("M", 0, radius);
        putArc(radius, 180, 180, clockwise);
        putArc(radius, 180, 360, clockwise);
        path_ += 'Z';
    }

    const FanCell& cell_;
    std::string path_;
};

double slopeOf(double degrees) {
    return picture::sineOfDegrees(degrees) / picture::sineOfDegrees(degrees + 90);
}

class FanTextPlacer {
public:
    FanTextPlacer(const FanCell& cell, const FanText& text) : cell_(cell), text_(text) {}

    std::vector<PlacedFanLine> place() const {
        if (cell_.isCentre) return inCentre(fitFanText(text_, roomInCentre()));
        const double depth = cell_.outer - cell_.inner - 2 * kPad;
        const double broad = roomAcross().width(0, kUsualTextHeight);
        bool isAcross = broad >= depth;
        FanTextLines lines = linesOf(isAcross);
        if (broad >= std::min(depth, kLeastAcross) &&
            (lines.lines.empty() || lines.loss == picture::NameLoss::letters)) {
            FanTextLines others = linesOf(!isAcross);
            if (!others.lines.empty() && (lines.lines.empty() || others.loss < lines.loss)) {
                lines = std::move(others);
                isAcross = !isAcross;
            }
        }
        return isAcross ? across(lines) : along(lines);
    }

private:
    FanTextLines linesOf(bool isAcross) const {
        return fitFanText(text_, isAcross ? roomAcross() : roomAlong());
    }

    double radius() const { return (cell_.inner + cell_.outer) / 2; }
    double angle() const { return (cell_.from + cell_.to) / 2; }
    bool isBelow() const { return picture::sineOfDegrees(angle() + 90) < -1e-9; }

    FanTextRoom roomInCentre() const {
        FanTextRoom room = roomOf(FanTextRoom::Form::disc);
        room.height = 2 * room.outer;
        return room;
    }

    FanTextRoom roomAcross() const {
        FanTextRoom room = roomOf(FanTextRoom::Form::across);
        room.height = room.outer - room.inner;
        room.isReversed = isBelow();
        const double span = cell_.to - cell_.from;
        if (span < 170) room.slope = slopeOf(span / 2);
        return room;
    }

    // As high as the cell is broad at its inner end.
    FanTextRoom roomAlong() const {
        FanTextRoom room = roomOf(FanTextRoom::Form::along);
        room.height = 2 * room.inner * slopeOf(std::min(89.0, (cell_.to - cell_.from) / 2)) - 2;
        return room;
    }

    FanTextRoom roomOf(FanTextRoom::Form form) const {
        FanTextRoom room;
        room.form = form;
        room.inner = cell_.inner + kPad;
        room.middle = radius();
        room.outer = cell_.outer - kPad;
        return room;
    }

    std::vector<PlacedFanLine> inCentre(const FanTextLines& fitted) const {
        std::vector<PlacedFanLine> placed;
        for (const FanTextLine& line : fitted.lines)
            add(placed, line, cell_.middleX, cell_.middleY + line.offset, 0);
        return placed;
    }

    // One below the other as it is read; in the lower half of the circle that is from the inside out.
    std::vector<PlacedFanLine> across(const FanTextLines& fitted) const {
        std::vector<PlacedFanLine> placed;
        for (const FanTextLine& line : fitted.lines) {
            const double r = radius() + (isBelow() ? line.offset : -line.offset);
            const CirclePoint p = onCircle(angle(), r);
            add(placed, line, cell_.middleX + p.x, cell_.middleY + p.y, isBelow() ? angle() + 180 : angle());
        }
        return placed;
    }

    // Along the radius, read from the left.
    std::vector<PlacedFanLine> along(const FanTextLines& fitted) const {
        std::vector<PlacedFanLine> placed;
        const bool onTheRight = picture::sineOfDegrees(angle()) >= -1e-9;
        const CirclePoint p = onCircle(angle(), radius());
        for (const FanTextLine& line : fitted.lines) {
            const CirclePoint side = onCircle(angle() + (onTheRight ? 90 : -90), line.offset);
            add(placed, line, cell_.middleX + p.x + side.x, cell_.middleY + p.y + side.y,
                onTheRight ? angle() - 90 : angle() + 90);
        }
        return placed;
    }

    static void add(std::vector<PlacedFanLine>& placed, const FanTextLine& line, double x, double y,
                    double turn) {
        if (!line.text.empty()) placed.push_back({line.text, line.isName, line.size, x, y, turn});
    }

    const FanCell& cell_;
    const FanText& text_;
};

}  // namespace

FanCell FanCell::of(const picture::Picture& fan, std::size_t box, double scale) {
    const picture::Arc& arc = fan.arcs[box];
    const auto radius = [&](std::int32_t ring) {
        const auto r = static_cast<std::size_t>(std::max(0, ring));
        return r < fan.ringRadii.size() ? fan.ringRadii[r] * scale : 0;
    };
    return {arc.from, arc.to, radius(arc.ring), radius(arc.ring + 1), 0, 0, arc.ring == 0};
}

std::string outlineOf(const FanCell& cell) {
    return OutlinePen(cell).draw();
}

std::vector<PlacedFanLine> placedTextOf(const FanCell& cell, const FanText& text) {
    return FanTextPlacer(cell, text).place();
}

}  // namespace olvane::draw
