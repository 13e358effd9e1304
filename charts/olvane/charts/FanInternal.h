// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/PlanInternal.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// A round chart before it is drawn: cells in rings around the focus, each on the side of the one that it was
// reached from.
//
// Holds: cells stand behind the one that they hang from; cell 0 is the middle. A cell of nobody keeps a place for
//        a partner who is not known or has a cell elsewhere. Everybody has one cell at most.
class Fan {
public:
    struct Cell {
        kin::Place person = kin::kNobody;
        std::int32_t ring = 0;
        Index parent = kNone;    // the cell that it hangs from
        kin::UnionPlace u = -1;  // over this union
        Index holder = kNone;    // the cell of the person whose union that is
        bool isPartner = false;  // as a partner; else as a parent or child of `holder`
        Index line = kNone;      // the cell of the line of descent that it belongs to
        double weight = 0;       // its share of the circle: the number of cells at its rim
        double from = 0;         // degrees
        double to = 0;
    };

    Fan(const kin::KinGraph& graph, const ChartRequest& request);

    const std::vector<Cell>& cells() const { return cells_; }
    // By person, kNone without one.
    Index cellOf(kin::Place person) const { return person == kin::kNobody ? kNone : cellOf_[at(person)]; }

private:
    void growAncestors();
    void growDescendants();
    void growBelow(Index cell);
    void addUnionsOf(Index cell, Index lead);
    Index add(const Cell& cell);
    void spreadHalves(double angle);
    void spreadByWeight(double angle);

    const kin::KinGraph& graph_;
    const ChartRequest& request_;
    std::vector<Cell> cells_;
    std::vector<Index> cellOf_;
    std::vector<bool> isBlood_;     // by person: the focus or a descendant
    std::vector<bool> isExpanded_;  // by union
};

// The fan as a picture. Radii, middle and cells are in it; families whose cells border on one another have no
// lines.
picture::Picture fanChart(const kin::KinGraph& graph, const ChartRequest& request);

}  // namespace olvane::charts
