// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <optional>
#include <span>
#include <vector>

#include <olvane/kin/shared/Index.h>
#include <olvane/picture/LaneOccupancyInternal.h>
#include <olvane/picture/RoutePlanInternal.h>

namespace olvane::picture {

using kin::at;

// All in points.
constexpr double kBoxRoom = 2.5;  // between a vertical and the box beside it
constexpr double kPortInset = 3;  // from a box's corner to the nearest place for a line
constexpr double kPortPitch = 8;  // between several stems of one child

inline VerticalEnd onBar(Index bar) {
    return {bar, kNone, 0};
}

inline VerticalEnd atRow(Index row, double y) {
    return {kNone, row, y};
}

// A child's end of the lines of a family.
struct Stem {
    Index family;
    Index child;
    double x;
};

// The lines that leave the boxes at both sides of a gap to lead over the row: the nearer the partner, the farther from
// the box and the lower they lie, so that they nest. Drops stand between those of both sides.
struct Legs {
    std::int32_t left = 0;  // of the box left of the gap
    std::int32_t right = 0;
    std::int32_t leftUsed = 0;
    std::int32_t rightUsed = 0;

    bool none() const { return left + right == 0; }
    double slots() const { return left + right + 2.0; }
    double dropShare() const { return (left + 1) / slots(); }
    // Where lines nest, every place is at its share of the gap.
    double distance() const { return none() ? LaneOccupancy::kWanted : LaneOccupancy::kLeast; }
};

// A family's lines while they are planned: its bars are one in each channel of a range.
struct FamilyNet {
    Index family = kNone;
    std::size_t firstChannel = 0;
    std::vector<Index> bars;  // of channel firstChannel and on
    double x = 0;             // where it came from last

    std::size_t lastChannel() const { return firstChannel + bars.size() - 1; }
    bool isEmpty() const { return bars.empty(); }
};

// A place beside a box from which a line leads up to the channel above, and down to the one below where asked for.
struct BoxSide {
    std::size_t gap = 0;
    double x = 0;
    double y = 0;
    double boxEdge = 0;
};

// Plans all families of a picture, one after the other, on shared lanes. Used for one plan() only.
class RoutePlanner {
public:
    RoutePlanner(const Picture& picture, const Rows& rows);

    RoutePlan plan();

private:
    // RoutePlan.cpp: the order of work, and what a family's lines are made of.
    void countFamilies();
    void listMarks();
    bool hasParentsMark(const Family& f, Index child) const;
    bool hasPartnersMark(Index a, Index b) const;
    bool standTogether(Index f) const;
    bool areNeighbours(Index a, Index b) const;
    void orderByDistance(std::vector<Index>& families) const;
    void countLegs(const std::vector<Index>& families);
    void planFamily(Index f);
    Index addBar(FamilyNet& net, std::size_t channel, LineRole role);
    void addVertical(const Vertical& vertical);
    void dropNet(FamilyNet& net);
    void addMark(MarkKind kind, Index a, Index b, Index c) { plan_.marks.push_back({{a, b, c}, 0, kind}); }

    // RouteStems.cpp: where children are reached, and from where.
    void placeStems();
    std::vector<Stem> allStems() const;
    double middleOfParents(const Family& f) const;
    void spreadStems(std::span<Stem> stems);
    void groupByFamily(std::vector<Stem> stems);
    std::span<const Stem> stemsOf(Index f) const;
    void straighten(Index f, double x, std::size_t channel);
    void planChildren(FamilyNet& net);
    void planStem(FamilyNet& net, const Stem& stem);
    void aimAt(FamilyNet& net, Index bar, double x) const;
    void markParents(Index f, Index child);

    // RouteCouples.cpp: from the parents to the first bar. False where there is no place.
    bool planLoneParent(FamilyNet& net, Index parent);
    bool planCouple(FamilyNet& net, Index a, Index b);
    bool planNeighbours(FamilyNet& net, Index a, Index b);
    bool planOverRow(FamilyNet& net, Index a, Index b);
    bool planCoupleInTwoRows(FamilyNet& net, Index upper, Index lower);
    double wantedDrop(Index f, double lo, double hi, const Legs& legs) const;
    std::optional<double> freeHeight(std::size_t r, std::size_t gap, const Rect& a, const Rect& b,
                                     double offset, Index f) const;
    std::optional<BoxSide> freeSide(Index f, Index box, bool toTheRight, bool hasDrop) const;
    void takeSide(Index f, std::size_t r, const BoxSide& side, bool hasDrop);
    void addSideVerticals(FamilyNet& net, Index barAbove, const BoxSide& side, std::size_t r, bool hasDrop);

    // RoutePassages.cpp: through rows.
    std::optional<double> freePassage(Index f, std::size_t r, double from, double to) const;
    void addPassage(FamilyNet& net, std::size_t r, double x, LineRole role, Index barAbove, Index barBelow);
    bool extendDown(FamilyNet& net, std::size_t channel, double x, LineRole role);
    bool extendUp(FamilyNet& net, std::size_t channel, double x);

    const Family& family(Index f) const { return picture_.families[at(f)]; }
    const Row& row(std::size_t r) const { return rows_.rows[r]; }
    bool hasChildren(Index f) const { return !stemsOf(f).empty(); }
    Index fewerFamilies(Index a, Index b) const { return parentOf_[at(a)] < parentOf_[at(b)] ? a : b; }
    // Lanes of taken_: the x of verticals in a channel and in a row; of takenSides_: heights in a gap of a row.
    std::size_t channelLane(std::size_t channel) const { return 2 * channel; }
    std::size_t rowLane(std::size_t row) const { return 2 * row + 1; }
    std::size_t sideLane(std::size_t r, std::size_t gap) const { return rows_.firstGap[r] + gap; }

    template <class Test>
    bool anyMarkOf(Index box, MarkKind kind, Test test) const {
        auto mark = std::lower_bound(marks_.begin(), marks_.end(), box,
                                     [](const Mark& a, Index b) { return a.boxes[0] < b; });
        for (; mark != marks_.end() && mark->boxes[0] == box; ++mark) {
            if (mark->kind == kind && test(*mark)) return true;
        }
        return false;
    }

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

}  // namespace olvane::picture
