// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/PlanInternal.h>

namespace olvane::charts {

// The order of households in each row, for a tree that has both ancestors and the other children of ancestors, so
// that no two links of the tree cross.
//
// The siblings of an ancestor stand on the side away from its spouse, in the order of the data, and what hangs
// from them outside all that is nearer to the focus. Where both parents' ancestors are shown, there is no such
// place for what hangs between the two:
//
//         [GM]--[her brother]          his children would have to stand between father and mother
//          |          |
//     [father]--[mother]
//
// Such a sibling starts a tree of its own, beside everything else, and its link becomes a mark.
class Embedding {
public:
    explicit Embedding(Plan& plan) : plan_(plan) {}

    // The households of the tree of a root, so that those of one row come from left to right. Households that
    // are cut off have lost their treeParent afterwards: they are roots, with nothing but descendants.
    std::vector<Index> orderTree(Index root);

private:
    // The first rows that are closed on either side: nothing may stand there, or below.
    struct Limits {
        std::int32_t left;
        std::int32_t right;
    };

    enum class Step : std::uint8_t { around, leftOf, rightOf, household, subtree };
    struct Task {
        Step step;
        Index node;
        Limits limits;
    };

    void findLowestRows();
    void pushAround(Index node, Limits limits);
    void pushLeftOf(Index parents, Limits limits);
    void pushRightOf(Index parents, Limits limits);
    void splitSiblings(Index parents, Limits limits);
    void emitSubtree(Index root);
    void gatherAbove(Index node);
    Limits limitsOf(std::size_t place, Index node, Limits limits) const;

    Plan& plan_;
    std::vector<std::int32_t> lowestRow_;
    std::vector<Task> tasks_;
    std::vector<Index> above_, stack_, leftSiblings_, rightSiblings_, order_;
};

}  // namespace olvane::charts
