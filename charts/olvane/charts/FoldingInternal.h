// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/charts/Folding.h>

namespace olvane::charts {

// States in the picture which of the request's branches are folded, in the order of the request.
void addFolded(picture::Picture& picture, const kin::KinGraph& graph, const ChartRequest& request);

}  // namespace olvane::charts
