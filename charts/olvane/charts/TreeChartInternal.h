// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/charts/SelectionInternal.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// The chart of chosen persons in rows by generation, as trees of households.
picture::Picture treeChart(const kin::KinGraph& graph, const ChartRequest& request,
                           const Selection& selection);

// The chart of everybody on the ways between two persons. The focus is related to request.to.
picture::Picture kinshipChart(const kin::KinGraph& graph, const ChartRequest& request);

}  // namespace olvane::charts
