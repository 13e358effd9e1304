// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <vector>

#include <olvane/Export.h>
#include <olvane/charts/ViewRequest.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// A branch of a person is folded by leaving out everybody to whom only it leads. From the focus a chart goes up to
// parents, then down to children, then to partners, and a folded branch is a step that it does not take:
//
//   up      from the focus or an ancestor to the parents
//   down    from a person to the children of all their families
//   beside  from a person to partners; from the focus or an ancestor to siblings of both parents as well
//
// Somebody to whom another way leads stays, and so does everybody between an ancestor and the focus.

// Whether branches fold in a view: near, ancestors, descendants, hourglass, relatives.
OLVANE_API bool canFold(View view);

// How many persons the branches up, down and beside of a person have for themselves in the chart, the other branches
// being as the request says: that many are hidden by a branch that is folded, or would be. All 0 for somebody who is not
// shown and in a view whose branches do not fold.
//
// Fails: as chartOf, for the request.
OLVANE_API std::array<std::int32_t, 3> branchSizes(const kin::KinGraph& graph, const ChartRequest& request,
                                                   std::int64_t person);

// On which side of a box the branch stands.
OLVANE_API picture::Side sideOf(picture::Branch branch, const ChartRequest& request);

}  // namespace olvane::charts
