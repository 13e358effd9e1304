// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/charts/PlanInternal.h>

namespace olvane::charts {

// Whom the engine's family view shows of a family with these options, each once. Boxes for unknown parents are no
// persons. Sizes are of no effect.
std::vector<kin::Place> nearPersons(const kin::KinGraph& graph, kin::Place focus, LayoutOptions options);

}  // namespace olvane::charts
