// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Decides, family by family, what leads where. Stems take the middles of the children's upper edges first,
// since those are seen most; drops and lines between partners follow; what has to pass through rows comes
// last and takes what is left.

#include <olvane/picture/RoutePlanInternal.h>

#include <algorithm>
#include <cmath>
#include <optional>
#include <tuple>
#include <utility>

#include <olvane/kin/Index.h>
#include <olvane/kin/MergeSort.h>
#include <olvane/picture/LaneOccupancyInternal.h>

namespace olvane::picture {

namespace {

constexpr double kBoxRoom = 2.5;       // points between a vertical and the box beside it
constexpr double kPortInset = 3;       // from a box's corner to the nearest place for a line
constexpr double kPortPitch = 8;       // between several stems of one child
constexpr double kLegPitch = 6;        // between the heights of lines that leave one side of a box
constexpr double kLegReach = 25;       // from a box to the farthest of those
constexpr std::size_t kMostGaps = 64;  // looked at when something has to pass through a row

using kin::at;

VerticalEnd onBar(Index bar) {
    return {bar, kNone, 0};
}

VerticalEnd atRow(Index row, double y) {
    return {kNone, row, y};
}

struct Stem {
    Index family;
    Index child;
    double x;
};

class RoutePlanner {
public:
    RoutePlanner(const Picture& picture, const Rows& rows)
        : picture_(picture),
          rows_(rows),
          taken_(picture.members.size() * 3),
          takenSides_(picture.families.size()) {
        countFamilies();
        listMarks();
    }

    RoutePlan plan() {
        placeStems();
        const auto count = static_cast<Index>(picture_.families.size());
        std::vector<Index> together;
        std::vector<Index> apart;
        for (Index f = 0; f < count; ++f) (standTogether(f) ? together : apart).push_back(f);
        orderByDistance(apart);
        countLegs(apart);
        for (const Index f : together) planFamily(f);
        for (const Index f : apart) planFamily(f);
        return std::move(plan_);
    }

private:
    const Family& family(Index f) const { return picture_.families[at(f)]; }
    std::size_t channelLane(std::size_t channel) const { return 2 * channel; }
    std::size_t rowLane(std::size_t row) const { return 2 * row + 1; }
    const Row& row(std::size_t r) const { return rows_.rows[r]; }

    // How many families a box is a parent of: the one with fewer has the drop of a couple that stands apart.
    void countFamilies() {
        parentOf_.resize(picture_.boxes.size());
        for (const Family& f : picture_.families) {
            for (const Index parent : picture_.parents(f)) ++parentOf_[at(parent)];
        }
    }

    // What the picture has marks for already.
    void listMarks() {
        for (const Mark& mark : picture_.marks) {
            if (mark.kind != MarkKind::samePerson) marks_.push_back(mark);
        }
        kin::mergeSort(marks_.begin(), marks_.end(),
                       [](const Mark& a, const Mark& b) { return a.boxes[0] < b.boxes[0]; });
    }

    template <class Test>
    bool anyMarkOf(Index box, MarkKind kind, Test test) const {
        auto mark = std::lower_bound(marks_.begin(), marks_.end(), box,
                                     [](const Mark& a, Index b) { return a.boxes[0] < b; });
        for (; mark != marks_.end() && mark->boxes[0] == box; ++mark) {
            if (mark->kind == kind && test(*mark)) return true;
        }
        return false;
    }

    bool hasParentsMark(const Family& f, Index child) const {
        const auto parents = picture_.parents(f);
        const auto isParent = [&parents](Index box) {
            return box == kNone || std::find(parents.begin(), parents.end(), box) != parents.end();
        };
        return anyMarkOf(child, MarkKind::parentsElsewhere, [&](const Mark& mark) {
            return isParent(mark.boxes[1]) && isParent(mark.boxes[2]);
        });
    }

    bool hasPartnersMark(Index a, Index b) const {
        const auto names = [](Index other) {
            return [other](const Mark& mark) { return mark.boxes[1] == other; };
        };
        return anyMarkOf(a, MarkKind::partnersElsewhere, names(b)) ||
               anyMarkOf(b, MarkKind::partnersElsewhere, names(a));
    }

    // --- stems

