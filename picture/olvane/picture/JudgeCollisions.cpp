// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What lies on one another: boxes, lines through boxes, and lines of two families that cross, run on one track or touch. One
// sweep finds everything that is close to one another: boxes, pieces of lines, and the strips between couples. Each pair
// is then looked at exactly. The same sweep joins the lines of a family to one another and to the boxes they reach.

#include <olvane/picture/PictureJudgeInternal.h>

#include <algorithm>

#include <olvane/kin/shared/Index.h>
#include <olvane/picture/RectSweepInternal.h>

namespace olvane::picture {

using kin::at;

namespace {

// In points.
constexpr double kInsideBox = 0.5;  // deeper than this, a line runs through
constexpr double kApart = 2;        // nearer than this, pieces are on one track, or touch
constexpr double kBeside = 2;       // longer than this, they run beside one another

// Grown by half of the distance that is looked for, so that pieces that near meet.
Rect rectOf(const Line& line) {
    const double margin = kApart / 2;
    return {std::min(line.x1, line.x2) - margin, std::min(line.y1, line.y2) - margin,
            std::max(line.x1, line.x2) + margin, std::max(line.y1, line.y2) + margin};
}

}  // namespace

// Boxes first, then lines, then strips.
void PictureJudge::sweep() {
    std::vector<Rect> rects;
    rects.reserve(picture_.boxes.size() + picture_.lines.size() + strips_.size());
    for (const Box& box : picture_.boxes) rects.push_back(rectOf(box, kJoinedDistance));
    for (const Line& line : picture_.lines) rects.push_back(rectOf(line));
    for (const CoupleStrip& strip : strips_) rects.push_back(strip.rect);
    RectSweep(rects).forEachPair(
        [this](std::size_t i, std::size_t j) { judgePair(std::min(i, j), std::max(i, j)); });
}

void PictureJudge::judgePair(std::size_t i, std::size_t j) {
    const std::size_t boxes = picture_.boxes.size();
    const std::size_t lines = picture_.lines.size();
    if (j < boxes) return judgeBoxes(static_cast<Index>(i), static_cast<Index>(j));
    if (j < boxes + lines) {
        if (i < boxes) return judgeBoxAndLine(static_cast<Index>(i), j - boxes);
        return judgeLines(i - boxes, j - boxes);
    }
    if (i < boxes) judgeStrip(static_cast<Index>(i), strips_[j - boxes - lines]);
}

void PictureJudge::judgeBoxes(Index i, Index j) {
    if (picture_.isRound()) return;
    const Rect a = rectOf(picture_.boxes[at(i)]);
    const Rect b = rectOf(picture_.boxes[at(j)]);
    if (a.x1 < b.x2 && b.x1 < a.x2 && a.y1 < b.y2 && b.y1 < a.y2) overlaps_.push_back(ordered(i, j));
}

void PictureJudge::judgeBoxAndLine(Index box, std::size_t line) {
    const Index family = familyOfLine_[line];
    if (family == kNone || picture_.isRound()) return;
    const Line& piece = picture_.lines[line];
    const std::size_t member = members_.placeOf(at(family), box);
    const Box& b = picture_.boxes[at(box)];
    if (member == members_.count()) {
        if (runsThrough(piece, rectOf(b, -kInsideBox))) hits_.emplace_back(family, box);
    } else if (runsThrough(piece, rectOf(b, kJoinedDistance))) {
        groups_.join(line, picture_.lines.size() + member);
    }
}

void PictureJudge::judgeLines(std::size_t i, std::size_t j) {
    const Index f = familyOfLine_[i];
    const Index g = familyOfLine_[j];
    if (f == kNone || g == kNone) return;
    const Line& a = picture_.lines[i];
    const Line& b = picture_.lines[j];
    if (f == g) {
        if (distance(a, b) <= kJoinedDistance) groups_.join(i, j);
        return;
    }
    if (crossInside(a, b)) crossings_.push_back(ordered(f, g));
    if (runBeside(a, b, kApart, kBeside)) tracks_.push_back(ordered(f, g));
    if (touchOutsideSharedBoxes(a, b, at(f), at(g))) touches_.push_back(ordered(f, g));
}

bool PictureJudge::touchOutsideSharedBoxes(const Line& a, const Line& b, std::size_t f, std::size_t g) const {
    const auto touches = [&](const Point& end, const Line& piece) {
        return distance(end, piece) < kApart && !inSharedBox(end, f, g);
    };
    return touches(startOf(a), b) || touches(endOf(a), b) || touches(startOf(b), a) || touches(endOf(b), a);
}

bool PictureJudge::inSharedBox(const Point& p, std::size_t f, std::size_t g) const {
    if (members_.of(f).size() > members_.of(g).size()) std::swap(f, g);
    for (const Index box : members_.of(f)) {
        if (boxHolds(picture_.boxes[at(box)], p, kJoinedDistance) && members_.has(g, box)) return true;
    }
    return false;
}

void PictureJudge::judgeStrip(Index box, CoupleStrip& strip) const {
    if (box == strip.one || box == strip.other) return;
    const Rect a = rectOf(picture_.boxes[at(box)]);
    const Rect& b = strip.rect;
    if (a.x1 < b.x2 && b.x1 < a.x2 && a.y1 < b.y2 && b.y1 < a.y2) strip.isFree = false;
}

}  // namespace olvane::picture
