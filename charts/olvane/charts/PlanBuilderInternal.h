// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <limits>
#include <vector>

#include <olvane/charts/HouseholdBuilderInternal.h>
#include <olvane/charts/SelectionInternal.h>

namespace olvane::charts {

// From shown persons to a plan: households, and the tree of links by which each was reached first.
//
// Breadth first, so that a person reached over several ways gets the place of the shortest one. First the
// ancestors of the focus, then everybody's children, and last those who were not reached, each as the start of a
// tree of its own. Rows are those of the links: a parent's household one row above the child's.
// Holds: every shown person is in the plan afterwards. The household of the focus is the first.
class PlanBuilder {
public:
    PlanBuilder(const kin::KinGraph& graph, const PlanSizes& sizes, const Selection& selection);

    Plan build(kin::Place focus);

private:
    void growUpFrom(Index household, bool fromEverybody);
    void growDownFrom(Index household);
    void growAll(Index first);
    void addLeftOver();
    void addParents(Index household, Index box, kin::UnionPlace u, bool joined);
    std::int8_t makeRoomFor(Index added, Index box);
    bool hasOverLine(Index box) const;
    std::uint32_t linkOf(Index family, kin::Place child) const;

    const kin::KinGraph& graph_;
    const Selection& selection_;
    Plan plan_;
    HouseholdBuilder builder_;
    Index aboveEnd_ = 0;
    Index firstParents_ = 0;  // of the household whose parents are being added
};

}  // namespace olvane::charts
