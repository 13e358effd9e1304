// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/shared/Mirror.h>

#include <algorithm>
#include <cstddef>
#include <utility>

#include <olvane/picture/Extent.h>

namespace olvane::picture {

namespace {

// The sum of the least and the greatest x: what x is in the mirror when taken from it.
double mirrorSumOf(const Picture& picture) {
    const Extent extent = extentOf(picture);
    return extent.left + extent.right;
}

// A level piece still runs from left to right where it did, and has its bridges in that order.
void mirrorLine(Picture& picture, Line& line, double sum) {
    line.x1 = sum - line.x1;
    line.x2 = sum - line.x2;
    if (line.y1 != line.y2) return;
    std::swap(line.x1, line.x2);
    const auto first = picture.bridges.begin() + static_cast<std::ptrdiff_t>(line.firstBridge);
    const auto end = first + line.bridgeCount;
    std::for_each(first, end, [sum](double& x) { x = sum - x; });
    std::reverse(first, end);
}

// Angles count from the top, so a mirror changes their sign. The middle is a whole circle.
void mirrorArcs(Picture& picture) {
    for (Arc& arc : picture.arcs) {
        if (arc.ring == 0) continue;
        const double from = arc.from;
        arc.from = -arc.to;
        arc.to = -from;
    }
}

}  // namespace

void mirror(Picture& picture) {
    if (picture.boxes.empty()) return;
    const double sum = mirrorSumOf(picture);
    for (Box& box : picture.boxes) box.x = sum - box.x - static_cast<double>(box.width);
    for (Line& line : picture.lines) mirrorLine(picture, line, sum);
    mirrorArcs(picture);
    picture.middleX = sum - picture.middleX;
    for (WayPiece& piece : picture.wayPieces) {
        piece.x1 = sum - piece.x1;
        piece.x2 = sum - piece.x2;
    }
    for (FoldedBranch& folded : picture.folded) {
        if (folded.side == Side::left) {
            folded.side = Side::right;
        } else if (folded.side == Side::right) {
            folded.side = Side::left;
        }
    }
}

}  // namespace olvane::picture
