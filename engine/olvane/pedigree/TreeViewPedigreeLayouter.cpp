// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of work of the pedigree view, its geometry and its walks. Ancestors come in depth first, a
// father's whole line before the mother's, each placed as it comes. Lines and flags follow when everybody is
// there; here the flags come last, since no line asks for what they load.

#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

#include <olvane/graph/PersonWalksInternal.h>
#include <olvane/graph/WholePointInternal.h>
#include <olvane/layouter/AncestorStackingInternal.h>
#include <olvane/layouter/DirectLineInternal.h>
#include <olvane/layouter/LineRecordInternal.h>

#include <cmath>
#include <cstdint>
#include <utility>

namespace SharedTreeViewer {

TreeViewPedigreeLayouter::TreeViewPedigreeLayouter(DataAdapter* data, int focusKey, int isMale,
                                                   OptionMap optionValues, const TreeSize& sizes,
                                                   int generations, int stackDepth)
    : TreeViewLayouter(data, focusKey, isMale, std::move(optionValues), sizes),
      maxGenerations(generations),
      maxStackDepth(stackDepth) {}

namespace {

// In the order of graphIterator.
void numberPersons(TreeViewPerson& person, LineRecord& record) {
    record.number(person);
    const auto goOn = [&record](TreeViewPerson& relative) { numberPersons(relative, record); };
    if (person.children.empty() && person.spouses.empty()) {  // as all ancestors
        for (TreeViewPerson& parent : person.parents) goOn(parent);
    } else {
        visitParentsSpousesAndChildren(person, goOn);
    }
}

}  // namespace

void TreeViewPedigreeLayouter::layoutForFocusNID() {
    shownPersons.clear();
    focusPerson.getNodeCenter() = TreePoint{treeSize.nodeWidth * 0.5f, 0.0f};
    admit(focusPerson.personId);
    addAndLayoutChildrenAndSpousesOfFocusPerson(focusPerson);
    addAndLayoutParentsOfPerson(focusPerson, 0, 0);
    if (lineRecord != nullptr) {
        lineRecord->reserve(shownPersons.sizeAtMost());
        numberPersons(focusPerson, *lineRecord);
    }
    addSpouseAndChildrenLinesForFocusPerson(focusPerson);
    addParentLinesForPerson(focusPerson);
    flagNonDisplayedRelationships(focusPerson);
}

float TreeViewPedigreeLayouter::heightForNodeCount(int count) const {
    if (count == 0) return 0.0f;
    const float nodes = static_cast<float>(count);
    const float gaps = static_cast<float>(static_cast<std::int64_t>(count) - 1);
    return nodes * treeSize.nodeHeight + gaps * treeSize.vertPadding;
}

// A column without slots starts at -0.0, as half of nothing above the middle.
TreePoint TreeViewPedigreeLayouter::getCenterPointForGeneration(int generation, int index) const {
    const int slots = olvane::wholePoint(std::ldexp(1.0, generation));
    const float top = heightForNodeCount(slots) * -0.5f;
    const float column = static_cast<float>(generation);
    const float slot = static_cast<float>(index);
    return TreePoint{
        treeSize.nodeWidth * 0.5f + column * treeSize.nodeWidth + column * treeSize.horzPadding,
        treeSize.nodeHeight * 0.5f + (slot * treeSize.nodeHeight + top) + slot * treeSize.vertPadding};
}

namespace {

// Slot numbers of deep columns go round as 32-bit numbers: a lone line of mothers can be any number of
// columns long.
int fatherSlot(int index) {
    return static_cast<int>(static_cast<std::uint32_t>(index) * 2u);
}

int motherSlot(int index) {
    return static_cast<int>(static_cast<std::uint32_t>(index) * 2u + 1u);
}

}  // namespace

void TreeViewPedigreeLayouter::addAndLayoutParentsOfPerson(TreeViewPerson& person, int generation,
                                                           int index) {
    if (std::int64_t{generation} + 1 >= maxGenerations) return;
    const int next = generation + 1;
    addParentsToPerson(person);
    if (person.preferredFatherIndex != -1) {
        placeAncestor(person.getPreferredFather(), next, fatherSlot(index));
    }
    if (person.preferredMotherIndex != -1) {
        placeAncestor(person.getPreferredMother(), next, motherSlot(index));
    }
}

void TreeViewPedigreeLayouter::placeAncestor(TreeViewPerson& ancestor, int generation, int index) {
    admit(ancestor.personId);
    ancestor.getNodeCenter() = getCenterPointForGeneration(generation, index);
    addAndLayoutParentsOfPerson(ancestor, generation, index);
}

void TreeViewPedigreeLayouter::graphIterator(const Visitor& visitor) {
    graphIteratorHelper(focusPerson, visitor);
}

void TreeViewPedigreeLayouter::graphIteratorHelper(TreeViewPerson& person, const Visitor& visitor) {
    visitor(person);
    visitParentsSpousesAndChildren(person,
                                   [&](TreeViewPerson& relative) { graphIteratorHelper(relative, visitor); });
}

void TreeViewPedigreeLayouter::iterateDirectLineFromFocusPerson(const DirectLineVisitor& visitor) {
    directLineIteratorHelper(focusPerson, visitor);
}

void TreeViewPedigreeLayouter::directLineIterator(TreeViewPerson& person, const DirectLineVisitor& visitor,
                                                  bool hasNeighbours, const Iterator& neighbours) {
    visitor(person, hasNeighbours, neighbours);
    directLineIteratorHelper(person, visitor);
}

void TreeViewPedigreeLayouter::directLineIteratorHelper(TreeViewPerson& person,
                                                        const DirectLineVisitor& visitor) {
    walkParentsAndChildrenOnDirectLine(*this, person, visitor);
}

void TreeViewPedigreeLayouter::traverseTreeForStacking(int depth, TreeViewPerson& person) {
    stackPreferredAncestors(*dataAdapter, maxStackDepth, stackedPersons, depth, person);
}

}  // namespace SharedTreeViewer
