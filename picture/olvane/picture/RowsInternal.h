// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <limits>
#include <utility>
#include <vector>

#include <olvane/picture/LineRouter.h>
#include <olvane/picture/RectSweepInternal.h>

namespace olvane::picture {

// Turns places between the sheet and the frame of the router, in which children stand below their parents.
class RouteFrame {
public:
    explicit RouteFrame(Direction direction) : direction_(direction) {}

    Rect rectOf(const Box& box) const;
    // A place in the frame, on the sheet.
    std::pair<double, double> turned(double x, double y) const;
    // Moves a box of the sheet by so much along the direction.
    void moveAlong(Box& box, double distance) const;
    bool isSideways() const { return direction_ == Direction::left || direction_ == Direction::right; }

private:
    Direction direction_;
};

// A free place in a row, between two blocks of boxes or beside all of them.
struct RowGap {
    double lo = -std::numeric_limits<double>::infinity();
    double hi = std::numeric_limits<double>::infinity();
};

// Boxes whose heights overlap. blocks are runs of boxes that overlap in x as well, usually of one box each;
// gap i lies left of block i, and the last one right of all blocks.
struct Row {
    double top = 0;
    double bottom = 0;
    std::vector<RowGap> gaps;

    // The gap that holds x or is nearest to it.
    std::size_t gapAt(double x) const;
};

// The rows of a picture, from the parents' side on, in the frame of the router.
struct Rows {
    std::vector<Row> rows;
    std::vector<Rect> boxes;            // by place in the picture
    std::vector<Index> rowOf;           // by box
    std::vector<Index> blockOf;         // by box: its block in the row
    std::vector<std::size_t> firstGap;  // by row: number of gaps in the rows before

    std::size_t row(Index box) const {
        return static_cast<std::size_t>(rowOf[static_cast<std::size_t>(box)]);
    }
    std::size_t block(Index box) const {
        return static_cast<std::size_t>(blockOf[static_cast<std::size_t>(box)]);
    }
    const Rect& rect(Index box) const { return boxes[static_cast<std::size_t>(box)]; }
    double centre(Index box) const { return (rect(box).x1 + rect(box).x2) / 2; }
};

Rows rowsOf(const Picture& picture, const RouteFrame& frame);

}  // namespace olvane::picture
