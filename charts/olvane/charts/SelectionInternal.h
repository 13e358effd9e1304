// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/charts/PlanInternal.h>

namespace olvane::charts {

// Who is shown, and who of them is the focus or one of its ancestors.
//
// Holds: flags by person. Breadth first from the focus, so a limit of generations counts the shortest way. The
//        lists do not depend on where the data have a person.
struct Selection {
    std::vector<bool> shown;
    std::vector<kin::Place> persons;  // who is shown, in the order in which they were found
    std::vector<bool> isLine;
    std::vector<kin::Place> line;  // the focus, then its ancestors, the nearest first
};

// The shown persons of a view other than fan, kinship and everybody.
Selection selectPersons(const kin::KinGraph& graph, const ChartRequest& request);

// The same for persons who are chosen already; the focus is shown in any case.
Selection selectionOf(const kin::KinGraph& graph, kin::Place focus, const std::vector<kin::Place>& persons);

}  // namespace olvane::charts
