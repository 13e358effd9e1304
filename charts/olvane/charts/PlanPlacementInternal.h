// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/charts/EmbeddingInternal.h>
#include <olvane/charts/PlanInternal.h>
#include <olvane/charts/RowRelaxationInternal.h>
#include <olvane/charts/TidyTreeInternal.h>

namespace olvane::charts {

// Gives every household of a plan its x: each tree for itself, then all trees side by side, that of the focus
// first. Trees that grow one way from their root are tidy trees; the others, and those to be narrowed, are relaxed
// row by row.
class PlanPlacement {
public:
    // gap is the least distance between households of a row; share is that of RowRelaxation.
    PlanPlacement(Plan& plan, double gap, double share);

    void place();

private:
    void gatherTree(Index root);
    void placeTree(Index root);
    void setBeside();

    Plan& plan_;
    double gap_;
    bool isNarrowed_;
    Embedding embedding_;
    TidyTree tidy_;
    RowRelaxation relaxation_;
    std::vector<Index> below_, above_;  // of the present tree, parents first; each begins with the root
    bool isMixed_ = false;
    std::int32_t firstRow_ = 0;
    std::vector<double> rowEnd_;  // by row: the right end of all trees so far
};

}  // namespace olvane::charts