    // Several stems of one child stand side by side, in the order of the parents.
    void placeStems() {
        std::vector<Stem> stems;
        for (std::size_t f = 0; f < picture_.families.size(); ++f) {
            for (const Index child : picture_.children(picture_.families[f])) {
                if (hasParentsMark(picture_.families[f], child)) continue;
                stems.push_back({static_cast<Index>(f), child, middleOfParents(picture_.families[f])});
            }
        }
        kin::mergeSort(stems.begin(), stems.end(), [](const Stem& a, const Stem& b) {
            return std::tuple(a.child, a.x, a.family) < std::tuple(b.child, b.x, b.family);
        });
        stems.erase(std::unique(stems.begin(), stems.end(),
                                [](const Stem& a, const Stem& b) {
                                    return a.child == b.child && a.family == b.family;
                                }),
                    stems.end());
        for (std::size_t i = 0, next = 0; i < stems.size(); i = next) {
            while (next < stems.size() && stems[next].child == stems[i].child) ++next;
            spreadStems(std::span(stems).subspan(i, next - i));
        }
        kin::mergeSort(stems.begin(), stems.end(), [](const Stem& a, const Stem& b) {
            return std::tuple(a.family, a.x, a.child) < std::tuple(b.family, b.x, b.child);
        });
        firstStem_.assign(picture_.families.size() + 1, 0);
        for (const Stem& stem : stems) ++firstStem_[at(stem.family) + 1];
        for (std::size_t f = 0; f < picture_.families.size(); ++f) firstStem_[f + 1] += firstStem_[f];
        stems_ = std::move(stems);
    }

    double middleOfParents(const Family& f) const {
        double sum = 0;
        for (const Index parent : picture_.parents(f)) sum += rows_.centre(parent);
        return f.parentCount == 0 ? 0 : sum / f.parentCount;
    }

    void spreadStems(std::span<Stem> stems) {
        const Rect& box = rows_.rect(stems[0].child);
        const auto count = static_cast<double>(stems.size());
        const double pitch = std::min(kPortPitch, (box.x2 - box.x1) / (count + 1));
        double x = rows_.centre(stems[0].child) - pitch * (count - 1) / 2;
        for (Stem& stem : stems) {
            stem.x = x;
            x += pitch;
            taken_.take(channelLane(rows_.row(stem.child)), stem.x, stem.family);
        }
    }

    std::span<const Stem> stemsOf(Index f) const {
        return {stems_.data() + firstStem_[at(f)], firstStem_[at(f) + 1] - firstStem_[at(f)]};
    }

    // --- order of work

    bool standTogether(Index f) const {
        if (family(f).parentCount < 2) return true;
        const auto parents = picture_.parents(family(f));
        return areNeighbours(parents[0], parents[1]);
    }

    bool areNeighbours(Index a, Index b) const {
        if (a == b || rows_.row(a) != rows_.row(b)) return a == b;
        return rows_.blockOf[at(a)] - rows_.blockOf[at(b)] == 1 ||
               rows_.blockOf[at(b)] - rows_.blockOf[at(a)] == 1;
    }

    // Nearer couples first, so that farther ones lead around them.
    void orderByDistance(std::vector<Index>& families) const {
        const auto distance = [this](Index f) {
            const auto parents = picture_.parents(family(f));
            return std::tuple(std::abs(rows_.rowOf[at(parents[0])] - rows_.rowOf[at(parents[1])]),
                              std::abs(rows_.centre(parents[0]) - rows_.centre(parents[1])), f);
        };
        kin::mergeSort(families.begin(), families.end(),
                       [&](Index a, Index b) { return distance(a) < distance(b); });
    }

    // The lines that leave the boxes at both sides of a gap to lead over the row: the nearer the partner, the
    // farther from the box and the lower they lie, so that they nest. Drops stand between those of both sides.
    struct Legs {
        std::int32_t left = 0;  // of the box left of the gap
        std::int32_t right = 0;
        std::int32_t leftUsed = 0;
        std::int32_t rightUsed = 0;

        bool none() const { return left + right == 0; }
        double slots() const { return left + right + 2.0; }
        double dropShare() const { return (left + 1) / slots(); }
    };

    // Where lines nest, every place is at its share of the gap.
    static double distanceIn(const Legs& legs) {
        return legs.none() ? LaneOccupancy::kWanted : LaneOccupancy::kLeast;
    }

    void countLegs(const std::vector<Index>& families) {
        legs_.resize(rows_.rows.empty() ? 0 : rows_.firstGap.back() + rows_.rows.back().gaps.size());
        for (const Index f : families) {
            const auto parents = picture_.parents(family(f));
            if (rows_.row(parents[0]) != rows_.row(parents[1])) continue;
            const Index leg = fewerFamilies(parents[0], parents[1]) == parents[0] ? parents[1] : parents[0];
            const Index other = leg == parents[0] ? parents[1] : parents[0];
            const bool toTheRight = rows_.centre(other) > rows_.centre(leg);
            Legs& legs = legs_[sideLane(rows_.row(leg), rows_.block(leg) + (toTheRight ? 1 : 0))];
            ++(toTheRight ? legs.left : legs.right);
        }
    }

