// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <utility>

#include <olvane/Export.h>
#include <olvane/graph/TreeViewEdge.h>

class TreeViewPerson;
class TreeViewSpouseEdge;

// The edge from parents down to one child. Persons and the couple's edge are pointed to, not owned: an edge
// may exist only once no list of displayed relatives grows any more. Holds: exactly one of singleParent and
// parentsEdge is set.
class OLVANE_API TreeViewGenerationEdge : public TreeViewEdge {
public:
    TreeViewGenerationEdge(TreeLine line, TreeViewPerson* childPerson, TreeViewSpouseEdge* parents)
        : TreeViewEdge(std::move(line)), child(childPerson), singleParent(nullptr), parentsEdge(parents) {}
    TreeViewGenerationEdge(TreeLine line, TreeViewPerson* childPerson, TreeViewPerson* parent)
        : TreeViewEdge(std::move(line)), child(childPerson), singleParent(parent), parentsEdge(nullptr) {}
    ~TreeViewGenerationEdge() override;

    bool hasSingleParent() const { return parentsEdge == nullptr; }
    bool hasMultipleParents() const { return singleParent == nullptr; }

    TreeViewPerson* child;
    TreeViewPerson* singleParent;     // null when the child hangs from a couple
    TreeViewSpouseEdge* parentsEdge;  // null when the child has a single drawn parent
};
