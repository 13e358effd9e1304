// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <utility>

#include <olvane/Export.h>
#include <olvane/graph/TreeLine.h>

// What a drawn line stands for. The base holds the course of the line; the kinds of edges say whom it joins.
// Nothing in the engine reads an edge back: edges are there for hosts that walk the finished graph.
class OLVANE_API TreeViewEdge {
public:
    explicit TreeViewEdge(const TreeLine& line) : line_(line) {}
    explicit TreeViewEdge(TreeLine&& line) : line_(std::move(line)) {}
    TreeViewEdge(const TreeViewEdge&) = default;
    TreeViewEdge& operator=(const TreeViewEdge&) = default;
    virtual ~TreeViewEdge();

    // A copy of the course, in points. May be empty.
    TreeLine line() const { return line_; }

private:
    TreeLine line_;
};
