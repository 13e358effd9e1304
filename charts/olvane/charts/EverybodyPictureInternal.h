// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/charts/EverybodyLayoutInternal.h>

namespace olvane::charts {

// What has been laid out, as a picture: a part beside the other, boxes in the order of the graph.
picture::Picture pictureOfParts(const kin::KinGraph& graph, const std::vector<PartLayout>& parts,
                                const BoxSizes& boxes, kin::Place focus);

}  // namespace olvane::charts
