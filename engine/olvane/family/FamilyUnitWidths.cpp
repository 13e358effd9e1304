// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How wide a family unit is. Widths are measured from the bottom up: every person's layoutWidth is filled,
// and the width of a whole unit is then read off the persons at its top, without going down again. Nothing is
// placed here.
//
// Three rules look uneven and are part of every chart. The spouses of step children take no room. A unit with
// unknown children counts its spouses' blocks without the couple's floor, so it can measure narrower than it
// is placed. And the floor of a unit without unknown children lies on the first spouse, though a woman stands
// as a couple with her last. Evening any of them out would move every box to the right of such a unit.

#include <olvane/family/TreeViewFamilyLayouter.h>

#include <olvane/graph/PersonWalksInternal.h>

namespace SharedTreeViewer {

float TreeViewFamilyLayouter::horzPaddingForNodesCount(int count) const {
    return count < 2 ? 0.0f : static_cast<float>(count - 1) * treeSize.horzPadding;
}

float TreeViewFamilyLayouter::couplesWidth() const {
    return 2.0f * treeSize.nodeWidth + treeSize.horzPadding;
}

void TreeViewFamilyLayouter::calculateLayoutWidthForDescendantsOfProximalPerson(TreeViewPerson& person) {
    person.isProximalPerson = true;
    for (TreeViewPerson& spouse : person.spouses) measureSpouse(person, spouse);
    const float unknown = widthWithoutSecondParent(person);
    person.layoutWidth = treeSize.nodeWidth > unknown ? treeSize.nodeWidth : unknown;
}

void TreeViewFamilyLayouter::measureSpouse(TreeViewPerson& person, TreeViewPerson& spouse) {
    spouse.isProximalPerson = false;
    if (countOfChildren(person, spouse.personId) != 0) {
        measureSpouseWithSharedChildren(person, spouse);
    } else {
        measureSpouseWithoutSharedChildren(spouse);
    }
}

// One gap for each step child, not one fewer: their blocks stand beside the shared children.
void TreeViewFamilyLayouter::measureSpouseWithSharedChildren(TreeViewPerson& person, TreeViewPerson& spouse) {
    const float shared = sharedChildrenWidth(person, spouse);
    const float step = addWidthsForStepChildrenFromSpouse(spouse);
    const int stepCount = countOfChildren(spouse, TreeViewPerson::kNoKey);
    const float stepGaps = stepCount > 0 ? static_cast<float>(stepCount) * treeSize.horzPadding : 0.0f;
    const int sharedCount = countOfChildren(person, spouse.personId);
    spouse.layoutWidth = (step + stepGaps) + (horzPaddingForNodesCount(sharedCount) + shared);
}

// An only child without children gets the width of a couple, so that it comes out under the middle of the pair.
float TreeViewFamilyLayouter::sharedChildrenWidth(TreeViewPerson& person, TreeViewPerson& spouse) {
    const bool onlyChild =
        countOfChildren(person, spouse.personId) == 1 && countOfChildren(spouse, TreeViewPerson::kNoKey) == 0;
    float shared = 0.0f;
    for (TreeViewPerson& child : person.childrenBy(spouse.personId)) {
        calculateLayoutWidthForDescendantsOfProximalPerson(child);
        shared = shared + familyUnitWidthForProximalPerson(child);
        if (onlyChild && shared == treeSize.nodeWidth) {
            shared = shared + (treeSize.nodeWidth + treeSize.horzPadding);
            child.layoutWidth = shared;
        }
    }
    return shared;
}

void TreeViewFamilyLayouter::measureSpouseWithoutSharedChildren(TreeViewPerson& spouse) {
    const float step = addWidthsForStepChildrenFromSpouse(spouse);
    const float width = step + horzPaddingForNodesCount(countOfChildren(spouse, TreeViewPerson::kNoKey));
    spouse.layoutWidth = couplesWidth() > width ? couplesWidth() : width;
}

float TreeViewFamilyLayouter::addWidthsForStepChildrenFromSpouse(TreeViewPerson& spouse) {
    float sum = 0.0f;
    for (TreeViewPerson& child : spouse.childrenBy(TreeViewPerson::kNoKey)) {
        calculateLayoutWidthForDescendantsOfProximalPerson(child);
        sum = sum + child.layoutWidth;
    }
    return sum;
}

float TreeViewFamilyLayouter::widthWithoutSecondParent(TreeViewPerson& person) {
    float unknown = 0.0f;
    for (TreeViewPerson& child : person.childrenBy(TreeViewPerson::kNoKey)) {
        calculateLayoutWidthForDescendantsOfProximalPerson(child);
        unknown = unknown + child.layoutWidth;
        for (const TreeViewPerson& spouse : child.spouses) {
            unknown = unknown + spouse.layoutWidth;
            unknown = unknown + treeSize.horzPadding;
        }
    }
    return unknown + horzPaddingForNodesCount(countOfChildren(person, TreeViewPerson::kNoKey));
}

// Reads stored widths alone and must stay free of recursion: it is asked for each child on each level.
float TreeViewFamilyLayouter::familyUnitWidthForProximalPerson(TreeViewPerson& person) {
    const int spouseCount = person.getSpouseCount();
    if (countOfChildren(person, TreeViewPerson::kNoKey) != 0) {
        float total = person.layoutWidth;
        for (const TreeViewPerson& spouse : person.spouses) total = total + spouse.layoutWidth;
        const float gaps = spouseCount >= 1 ? static_cast<float>(spouseCount) * treeSize.horzPadding : 0.0f;
        return gaps + total;
    }
    if (spouseCount == 0) return person.layoutWidth;

    const float first = person.getPreferredSpouse().layoutWidth;
    float total = couplesWidth() > first ? couplesWidth() : first;
    for (auto later = person.spouses.begin() + 1; later != person.spouses.end(); ++later) {
        total = total + later->layoutWidth;
    }
    return horzPaddingForNodesCount(spouseCount) + total;
}

}  // namespace SharedTreeViewer
