// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <memory>

#include <olvane/Export.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/charts/Charts.h>

namespace olvane::charts {

// What picture to make, of any view: chart.view says which.
struct ViewRequest {
    ChartRequest chart;
    bool unknownParents = true;  // family, pedigree: parents who are not known have boxes of their own
};

// The picture of any view, in one call. The engine's two views ask the source, all others the graph; both speak of
// the same persons, by the same ids.
//
// Fails: as chartOf, familyLayout and pedigreeLayout, and with whatever the source throws.
OLVANE_API picture::Picture pictureOf(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                                      const kin::KinGraph& graph, const ViewRequest& request);

}  // namespace olvane::charts
