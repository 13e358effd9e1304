// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How high the rows of one part are, and the gaps between them, which need room for the tracks of their bars.

#include <olvane/charts/PartLayouterInternal.h>

#include <cmath>

namespace olvane::charts {

namespace {

constexpr double kLeastMargin = 5;  // between a row and the first track, where a gap stays as high as it was

}  // namespace

void PartLayouter::stackRows() {
    layout_.rowHeight.assign(at(layout_.rows.rowCount), 0);
    for (std::int32_t person = 0; person < layout_.part.personCount(); ++person) {
        double& height = layout_.rowHeight[at(layout_.rows.row[at(layout_.chains.chain[at(person)])])];
        height = std::max(height, boxes_.height(layout_.part, person));
    }
    layout_.gapTop.assign(at(layout_.rows.rowCount + 1), 0);
    double y = 0;
    for (std::int32_t gap = -1; gap < layout_.rows.rowCount; ++gap) {
        if (gap >= 0) {
            layout_.rowTop.push_back(y);
            y += layout_.rowHeight[at(gap)];
        }
        const std::int32_t tracks = layout_.lines.tracks[at(gap + 1)];
        const bool outside = gap < 0 || gap + 1 == layout_.rows.rowCount;
        const double used = tracks > 0 ? (tracks - 1) * tracks_.gap : 0;
        const double height = outside ? (tracks > 0 ? used + tracks_.margin : 0) : gapHeight(gap, used);
        layout_.gapTop[at(gap + 1)] = outside ? y + (gap < 0 ? 0 : tracks_.margin) : y + (height - used) / 2;
        y += height;
    }
    layout_.height = y;
    for (std::int32_t node = 0; node < layout_.rows.nodeCount(); ++node) {
        layout_.width = std::max(layout_.width, layout_.left[at(node)] + layout_.sizes.width[at(node)]);
    }
}

// As before where the tracks have room, if closer to the boxes; else in whole steps beyond the least.
double PartLayouter::gapHeight(std::int32_t gap, double used) const {
    const double before = heightBefore(gap);
    if (used + 2 * std::min(tracks_.margin, kLeastMargin) <= before) return before;
    const double least = boxes_.gapY;
    const double needed = used + 2 * tracks_.margin;
    return needed <= least ? least : least + std::ceil((needed - least) / tracks_.step) * tracks_.step;
}

// Of the gap below a row; less than 0 where there was none.
double PartLayouter::heightBefore(std::int32_t gap) const {
    if (at(gap) + 1 >= middleBefore_.size()) return -1;
    const double height = middleBefore_[at(gap) + 1] - middleBefore_[at(gap)] -
                          (layout_.rowHeight[at(gap)] + layout_.rowHeight[at(gap) + 1]) / 2;
    return height >= boxes_.gapY ? height : -1;  // not a number with a new row
}

}  // namespace olvane::charts