    // --- one family

    // The family's net while it is planned: its bars are one in each channel of a range.
    struct Net {
        Index family = kNone;
        std::size_t firstChannel = 0;
        std::vector<Index> bars;  // of channel firstChannel and on
        double x = 0;             // where it came from last

        std::size_t lastChannel() const { return firstChannel + bars.size() - 1; }
        bool isEmpty() const { return bars.empty(); }
    };

    void planFamily(Index f) {
        const auto parents = picture_.parents(family(f));
        if (parents.empty()) return;
        Net net;
        net.family = f;
        const bool isCouple = parents.size() == 2 && parents[0] != parents[1];
        const bool isMarked = isCouple && hasPartnersMark(parents[0], parents[1]);
        const bool joined = !isCouple  ? planLoneParent(net, parents[0])
                            : isMarked ? false
                                       : planCouple(net, parents[0], parents[1]);
        if (!joined && isCouple) {
            if (!isMarked) addMark(MarkKind::partnersElsewhere, parents[0], parents[1], kNone);
            if (!planLoneParent(net, fewerFamilies(parents[0], parents[1]))) net.bars.clear();
        }
        planChildren(net);
    }

    Index fewerFamilies(Index a, Index b) const { return parentOf_[at(a)] < parentOf_[at(b)] ? a : b; }

    bool hasChildren(Index f) const { return !stemsOf(f).empty(); }

    Index addBar(Net& net, std::size_t channel, LineRole role) {
        Bar bar;
        bar.family = net.family;
        bar.channel = static_cast<Index>(channel);
        bar.role = role;
        const auto place = static_cast<Index>(plan_.bars.size());
        plan_.bars.push_back(bar);
        if (net.isEmpty()) net.firstChannel = channel;
        if (channel < net.firstChannel) {
            net.bars.insert(net.bars.begin(), place);
            net.firstChannel = channel;
        } else {
            net.bars.push_back(place);
        }
        return place;
    }

    void addVertical(const Vertical& vertical) {
        for (const VerticalEnd& end : {vertical.top, vertical.bottom}) {
            if (end.bar == kNone) continue;
            Bar& bar = plan_.bars[at(end.bar)];
            bar.lo = std::min(bar.lo, vertical.x);
            bar.hi = std::max(bar.hi, vertical.x);
        }
        plan_.verticals.push_back(vertical);
    }

    // Where a drop should stand between two boxes: over an only child if it can.
    double wantedDrop(Index f, double lo, double hi, const Legs& legs) const {
        const auto stems = stemsOf(f);
        const bool canBeAbove = legs.none() && stems.size() == 1 && stems[0].x >= lo && stems[0].x <= hi;
        return canBeAbove ? stems[0].x : lo + (hi - lo) * legs.dropShare();
    }

    // From the parent's foot.
    bool planLoneParent(Net& net, Index parent) {
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
        addVertical(
            {net.family, kNone, LineRole::drop, *x, atRow(rows_.rowOf[at(parent)], box.y2), onBar(bar)});
        net.x = *x;
        return true;
    }

    bool planCouple(Net& net, Index a, Index b) {
        if (rows_.row(a) != rows_.row(b)) return planCoupleInTwoRows(net, a, b);
        if (rows_.block(a) == rows_.block(b)) return false;
        if (rows_.rect(a).x1 > rows_.rect(b).x1) std::swap(a, b);
        return areNeighbours(a, b) ? planNeighbours(net, a, b) : planOverRow(net, a, b);
    }

    // The lane of the heights in a gap of a row.
    std::size_t sideLane(std::size_t r, std::size_t gap) const { return rows_.firstGap[r] + gap; }

    // A height at which a line can leave both boxes, or the one.
    std::optional<double> freeHeight(std::size_t r, std::size_t gap, const Rect& a, const Rect& b,
                                     double offset, Index f) const {
        const double top = std::max(a.y1, b.y1);
        const double bottom = std::min(a.y2, b.y2);
        const double inset = std::min(kPortInset, (bottom - top) / 2);
        return takenSides_.freePlace({sideLane(r, gap)}, top + inset, bottom - inset,
                                     (top + bottom) / 2 + offset, f);
    }

    // a stands left of b, nobody between.
    bool planNeighbours(Net& net, Index a, Index b) {
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
                                 distanceIn(legs_[sideLane(r, gap)]));
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

