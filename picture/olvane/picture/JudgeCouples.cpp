// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Couples: each pair of parents' boxes once, and the strip between the boxes of those that stand in one row or column. A
// couple stands side by side where nothing is in its strip; that is found together with what lies on one another.

#include <olvane/picture/PictureJudgeInternal.h>

#include <algorithm>
#include <cmath>

#include <olvane/kin/shared/Index.h>

namespace olvane::picture {

using kin::at;

namespace {

// In points.
constexpr double kSameRow = 1;
constexpr double kSideBySide = 1.5;  // of a box

}  // namespace

void PictureJudge::listCouples() {
    for (const Family& family : picture_.families) {
        if (family.parentCount != 2) continue;
        const auto parents = picture_.parents(family);
        if (parents[0] != parents[1]) couples_.push_back(ordered(parents[0], parents[1]));
    }
    keepEachOnce(couples_);
    if (picture_.isRound()) return;
    for (const auto& [one, other] : couples_) addStrip(one, other);
}

void PictureJudge::addStrip(Index one, Index other) {
    const Rect a = rectOf(picture_.boxes[at(one)]);
    const Rect b = rectOf(picture_.boxes[at(other)]);
    Rect strip{std::min(a.x2, b.x2), std::max(a.y1, b.y1), std::max(a.x1, b.x1), std::min(a.y2, b.y2)};
    if (std::abs(a.y1 - b.y1) < kSameRow) {
        const double width = ((a.x2 - a.x1) + (b.x2 - b.x1)) / 2;
        if (strip.x2 - strip.x1 >= kSideBySide * width) return;
        if (strip.x2 < strip.x1) std::swap(strip.x1, strip.x2);
    } else if (std::abs(a.x1 - b.x1) < kSameRow) {
        strip = {std::max(a.x1, b.x1), std::min(a.y2, b.y2), std::min(a.x2, b.x2), std::max(a.y1, b.y1)};
        const double height = ((a.y2 - a.y1) + (b.y2 - b.y1)) / 2;
        if (strip.y2 - strip.y1 >= kSideBySide * height) return;
        if (strip.y2 < strip.y1) std::swap(strip.y1, strip.y2);
    } else {
        return;
    }
    strips_.push_back({strip, one, other, true});
}

}  // namespace olvane::picture
