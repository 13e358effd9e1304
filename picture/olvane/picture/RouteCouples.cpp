// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// From the parents to the first bar: from the foot of a lone parent, between two neighbours, over those who stand between
// two partners, or down from one row to another. Every try either finds all its places or leaves no lines.

#include <olvane/picture/RoutePlannerInternal.h>

#include <cmath>
#include <utility>

namespace olvane::picture {

namespace {

// In points.
constexpr double kLegPitch = 6;   // between the heights of lines that leave one side of a box
constexpr double kLegReach = 25;  // from a box to the farthest of those

}  // namespace

// Where a drop should stand between two boxes: over an only child if it can.
double RoutePlanner::wantedDrop(Index f, double lo, double hi, const Legs& legs) const {
    const auto stems = stemsOf(f);
    const bool canBeAbove = legs.none() && stems.size() == 1 && stems[0].x >= lo && stems[0].x <= hi;
    return canBeAbove ? stems[0].x : lo + (hi - lo) * legs.dropShare();
}

// From the parent's foot.
bool RoutePlanner::planLoneParent(FamilyNet& net, Index parent) {
    if (!hasChildren(net.family)) return true;
    const Rect& box = rows_.rect(parent);
    const std::size_t channel = rows_.row(parent) + 1;
    const double inset = std::min(kPortInset, (box.x2 - box.x1) / 2);
    const auto stems = stemsOf(net.family);
    const double middle = rows_.centre(parent);
    const bool overChild = stems.size() == 1 && std::abs(stems[0].x - middle) <= kPortPitch;
    const auto x = taken_.freePlace({channelLane(channel)}, box.x1 + inset, box.x2 - inset,
                                    overChild ? stems[0].x : middle, net.family);
    if (!x) return false;
    taken_.take(channelLane(channel), *x, net.family);
    const Index bar = addBar(net, channel, LineRole::bar);
    addVertical({net.family, kNone, LineRole::drop, *x, atRow(rows_.rowOf[at(parent)], box.y2), onBar(bar)});
    net.x = *x;
    return true;
}

bool RoutePlanner::planCouple(FamilyNet& net, Index a, Index b) {
    if (rows_.row(a) != rows_.row(b)) return planCoupleInTwoRows(net, a, b);
    if (rows_.block(a) == rows_.block(b)) return false;
    if (rows_.rect(a).x1 > rows_.rect(b).x1) std::swap(a, b);
    return areNeighbours(a, b) ? planNeighbours(net, a, b) : planOverRow(net, a, b);
}

// A height at which a line can leave both boxes, or the one.
std::optional<double> RoutePlanner::freeHeight(std::size_t r, std::size_t gap, const Rect& a, const Rect& b,
                                               double offset, Index f) const {
    const double top = std::max(a.y1, b.y1);
    const double bottom = std::min(a.y2, b.y2);
    const double inset = std::min(kPortInset, (bottom - top) / 2);
    return takenSides_.freePlace({sideLane(r, gap)}, top + inset, bottom - inset, (top + bottom) / 2 + offset,
                                 f);
}

// a stands left of b, nobody between.
bool RoutePlanner::planNeighbours(FamilyNet& net, Index a, Index b) {
    const std::size_t r = rows_.row(a);
    const std::size_t gap = rows_.block(b);
    const Rect& left = rows_.rect(a);
    const Rect& right = rows_.rect(b);
    const RowGap& space = row(r).gaps[gap];
    if (left.x2 < space.lo || right.x1 > space.hi) return false;  // behind somebody who overlaps them
    const auto y = freeHeight(r, gap, left, right, 0, net.family);
    if (!y) return false;
    const std::size_t channel = r + 1;
    std::optional<double> x;
    if (hasChildren(net.family)) {
        const double lo = left.x2 + kBoxRoom;
        const double hi = right.x1 - kBoxRoom;
        x = taken_.freePlace({rowLane(r), channelLane(channel)}, lo, hi,
                             wantedDrop(net.family, lo, hi, legs_[sideLane(r, gap)]), net.family,
                             legs_[sideLane(r, gap)].distance());
        if (!x && !planLoneParent(net, fewerFamilies(a, b))) return false;
    }
    takenSides_.take(sideLane(r, gap), *y, kNone);
    plan_.rowPieces.push_back({net.family, static_cast<Index>(r), *y, left.x2, right.x1});
    if (!x) return true;
    straighten(net.family, *x, channel);
    taken_.take(rowLane(r), *x, net.family);
    taken_.take(channelLane(channel), *x, net.family);
    const Index bar = addBar(net, channel, LineRole::bar);
    addVertical({net.family, kNone, LineRole::drop, *x, atRow(static_cast<Index>(r), *y), onBar(bar)});
    net.x = *x;
    return true;
}

// hasDrop: in the middle of the space, at half of the height; else above that, where it nests.
std::optional<BoxSide> RoutePlanner::freeSide(Index f, Index box, bool toTheRight, bool hasDrop) const {
    const std::size_t r = rows_.row(box);
    BoxSide side;
    side.gap = rows_.block(box) + (toTheRight ? 1 : 0);
    const RowGap& space = row(r).gaps[side.gap];
    const Rect& rect = rows_.rect(box);
    side.boxEdge = toTheRight ? rect.x2 : rect.x1;
    if (side.boxEdge != (toTheRight ? space.lo : space.hi)) return std::nullopt;
    const Legs& legs = legs_[sideLane(r, side.gap)];
    const auto used = static_cast<double>(toTheRight ? legs.leftUsed : legs.rightUsed);
    const auto count = static_cast<double>(toTheRight ? legs.left : legs.right);
    const double ofDrop = toTheRight ? legs.dropShare() : 1 - legs.dropShare();
    const double share = hasDrop ? ofDrop : std::max(1.0, count - used) / legs.slots();
    const double pitch = std::min(kLegPitch, ((rect.y2 - rect.y1) / 2 - kPortInset) / (count + 1));
    const double offset = hasDrop ? 0 : -pitch * (used + 1);
    const double reach = kBoxRoom + share * (std::min(space.hi - space.lo, kLegReach) - 2 * kBoxRoom);
    const double wanted = side.boxEdge + (toTheRight ? reach : -reach);
    const double distance = legs.distance();
    const double lo = space.lo + kBoxRoom;
    const double hi = space.hi - kBoxRoom;
    const auto x = hasDrop ? taken_.freePlace({rowLane(r), channelLane(r), channelLane(r + 1)}, lo, hi,
                                              wanted, f, distance)
                           : taken_.freePlace({rowLane(r), channelLane(r)}, lo, hi, wanted, f, distance);
    const auto y = freeHeight(r, side.gap, rect, rect, offset, f);
    if (!x || !y) return std::nullopt;
    side.x = *x;
    side.y = *y;
    return side;
}

void RoutePlanner::takeSide(Index f, std::size_t r, const BoxSide& side, bool hasDrop) {
    taken_.take(rowLane(r), side.x, f);
    taken_.take(channelLane(r), side.x, f);
    if (hasDrop) taken_.take(channelLane(r + 1), side.x, f);
    takenSides_.take(sideLane(r, side.gap), side.y, kNone);
    plan_.rowPieces.push_back(
        {f, static_cast<Index>(r), side.y, std::min(side.x, side.boxEdge), std::max(side.x, side.boxEdge)});
}

// From the bar above down to the side, and on to a bar below where the family has children.
void RoutePlanner::addSideVerticals(FamilyNet& net, Index barAbove, const BoxSide& side, std::size_t r,
                                    bool hasDrop) {
    addVertical({net.family, kNone, LineRole::marriage, side.x, onBar(barAbove),
                 atRow(static_cast<Index>(r), side.y)});
    if (!hasDrop) return;
    const Index bar = addBar(net, r + 1, LineRole::bar);
    addVertical(
        {net.family, kNone, LineRole::drop, side.x, atRow(static_cast<Index>(r), side.y), onBar(bar)});
    net.x = side.x;
}

// Somebody stands between: over them.
bool RoutePlanner::planOverRow(FamilyNet& net, Index a, Index b) {
    const std::size_t r = rows_.row(a);
    const bool dropAtB = fewerFamilies(a, b) == b;
    const bool drops = hasChildren(net.family);
    const auto sideA = freeSide(net.family, a, true, drops && !dropAtB);
    const auto sideB = freeSide(net.family, b, false, drops && dropAtB);
    if (!sideA || !sideB) return false;
    takeSide(net.family, r, *sideA, drops && !dropAtB);
    takeSide(net.family, r, *sideB, drops && dropAtB);
    Legs& legs = legs_[sideLane(r, (dropAtB ? sideA : sideB)->gap)];
    ++(dropAtB ? legs.leftUsed : legs.rightUsed);
    const Index bar = addBar(net, r, LineRole::marriage);
    net.x = dropAtB ? sideB->x : sideA->x;
    addSideVerticals(net, bar, dropAtB ? *sideA : *sideB, r, false);
    addSideVerticals(net, bar, dropAtB ? *sideB : *sideA, r, drops);
    return true;
}

// From the foot of the upper one down to beside the lower one.
bool RoutePlanner::planCoupleInTwoRows(FamilyNet& net, Index upper, Index lower) {
    if (rows_.row(upper) > rows_.row(lower)) std::swap(upper, lower);
    const std::size_t r = rows_.row(lower);
    const bool drops = hasChildren(net.family);
    const bool fromLeft = rows_.centre(upper) < rows_.centre(lower);
    auto side = freeSide(net.family, lower, !fromLeft, drops);
    if (!side) side = freeSide(net.family, lower, fromLeft, drops);
    if (!side) return false;
    const Rect& box = rows_.rect(upper);
    const std::size_t channel = rows_.row(upper) + 1;
    const double inset = std::min(kPortInset, (box.x2 - box.x1) / 2);
    const auto foot = taken_.freePlace({channelLane(channel)}, box.x1 + inset, box.x2 - inset,
                                       rows_.centre(upper), net.family);
    if (!foot) return false;
    taken_.take(channelLane(channel), *foot, net.family);
    takeSide(net.family, r, *side, drops);
    const Index bar = addBar(net, channel, LineRole::marriage);
    addVertical(
        {net.family, kNone, LineRole::marriage, *foot, atRow(rows_.rowOf[at(upper)], box.y2), onBar(bar)});
    net.x = *foot;
    if (!extendDown(net, r, side->x, LineRole::marriage)) {
        dropNet(net);
        return false;
    }
    addSideVerticals(net, net.bars.back(), *side, r, drops);
    return true;
}

}  // namespace olvane::picture
