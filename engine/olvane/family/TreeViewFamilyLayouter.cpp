// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of work of the family view: the graph grows one ring of relatives at a time, and each ring is
// measured and placed before the next one comes in. Flags and lines come last, when no list of relatives
// grows any more, since adding a person moves others in memory.
//
// Two orders bind within this. Aunts and uncles look for the outermost sibling, so siblings stand before
// them; and every row of ancestors is centred on the focus's x, so the focus stands before any of them.

#include <olvane/family/TreeViewFamilyLayouter.h>

#include <olvane/family/FamilyOptions.h>
#include <olvane/layouter/LineRecordInternal.h>

#include <utility>

namespace SharedTreeViewer {

TreeViewFamilyLayouter::TreeViewFamilyLayouter(DataAdapter* data, int focusKey, int isMale,
                                               OptionMap optionValues, const TreeSize& sizes)
    : TreeViewLayouter(data, focusKey, isMale, std::move(optionValues), sizes) {}

void TreeViewFamilyLayouter::layoutForFocusNID() {
    readOptions();
    addFocusFamily();
    addStepChildrenOfFocus();
    addFamiliesOfChildren();
    addParentsToPerson(focusPerson);
    placeFocusFamily();
    addSiblingsOfFocus();
    rightEdge = layoutSiblings(focusPerson);
    placeParents();
    placeGrandparents();
    if (show.auntsUncles) placeAuntsAndUncles();
    if (show.greatGrandparents) placeGreatGrandparents();
    flagNonDisplayedRelationships(focusPerson);
    drawLines();
}

// Requests set one option, so the few that are set are looked up among the eight that are read.
void TreeViewFamilyLayouter::readOptions() {
    const std::pair<const std::string&, bool&> read[] = {
        {kTreeViewFamShowAuntsUnclesKey, show.auntsUncles},
        {kTreeViewFamShowCousinsKey, show.cousins},
        {kTreeViewFamShowSiblingsKey, show.siblings},
        {kTreeViewFamShowSiblingSpousesKey, show.siblingSpouses},
        {kTreeViewFamShowNeicesNephewsKey, show.niecesNephews},
        {kTreeViewFamShowGrandchildrenKey, show.grandchildren},
        {kTreeViewFamShowGreatGrandparentsKey, show.greatGrandparents},
        {kTreeViewFamShowSpousesOfChildrenKey, show.spousesOfChildren},
    };
    for (const auto& [key, value] : options) {
        for (const auto& [readKey, shown] : read) {
            if (key == readKey) shown = value;
        }
    }
}

void TreeViewFamilyLayouter::addFocusFamily() {
    addSpousesToPerson(focusPerson);
    addAllChildrenToPerson(focusPerson);
}

// Step children come in through the focus's own spouses alone: the children of a spouse who are not children
// of any spouse that the host knows for that spouse.
void TreeViewFamilyLayouter::addStepChildrenOfFocus() {
    focusPerson.spouseIterator([this](TreeViewPerson& spouse) {
        if (spouse.getAllChildrenVector(dataAdapter->getChildren).empty()) return;
        addBastardChildrenToPerson(spouse, spouse.getNonDisplayedSpouseIterator(dataAdapter->getSpouses));
    });
}

void TreeViewFamilyLayouter::addFamiliesOfChildren() {
    if (show.spousesOfChildren) {
        focusPerson.allChildrenIterator(true, [this](TreeViewPerson& child) { addSpousesToPerson(child); });
    }
    if (show.grandchildren) {
        focusPerson.allChildrenIterator(true,
                                        [this](TreeViewPerson& child) { addAllChildrenToPerson(child); });
    }
}

void TreeViewFamilyLayouter::placeFocusFamily() {
    calculateLayoutWidthForDescendantsOfProximalPerson(focusPerson);
    layoutFamilyUnitOfProximalPerson(focusPerson, 0.0f, 0.0f);
}

// Siblings come in only now, so that the focus's own unit is measured without them.
void TreeViewFamilyLayouter::addSiblingsOfFocus() {
    if (show.siblings) addSiblingsToPerson(focusPerson);
    const auto forEachSibling = [this](const Visitor& visitor) {
        focusPerson.allSiblingsIterator(false, [&](TreeViewPerson& sibling) {
            if (sibling.personId != focusPerson.personId) visitor(sibling);
        });
    };
    if (show.siblingSpouses) {
        forEachSibling([this](TreeViewPerson& sibling) { addSpousesToPerson(sibling); });
    }
    if (show.niecesNephews) {
        forEachSibling([this](TreeViewPerson& sibling) { addAllChildrenToPerson(sibling); });
    }
}

void TreeViewFamilyLayouter::placeParents() {
    initializeParentsXAndYCenteredAboveChild(focusPerson.getParentIterator(), parentY(),
                                             focusPerson.getNodeCenter().x, focusPerson.getParentCount());
}

// All grandparents form one evenly spaced group above the focus, not a pair above each parent.
void TreeViewFamilyLayouter::placeGrandparents() {
    focusPerson.parentsIterator([this](TreeViewPerson& parent) { addParentsToPerson(parent); });
    initializeParentsXAndYCenteredAboveChild(focusPerson.getGrandparentIterator(), grandparentY(),
                                             focusPerson.getNodeCenter().x,
                                             focusPerson.getGrandparentCount());
}

void TreeViewFamilyLayouter::placeAuntsAndUncles() {
    focusPerson.parentsIterator([this](TreeViewPerson& parent) {
        addSiblingsToPerson(parent);
        parent.allSiblingsIterator(false, [&](TreeViewPerson& sibling) {
            if (sibling.personId == parent.personId) return;
            addSpousesToPerson(sibling);
            if (show.cousins) addAllChildrenToPerson(sibling);
        });
    });
    if (focusPerson.preferredFatherIndex != -1) {
        rightEdge = layoutFatherSiblings(focusPerson, rightEdge, parentY());
    }
    if (focusPerson.preferredMotherIndex != -1) {
        layoutMotherSiblings(focusPerson, rightEdge, parentY());
    }
}

void TreeViewFamilyLayouter::placeGreatGrandparents() {
    focusPerson.grandparentsIterator(
        [this](TreeViewPerson& grandparent) { addParentsToPerson(grandparent); });
    initializeParentsXAndYCenteredAboveChild(focusPerson.getGreatGrandparentIterator(), greatGrandparentY(),
                                             focusPerson.getNodeCenter().x,
                                             focusPerson.getGreatGrandparentCount());
}

void TreeViewFamilyLayouter::drawLines() {
    const std::vector<TreeViewPerson*> persons = std::move(everybody);
    if (lineRecord != nullptr) {
        lineRecord->reserve(persons.size());
        for (TreeViewPerson* person : persons) lineRecord->number(*person);
    }
    for (TreeViewPerson* person : persons) addSpouseLinesToPerson(*person);
    for (TreeViewPerson* person : persons) addLinesToPerson(*person);
}

float TreeViewFamilyLayouter::parentY() const {
    return -treeSize.nodeHeight - treeSize.vertPadding;
}

float TreeViewFamilyLayouter::grandparentY() const {
    return parentY() - treeSize.nodeHeight - treeSize.vertPadding;
}

float TreeViewFamilyLayouter::greatGrandparentY() const {
    return grandparentY() - treeSize.nodeHeight - treeSize.vertPadding;
}

}  // namespace SharedTreeViewer
