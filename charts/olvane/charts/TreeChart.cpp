// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/TreeChartInternal.h>

#include <olvane/charts/GapTracksInternal.h>
#include <olvane/charts/PlanBuilderInternal.h>
#include <olvane/charts/PlanPictureInternal.h>
#include <olvane/charts/PlanPlacementInternal.h>

namespace olvane::charts {

namespace {

// A second line to parents may be longer by this factor than the way from one box to the next.
constexpr float kReachOfShortLinks = 4;

// Charts are narrowed to this part of the width that their lines would like best.
constexpr double kShareOfNear = 0.8;
constexpr double kShareOfCompact = 0.6;

double shareOf(const ChartRequest& request) {
    if (request.compact) return kShareOfCompact;
    return request.view == View::near ? kShareOfNear : 1;
}

}  // namespace

picture::Picture treeChart(const kin::KinGraph& graph, const ChartRequest& request,
                           const Selection& selection) {
    const PlanSizes sizes(request);
    Plan plan = PlanBuilder(graph, sizes, selection).build(request.focus);
    PlanPlacement(plan, sizes.gapX(), shareOf(request)).place();
    GapTracks gaps(plan);
    gaps.addShortLinks(static_cast<double>(kReachOfShortLinks * (sizes.usualWidth() + sizes.gapX())));
    gaps.assignTracks();
    return PlanPicture(graph, request, sizes, selection.shown, plan, gaps).make();
}

}  // namespace olvane::charts
