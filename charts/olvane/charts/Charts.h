// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/charts/ViewRequest.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// The name of a view as options and pictures have it: "near", "descendants" and so on.
OLVANE_API const char* nameOf(View view);

// The chart of a family, as a picture: who is shown, where each box stands, how the lines run.
//
// Every person has one box. Where somebody would be reached again, a numbered mark leads to that box.
//
// Units: points. The least x and y of all boxes are 0; lines may reach beyond by what runs around boxes.
// Holds: the same graph and request give the same picture, byte for byte, on every machine.
// Fails: std::out_of_range for a focus (in the kinship view, another person) that the graph does not have;
//        std::invalid_argument for sizes that are not between 0 and kLargestSize, numbers of generations or ways that
//        are negative, an angle that is not finite, for boxSizes that are neither empty nor one for each
//        person, or given beside sizedBoxes, and for the views family and pedigree, which the engine makes.
OLVANE_API picture::Picture chartOf(const kin::KinGraph& graph, const ChartRequest& asked);

}  // namespace olvane::charts
