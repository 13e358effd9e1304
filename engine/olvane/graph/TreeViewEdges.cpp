// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The edges: small records that say whom a line joins. A couple's edge keeps its children's edges alive
// together with any other holder, and offers them as plain pointers through a view that is rebuilt at each
// start of a walk.

#include <olvane/graph/TreeViewEdge.h>
#include <olvane/graph/TreeViewGenerationEdge.h>
#include <olvane/graph/TreeViewPerson.h>
#include <olvane/graph/TreeViewSpouseEdge.h>

#include <cstddef>
#include <utility>

namespace {

constexpr std::size_t kUsualChildren = 4;  // of a couple

}  // namespace

TreeViewEdge::~TreeViewEdge() = default;

TreeViewGenerationEdge::~TreeViewGenerationEdge() = default;

TreeViewSpouseEdge::TreeViewSpouseEdge(TreeViewPerson* first, TreeViewPerson* second)
    : TreeViewSpouseEdge(TreeLine(), first, second) {}

TreeViewSpouseEdge::TreeViewSpouseEdge(TreeLine line, TreeViewPerson* first, TreeViewPerson* second)
    : TreeViewSpouseEdge(std::move(line), first, second, ChildEdges()) {}

TreeViewSpouseEdge::TreeViewSpouseEdge(TreeLine line, TreeViewPerson* first, TreeViewPerson* second,
                                       ChildEdges edges)
    : TreeViewEdge(std::move(line)), childEdges(std::move(edges)), person(first), spouse(second) {}

TreeViewSpouseEdge::~TreeViewSpouseEdge() = default;

void TreeViewSpouseEdge::addChildEdge(boost::shared_ptr<TreeViewGenerationEdge> edge) {
    reserveChildEdges(kUsualChildren);
    childEdges.push_back(std::move(edge));
}

void TreeViewSpouseEdge::insertChildEdge(const boost::shared_ptr<TreeViewGenerationEdge>& edge,
                                         ChildEdges::const_iterator) {
    addChildEdge(edge);
}

TreeViewSpouseEdge::ChildEdgeList::iterator TreeViewSpouseEdge::begin() {
    rebuildChildEdgeList();
    return childEdgeList.begin();
}

TreeViewSpouseEdge::ChildEdgeList::const_iterator TreeViewSpouseEdge::cbegin() const {
    rebuildChildEdgeList();
    return childEdgeList.cbegin();
}

void TreeViewSpouseEdge::rebuildChildEdgeList() const {
    childEdgeList.clear();
    for (const auto& edge : childEdges) childEdgeList.push_back(edge.get());
}

bool TreeViewSpouseEdge::isSpouseMale() const {
    return spouse->gender;
}
