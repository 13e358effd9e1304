// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <vector>

#include <olvane/charts/PlanInternal.h>

namespace olvane::charts {

// Places a tree of households whose order in each row is given, so that the squares of the distances between the
// two ends of its links are as small as the gaps allow.
//
// Rows are placed in turn, each as well as its neighbours' present places allow. For one row that is isotonic
// regression, solved exactly by pooling adjacent violators (Barlow and others, 1972); since gaps bind only within
// a row, turns over all rows come ever closer to the best of all placements.
// Holds: the number of turns depends on the number of households alone. Time is linear.
class RowRelaxation {
public:
    // gap is the least distance between households of a row. With a share below 1 the tree is narrowed to that
    // part of the width it would take, as far as its widest row allows.
    RowRelaxation(Plan& plan, double gap, double share)
        : plan_(plan), gap_(gap), share_(share), toParent_(plan.households.size()) {}

    // Sets the x of the households of one tree; order has those of each row from left to right.
    void place(const std::vector<Index>& order);

private:
    // Which neighbours draw at a household.
    enum class Pull { fromAbove, fromBelow, fromBoth };

    // Households that have come to stand side by side.
    struct Block {
        double weighted;
        double weight;
        std::size_t count;
    };

    void sortIntoRows(const std::vector<Index>& order);
    void measureLinks();
    void placeRow(std::size_t row, Pull pull);
    Block blockOf(Index household, Pull pull) const;
    void addBlock(const Block& block);
    void placeBlocks(std::size_t row, double rowWidth);
    void setBounds();
    void snap();
    void straighten(std::size_t row, bool above);

    Plan& plan_;
    double gap_;
    double share_;
    double least_ = 0;  // where all rows start and end at most
    double most_ = 0;
    std::vector<Index> byRow_;  // households, row by row
    std::vector<std::size_t> rowStart_;
    std::vector<double> toParent_;  // by household: where it would stand, seen from its treeParent
    std::vector<Block> blocks_;
};

}  // namespace olvane::charts
