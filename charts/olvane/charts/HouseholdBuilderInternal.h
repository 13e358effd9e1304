// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <utility>
#include <vector>

#include <olvane/charts/PlanInternal.h>

namespace olvane::charts {

// Puts everybody who is joined to a person by couples into one row, and says how each couple is joined.
//
// The lead stands in the middle with half of the spouses on either side, in the order of the data; further
// spouses of a spouse follow outwards:
//
//     [S1]--[lead]--[S2]--[T]  [S3]        T is a spouse of S2
//               |              |
//               +--------------+           over the boxes, for S3
//
// So lines over the boxes run outwards only, and none encloses another one's end: they never cross.
// Holds: adds to the plan that it was made with, which outlives it. No step recurses.
class HouseholdBuilder {
public:
    HouseholdBuilder(const kin::KinGraph& graph, const PlanSizes& sizes, Plan& plan)
        : graph_(graph), sizes_(sizes), plan_(plan) {}

    // The household of a shown person without a box. beside, where it is somebody, is the spouse with whom the
    // lead has a child in the line: the two stand side by side, all other spouses of the lead on its other side.
    Index add(kin::Place lead, std::int32_t row, kin::Place beside = kin::kNobody);

private:
    // A partner as reached from another one: its place in the row is found from the inside outwards.
    struct Joined {
        kin::Place person;
        kin::Place from;
        kin::UnionPlace u;
    };

    void addAlone(kin::Place person);
    void gatherSpouses(kin::Place person, std::vector<Joined>& spouses);
    void followOutwards(std::vector<Joined>& spouses, bool leftwards, std::vector<Joined>& side);
    std::size_t splitSpouses(kin::Place lead, kin::Place beside);
    void placeBoxes(kin::Place lead);
    void joinCouples(const std::vector<Joined>& side);
    void chooseOverLines(const std::vector<Joined>& side);
    static void standAlone(PlannedFamily& family);
    void placeOverLine(PlannedFamily& family, Index from);
    void addFamiliesAlone(Index box);
    void placeDrops();
    void placeDropAlone(PlannedFamily& family, int count, int order) const;
    void commitFamilies(Index household);
    bool isJoinedBy(Index box, kin::UnionPlace u) const;
    float widthOf(Index box) const { return plan_.boxWidth[at(box)]; }

    const kin::KinGraph& graph_;
    const PlanSizes& sizes_;
    Plan& plan_;
    Index firstBox_ = 0;
    std::vector<Joined> leadSpouses_, spouses_, stack_, left_, right_;
    std::vector<kin::UnionPlace> joinedBy_;  // by box of the household: the couple that brought it in
    std::vector<PlannedFamily> families_;
    std::vector<int> counts_, dropped_;  // by box of the household
    std::vector<std::pair<Index, std::uint16_t>> covered_;
};

}  // namespace olvane::charts
