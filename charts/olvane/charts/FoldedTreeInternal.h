// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/charts/SelectionInternal.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// The chart of chosen persons for paper of request.aspect: the tree of households, or where a folded one can be printed
// a tenth larger and more, the same persons with wide generations in two or three rows. No two lines cross; one link in
// twenty may be a mark instead of a line for it.
picture::Picture treeChartOnPaper(const kin::KinGraph& graph, const ChartRequest& request,
                                  const Selection& selection);

}  // namespace olvane::charts
