// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The walks over the finished graph. The graph is a tree of values, every node in one list of one owner, so
// the walk over all of it needs no marks: there is no cycle, and no node is reached twice. The one thing it
// skips, by id, is a person's own entry among its siblings.

#include <olvane/family/TreeViewFamilyLayouter.h>

#include <olvane/family/FamilyTraversalInternal.h>
#include <olvane/layouter/AncestorStackingInternal.h>
#include <olvane/layouter/DirectLineInternal.h>

namespace SharedTreeViewer {

void TreeViewFamilyLayouter::graphIterator(const Visitor& visitor) {
    graphIteratorHelper(focusPerson, visitor);
}

void TreeViewFamilyLayouter::graphIteratorHelper(TreeViewPerson& person, const Visitor& visitor) {
    visitGraph(person, visitor);
}

std::vector<TreeViewPerson*> TreeViewFamilyLayouter::everyPerson() {
    std::vector<TreeViewPerson*> persons;
    persons.reserve(shownPersons.sizeAtMost());  // all but a few
    visitGraph(focusPerson, [&persons](TreeViewPerson& person) { persons.push_back(&person); });
    return persons;
}

void TreeViewFamilyLayouter::iterateDirectLineFromFocusPerson(const DirectLineVisitor& visitor) {
    directLineIteratorHelper(focusPerson, visitor);
}

void TreeViewFamilyLayouter::directLineIterator(TreeViewPerson& person, const DirectLineVisitor& visitor,
                                                bool hasNeighbours, const Iterator& neighbours) {
    visitor(person, hasNeighbours, neighbours);
    directLineIteratorHelper(person, visitor);
}

// A sibling receives the parents of the person beside it: they are its own parents too.
void TreeViewFamilyLayouter::directLineIteratorHelper(TreeViewPerson& person,
                                                      const DirectLineVisitor& visitor) {
    walkParentsAndChildrenOnDirectLine(*this, person, visitor);
    person.allSiblingsIterator(false, [&](TreeViewPerson& sibling) {
        if (sibling.personId == person.personId) return;
        directLineIterator(sibling, visitor, true, person.getParentIterator());
    });
}

void TreeViewFamilyLayouter::traverseTreeForStacking(int depth, TreeViewPerson& person) {
    stackPreferredAncestors(*dataAdapter, maxStackDepth, stackedPersons, depth, person);
}

}  // namespace SharedTreeViewer
