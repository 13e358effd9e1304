// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <span>
#include <vector>

#include <olvane/charts/PlanInternal.h>

namespace olvane::charts {

// Places trees of households as narrow as subtrees allow that keep their shape, in linear time and without
// recursion.
//
// The rules are those of Reingold and Tilford (Tidier Drawings of Trees, 1981) with the even spacing of van der
// Ploeg (Drawing Non-layered Tidy Trees in Linear Time, 2014): a household stands over the middle of its
// children, no subtree is wider than it must be, and small subtrees between large ones are spread evenly.
// Contours are arrays instead of threads: a subtree takes over the array of its deepest child, and the rows of
// the others are written into it. Each row is so written once for each subtree that ends in it.
// Holds: made once for a plan; trees may be placed one after another.
class TidyTree {
public:
    // gap is the least distance between households of a row.
    TidyTree(Plan& plan, double gap);

    // nodes are a root and everybody under it (with `above`, everybody over it), parents first. Sets their x, the
    // root's to 0.
    void place(std::span<const Index> nodes, bool above);

private:
    // A piece of the right contour of the siblings so far that belongs to one of them.
    struct Owner {
        std::int32_t rows;
        std::int32_t child;
    };

    void gatherChildren(Index node);
    void measure(std::span<const Index> nodes);
    void joinChildren(Index node);
    double separate(std::size_t child, std::int32_t rows, double groupShift);
    void spreadEvenly();
    void setOverChildren(Index node);
    double* leftOf(Index node) { return left_.data() + base_[at(node)]; }
    double* rightOf(Index node) { return right_.data() + base_[at(node)]; }

    Plan& plan_;
    double gap_;
    bool above_ = false;
    std::vector<std::int32_t> rows_;    // of the subtree
    std::vector<std::uint32_t> base_;   // of its contour, the deepest row first
    std::vector<double> left_, right_;  // right ones have the gap in them
    std::vector<double> position_;      // in the frame of the subtree
    std::vector<double> frame_;         // of the subtree in that of its parent's

    // While one household's children are joined:
    std::vector<Index> children_;
    std::vector<double> shift_, acceleration_, change_;
    std::vector<Owner> owners_;
    Index deepest_ = kNone;  // whose contour is that of the siblings so far
    double deepestShift_ = 0;
};

}  // namespace olvane::charts
