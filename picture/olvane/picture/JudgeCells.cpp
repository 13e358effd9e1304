// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Round charts, where a box is a piece of a ring. Cells overlap in one ring, and are joined where they border on one
// another in neighbouring ones.

#include <olvane/picture/PictureJudgeInternal.h>

#include <algorithm>
#include <cmath>
#include <map>

#include <olvane/kin/shared/Index.h>

namespace olvane::picture {

using kin::at;

namespace {

constexpr double kAngle = 1e-9;  // degrees; less than this is no overlap of cells

}  // namespace

// Cells of a round chart overlap in one ring, and join in neighbouring ones. What reaches over the top is
// listed a second time, a turn earlier.
void PictureJudge::judgeCells() {
    std::map<std::int32_t, std::vector<Cell>> rings;
    for (std::size_t i = 0; i < picture_.arcs.size(); ++i) {
        const Cell cell = cellOf(static_cast<Index>(i));
        std::vector<Cell>& ring = rings[picture_.arcs[i].ring];
        ring.push_back(cell);
        if (cell.to > 360) ring.push_back({cell.from - 360, cell.to - 360, cell.box});
    }
    for (auto& [ring, cells] : rings) judgeRing(cells);
    for (std::size_t f = 0; f < picture_.families.size(); ++f) joinCells(f);
}

void PictureJudge::judgeRing(std::vector<Cell>& cells) {
    std::sort(cells.begin(), cells.end(), [](const Cell& a, const Cell& b) {
        return std::pair(a.from, a.box) < std::pair(b.from, b.box);
    });
    for (std::size_t i = 0; i < cells.size(); ++i) {
        for (std::size_t j = i + 1; j < cells.size() && cells[j].from < cells[i].to - kAngle; ++j) {
            if (cells[i].box != cells[j].box) overlaps_.push_back(ordered(cells[i].box, cells[j].box));
        }
    }
}

// Each parent against each child and the other parent; two parents of one child are joined by it.
void PictureJudge::joinCells(std::size_t f) {
    const Family& family = picture_.families[f];
    const std::size_t first = picture_.lines.size();
    for (const Index parent : picture_.parents(family)) {
        for (const Index child : picture_.children(family)) {
            if (!cellsBorder(parent, child)) continue;
            groups_.join(first + members_.placeOf(f, parent), first + members_.placeOf(f, child));
        }
        for (const Line& line : picture_.linesOf(family)) {
            if (line.child == kNone || !cellsBorder(parent, line.child, 2)) continue;
            groups_.join(first + members_.placeOf(f, parent), first + members_.placeOf(f, line.child));
        }
        const Index other = picture_.parents(family).back();
        if (!cellsBorder(parent, other)) continue;
        groups_.join(first + members_.placeOf(f, parent), first + members_.placeOf(f, other));
    }
}

// The middle borders on every cell of the ring around it. Cells that are one ring farther apart are joined by
// a line across that ring.
bool PictureJudge::cellsBorder(Index a, Index b, int ringsApart) const {
    const std::int32_t ringA = picture_.arcs[at(a)].ring;
    const std::int32_t ringB = picture_.arcs[at(b)].ring;
    if (std::abs(ringA - ringB) != ringsApart) return false;
    if (ringA == 0 || ringB == 0) return true;
    const Cell one = cellOf(a);
    const Cell other = cellOf(b);
    for (const double turn : {-360.0, 0.0, 360.0}) {
        if (one.from < other.to + turn - kAngle && other.from + turn < one.to - kAngle) return true;
    }
    return false;
}

PictureJudge::Cell PictureJudge::cellOf(Index box) const {
    const Arc& arc = picture_.arcs[at(box)];
    const double turns = std::floor(arc.from / 360) * 360;
    return {arc.from - turns, arc.to - turns, box};
}

}  // namespace olvane::picture
