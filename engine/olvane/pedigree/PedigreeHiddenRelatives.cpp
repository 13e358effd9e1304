// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The flag of each person in the pedigree view. Unlike the family view it has no final pass over the whole
// chart: each flag is what the passes below leave on it, and the later one has the last word.

#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

#include <olvane/layouter/HiddenRelativesInternal.h>

#include <algorithm>

namespace SharedTreeViewer {

void TreeViewPedigreeLayouter::flagNonDisplayedRelationships(TreeViewPerson& focus) {
    flagGreatGrandparentsWithParents(*this, focus);
    const auto checkForOtherChildren = [this](TreeViewPerson& person) {
        checkParentsForOtherChildren(person);
    };
    checkForOtherChildren(focus);
    focus.parentsIterator(checkForOtherChildren);
    focus.grandparentsIterator(checkForOtherChildren);
    traverseTreeForStacking(0, focus);
    clearVisitedMarks();
    flagChildren(focus);
    flagNonDisplayedRelationshipsForSpouses(focus, true);
}

void TreeViewPedigreeLayouter::clearVisitedMarks() {
    while (!stackedPersons.empty()) {
        stackedPersons.back()->setHasBeenVisited(false);
        stackedPersons.pop_back();
    }
}

void TreeViewPedigreeLayouter::flagChildren(TreeViewPerson& focus) {
    focus.allChildrenIterator(true, [&](TreeViewPerson& child) {
        loadHostSpouses(*this, child);
        child.hasNonDisplayedRelationships = child.getNonDisplayedSpouseCount() >= 1 ||
                                             !child.getAllChildrenVector(dataAdapter->getChildren).empty();
        if (!child.hasNonDisplayedRelationships) checkChildForUnshownParents(focus, child);
    });
}

// Never takes a flag back: a parent with no other child keeps the one it has.
void TreeViewPedigreeLayouter::checkParentsForOtherChildren(TreeViewPerson& person) {
    for (TreeViewPerson& parent : person.parents) {
        const ChildrenSet& children = parent.getAllChildrenVector(dataAdapter->getChildren);
        const bool hasAnother =
            std::any_of(children.begin(), children.end(),
                        [&](const ChildrenAdapter& record) { return record.key != person.personId; });
        if (hasAnother) parent.hasNonDisplayedRelationships = true;
    }
}

// The children are asked for even where the flag stands already: each node asks once, and later looks rest on
// it.
void TreeViewPedigreeLayouter::flagNonDisplayedRelationshipsForSpouses(TreeViewPerson& person,
                                                                       bool checkChildren) {
    person.spouseIterator([&](TreeViewPerson& spouse) {
        bool flag = spouseHasRelativesElsewhere(*this, spouse);
        if (checkChildren) {
            const bool childOffTheChart = hasChildOffTheChart(spouse);
            flag = flag || childOffTheChart;
        }
        spouse.hasNonDisplayedRelationships = flag;
    });
}

bool TreeViewPedigreeLayouter::hasChildOffTheChart(TreeViewPerson& spouse) {
    const ChildrenSet& children = spouse.getAllChildrenVector(dataAdapter->getChildren);
    return std::any_of(children.begin(), children.end(),
                       [this](const ChildrenAdapter& record) { return !isAdmitted(record.key); });
}

void TreeViewPedigreeLayouter::checkChildForUnshownParents(TreeViewPerson& parent, TreeViewPerson& child) {
    const ParentKeys parents = parentKeysOf(*this, child);
    bool unshown = false;
    if (!parentsAreAShownCouple(*this, parent, parents)) {
        const auto isRealAndNotTheParent = [&](int key) {
            return !dataAdapter->isAddNode(key) && key != parent.personId;
        };
        unshown = parentHasSpouseBesideTheOther(parent, parents.father, parents.mother) ||
                  isRealAndNotTheParent(parents.father) || isRealAndNotTheParent(parents.mother);
    }
    child.hasNonDisplayedRelationships = unshown;
}

// The parent has a host spouse besides the child's other parent. Every host spouse counts, drawn or not.
bool TreeViewPedigreeLayouter::parentHasSpouseBesideTheOther(TreeViewPerson& parent, int father, int mother) {
    bool found = false;
    const Iterator hostSpouses = parent.getNonDisplayedSpouseIterator(dataAdapter->getSpouses);
    hostSpouses([&](TreeViewPerson& spouse) {
        if (father == parent.personId && !dataAdapter->isAddNode(mother)) {
            if (spouse.personId != mother) found = true;
        } else if (mother == parent.personId && !dataAdapter->isAddNode(father)) {
            if (spouse.personId != father) found = true;
        }
    });
    return found;
}

void TreeViewPedigreeLayouter::checkPersonsChildren(TreeViewPerson& person) {
    flagChildrenWithFamilies(*this, person);
}

}  // namespace SharedTreeViewer
