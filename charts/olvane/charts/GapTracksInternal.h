// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/PlanInternal.h>

namespace olvane::charts {

// Where the lines of families run between two rows of households that have their places.
//
// Seen from left to right by their drops, families have their children from left to right: no two links cross. So
// a bar that reaches leftwards lies above those of later families that it meets, one that reaches rightwards
// above those of earlier ones, and one with its drop between its children below both; then no lines cross:
//
//        | 1    | 2          1 reaches leftwards, 2 has its drop between its children
//    +---+      |
//    |    +-----+--+
//   [ ]  [ ]      [ ]
//
// Holds: rows are counted from firstRow(), the least row of a household.
class GapTracks {
public:
    explicit GapTracks(Plan& plan);

    // Draws links to parents that are not in the tree, where the child stands one row lower, not farther than
    // `reach`, and the line crosses none; the shortest first.
    void addShortLinks(double reach);

    // Gives each family's bar its track.
    void assignTracks();

    std::int32_t firstRow() const { return firstRow_; }
    // By row: bars below it, and lines over its boxes.
    const std::vector<std::int32_t>& bars() const { return bars_; }
    const std::vector<std::int32_t>& overLines() const { return overLines_; }

    static double dropOf(const Plan& plan, const PlannedFamily& family) {
        return plan.households[at(family.household)].x + family.dropX;
    }
    static double stemOf(const Plan& plan, const ChildLink& link) {
        const Index box = plan.boxOf[at(link.child)];
        return plan.households[at(plan.householdOf[at(box)])].x + plan.centreOf(box) + link.shift;
    }

private:
    // A family's drop and the stems of its children, in one gap.
    struct Span {
        Index family;
        double drop;
        double from;  // from > to without drawn children
        double to;
    };

    struct Candidate {
        double length;
        std::uint32_t link;
        Index family;
        std::uint32_t place;  // in its row's spans
    };

    std::size_t rowOf(const PlannedFamily& family) const {
        return at(plan_.households[at(family.household)].row - firstRow_);
    }
    void gatherSpans();
    void gatherCandidates(double reach, std::vector<Candidate>& candidates) const;
    bool canTake(const Candidate& candidate, double stem) const;
    void take(const Candidate& candidate);
    std::int8_t shiftFor(const Candidate& candidate) const;
    std::int32_t tracksOfRow(std::size_t row);
    std::int32_t setTracks(std::size_t row, bool fromRight);

    Plan& plan_;
    std::int32_t firstRow_ = 0;
    std::vector<std::size_t> start_;  // of each row's spans
    std::vector<Span> spans_;
    std::vector<std::uint8_t> topUsed_;  // by box, while short links are added: which stems meet its top
    std::vector<std::int32_t> bars_;
    std::vector<std::int32_t> overLines_;
};

}  // namespace olvane::charts
