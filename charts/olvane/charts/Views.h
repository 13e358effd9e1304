// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <memory>

#include <olvane/Export.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/charts/BoxForm.h>  // IWYU pragma: export
#include <olvane/charts/Charts.h>
#include <olvane/kin/Family.h>

namespace olvane::charts {

// What picture to make, of any view: chart.view says which.
struct ViewRequest {
    ChartRequest chart;
    bool unknownParents = true;  // family, pedigree: parents who are not known have boxes of their own
};

// The picture of any view, in one call. The engine's two views ask the source, all others the graph; both mean
// the same persons, by the same ids.
//
// Fails: as chartOf, familyLayout and pedigreeLayout, with std::invalid_argument for sizes that are not between 0 and
//        kLargestSize, and with whatever the source throws.
OLVANE_API picture::Picture pictureOf(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source,
                                      const kin::KinGraph& graph, const ViewRequest& request);

// The same of a family that is handed over as a table. focus and other, which only the kinship view asks for, are ids;
// those of the request are not read.
//
// Fails: std::out_of_range for a person who is not in the family; as above.
OLVANE_API picture::Picture pictureOf(const Family& family, std::int64_t focus, const ViewRequest& request,
                                      std::int64_t other = 0);

// The same of a host that answers the eight questions. It is asked as far as the view reaches and one generation more;
// hidden relatives beyond that are not counted, and none are in the family view and the pedigree, which have the
// engine's own flags. The request has no boxSizes, for nobody has a place in a graph.
//
// Fails: std::out_of_range where the other person is not connected with the focus; std::length_error for more than
//        a million persons; as familyAround, familyLayout and pedigreeLayout.
OLVANE_API picture::Picture pictureOfHost(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& host,
                                          std::int64_t focus, const ViewRequest& request,
                                          std::int64_t other = 0);

}  // namespace olvane::charts