    // An only child who is nearly below the drop gets its stem right below: better off the middle of the box than
    // with a slight bend.
    void straighten(Index f, double x, std::size_t channel) {
        if (stemsOf(f).size() != 1) return;
        Stem& stem = stems_[firstStem_[at(f)]];
        const Rect& box = rows_.rect(stem.child);
        const bool isNear =
            std::abs(stem.x - x) <= kPortPitch && x > box.x1 + kPortInset && x < box.x2 - kPortInset;
        if (isNear && rows_.row(stem.child) == channel) stem.x = x;
    }

    // A place beside a box from which a line leads up to the channel above, and down to the one below where
    // asked for.
    struct Side {
        std::size_t gap = 0;
        double x = 0;
        double y = 0;
        double boxEdge = 0;
    };

    // hasDrop: in the middle of the space, at half of the height; else above that, where it nests.
    std::optional<Side> freeSide(Index f, Index box, bool toTheRight, bool hasDrop) const {
        const std::size_t r = rows_.row(box);
        Side side;
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
        const double distance = distanceIn(legs);
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

    void takeSide(Index f, std::size_t r, const Side& side, bool hasDrop) {
        taken_.take(rowLane(r), side.x, f);
        taken_.take(channelLane(r), side.x, f);
        if (hasDrop) taken_.take(channelLane(r + 1), side.x, f);
        takenSides_.take(sideLane(r, side.gap), side.y, kNone);
        plan_.rowPieces.push_back({f, static_cast<Index>(r), side.y, std::min(side.x, side.boxEdge),
                                   std::max(side.x, side.boxEdge)});
    }

    // From the bar above down to the side, and on to a bar below where the family has children.
    void addSideVerticals(Net& net, Index barAbove, const Side& side, std::size_t r, bool hasDrop) {
        addVertical({net.family, kNone, LineRole::marriage, side.x, onBar(barAbove),
                     atRow(static_cast<Index>(r), side.y)});
        if (!hasDrop) return;
        const Index bar = addBar(net, r + 1, LineRole::bar);
        addVertical(
            {net.family, kNone, LineRole::drop, side.x, atRow(static_cast<Index>(r), side.y), onBar(bar)});
        net.x = side.x;
    }

    // Somebody stands between: over them.
    bool planOverRow(Net& net, Index a, Index b) {
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
    bool planCoupleInTwoRows(Net& net, Index upper, Index lower) {
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
        addVertical({net.family, kNone, LineRole::marriage, *foot, atRow(rows_.rowOf[at(upper)], box.y2),
                     onBar(bar)});
        net.x = *foot;
        if (!extendDown(net, r, side->x, LineRole::marriage)) {
            dropNet(net);
            return false;
        }
        addSideVerticals(net, net.bars.back(), *side, r, drops);
        return true;
    }

    // Takes back what a family has drawn so far; the places stay taken.
    void dropNet(Net& net) {
        const auto isOurs = [&net](const auto& piece) { return piece.family == net.family; };
        while (!plan_.verticals.empty() && isOurs(plan_.verticals.back())) plan_.verticals.pop_back();
        while (!plan_.rowPieces.empty() && isOurs(plan_.rowPieces.back())) plan_.rowPieces.pop_back();
        while (!plan_.bars.empty() && isOurs(plan_.bars.back())) plan_.bars.pop_back();
        net.bars.clear();
    }

    // --- through rows

    // A free place in a row, such that the way from one x to the other is short.
    std::optional<double> freePassage(Index f, std::size_t r, double from, double to) const {
        const std::vector<RowGap>& gaps = row(r).gaps;
        std::optional<double> best;
        double bestLength = std::numeric_limits<double>::infinity();
        const auto look = [&](std::size_t gap, double wanted) {
            const auto x = taken_.freePlace({rowLane(r), channelLane(r), channelLane(r + 1)},
                                            gaps[gap].lo + kBoxRoom, gaps[gap].hi - kBoxRoom, wanted, f);
            if (!x) return false;
            const double length = std::abs(*x - from) + std::abs(*x - to);
            if (length < bestLength) {
                bestLength = length;
                best = x;
            }
            return true;
        };
        for (const double wanted : {to, from}) {
            const std::size_t middle = row(r).gapAt(wanted);
            bool found = false;
            for (std::size_t step = 0; step < kMostGaps && !found; ++step) {
                if (middle >= step) found = look(middle - step, wanted) || found;
                if (step > 0 && middle + step < gaps.size()) found = look(middle + step, wanted) || found;
            }
        }
        if (best) return best;
        // The outside of the row is wide: some place is free there.
        const std::size_t outside = to - gaps.front().hi < gaps.back().lo - to ? 0 : gaps.size() - 1;
        const double edge = outside == 0 ? gaps.front().hi - kBoxRoom : gaps.back().lo + kBoxRoom;
        look(outside, edge);
        return best;
    }

    void addPassage(Net& net, std::size_t r, double x, LineRole role, Index barAbove, Index barBelow) {
        taken_.take(rowLane(r), x, net.family);
        taken_.take(channelLane(r), x, net.family);
        taken_.take(channelLane(r + 1), x, net.family);
        addVertical({net.family, kNone, role, x, onBar(barAbove), onBar(barBelow)});
        net.x = x;
    }

    // Down to the channel, towards x. False where a row lets nothing pass.
    bool extendDown(Net& net, std::size_t channel, double x, LineRole role) {
        while (net.lastChannel() < channel) {
            const std::size_t r = net.lastChannel();
            const auto passage = freePassage(net.family, r, net.x, x);
            if (!passage) return false;
            const Index above = net.bars.back();
            const Index below = addBar(net, r + 1, role == LineRole::marriage ? role : LineRole::bar);
            addPassage(net, r, *passage, role, above, below);
        }
        return true;
    }

    bool extendUp(Net& net, std::size_t channel, double x) {
        while (net.firstChannel > channel) {
            const std::size_t r = net.firstChannel - 1;
            const auto passage = freePassage(net.family, r, net.x, x);
            if (!passage) return false;
            const Index below = net.bars.front();
            const Index above = addBar(net, r, LineRole::bar);
            addPassage(net, r, *passage, LineRole::drop, above, below);
        }
        return true;
    }

    // --- children

    // Nearest rows first, so that farther ones lead on from there.
    void planChildren(Net& net) {
        const auto all = stemsOf(net.family);
        std::vector<Stem> stems(all.begin(), all.end());
        if (stems.empty()) return;
        if (net.isEmpty()) {
            for (const Stem& stem : stems) markParents(net.family, stem.child);
            return;
        }
        const auto home = static_cast<Index>(net.lastChannel());
        const double start = net.x;
        const auto rowDistance = [&](const Stem& stem) {
            return std::tuple(std::abs(rows_.rowOf[at(stem.child)] - home), std::abs(stem.x - start),
                              stem.child);
        };
        kin::mergeSort(stems.begin(), stems.end(),
                       [&](const Stem& a, const Stem& b) { return rowDistance(a) < rowDistance(b); });
        for (const Stem& stem : stems) planStem(net, stem);
    }

    void planStem(Net& net, const Stem& stem) {
        const std::size_t channel = rows_.row(stem.child);
        if (channel > net.lastChannel()) aimAt(net, net.bars.back(), stem.x);
        if (channel < net.firstChannel) aimAt(net, net.bars.front(), stem.x);
        const bool reached = channel >= net.firstChannel ? extendDown(net, channel, stem.x, LineRole::drop)
                                                         : extendUp(net, channel, stem.x);
        if (!reached) return markParents(net.family, stem.child);
        addVertical({net.family, stem.child, LineRole::stem, stem.x,
                     onBar(net.bars[channel - net.firstChannel]),
                     atRow(rows_.rowOf[at(stem.child)], rows_.rect(stem.child).y1)});
    }

    // The place of a bar from which it is nearest to x.
    void aimAt(Net& net, Index bar, double x) const {
        const Bar& b = plan_.bars[at(bar)];
        if (b.lo <= b.hi) net.x = std::clamp(x, b.lo, b.hi);
    }

    void markParents(Index f, Index child) {
        const auto parents = picture_.parents(family(f));
        addMark(MarkKind::parentsElsewhere, child, parents[0], parents.size() > 1 ? parents[1] : kNone);
    }

    void addMark(MarkKind kind, Index a, Index b, Index c) { plan_.marks.push_back({{a, b, c}, 0, kind}); }

    const Picture& picture_;
    const Rows& rows_;
    LaneOccupancy taken_;
    LaneOccupancy takenSides_;
    std::vector<std::int32_t> parentOf_;
    std::vector<Stem> stems_;
    std::vector<std::size_t> firstStem_;
    std::vector<Legs> legs_;
    std::vector<Mark> marks_;  // by their first box
    RoutePlan plan_;
};

}  // namespace

RoutePlan planRoutes(const Picture& picture, const Rows& rows) {
    return RoutePlanner(picture, rows).plan();
}

}  // namespace olvane::picture
