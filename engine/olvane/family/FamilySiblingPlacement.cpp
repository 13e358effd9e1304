// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Siblings beside the focus on row 0, and the parents' siblings on the parents' row: the father's outward to
// the left, the mother's outward to the right, beyond whatever stands lowest on that side. Each sibling is
// the person of a unit, measured just before it is placed.
//
// A list of siblings holds the person itself as one element. That element is a node of its own that is never
// placed, so it keeps its place at (0, 0); it marks where left turns into right, and it takes part in the
// search for the outermost sibling with its x of 0. The two outward sides are no mirror of each other: they
// start from unlike distances, and each difference below shows in hosts' pictures.

#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/graph/WholePointInternal.h>

#include <algorithm>

namespace SharedTreeViewer {

namespace {

// The sibling for whom no later one lies further out, or the person where there are no siblings. Further out
// is asked of the sibling's x and the kept x, which is cut to whole points; a tie keeps the earlier one.
template <class LiesFurtherOut>
TreeViewPerson& outermostSibling(TreeViewPerson& person, LiesFurtherOut liesFurtherOut) {
    TreeViewPerson* kept = nullptr;
    int keptX = 0;
    person.allSiblingsIterator(false, [&](TreeViewPerson& sibling) {
        const float x = sibling.getNodeCenter().x;
        if (kept != nullptr && !liesFurtherOut(x, static_cast<float>(keptX))) return;
        kept = &sibling;
        keptX = olvane::wholePoint(x);
    });
    return kept != nullptr ? *kept : person;
}

// The outer end of a unit is the last spouse where spouses stand on that side.
TreeViewPerson& outerEndOfUnit(TreeViewPerson& person, bool spousesStandOutside) {
    return spousesStandOutside && person.getSpouseCount() >= 1 ? person.spouses.back() : person;
}

}  // namespace

void TreeViewFamilyLayouter::measureAndPlaceSibling(TreeViewPerson& sibling, float x, float y) {
    calculateLayoutWidthForDescendantsOfProximalPerson(sibling);
    layoutFamilyUnitOfProximalPerson(sibling, x, y);
}

float TreeViewFamilyLayouter::layoutSiblings(TreeViewPerson& person) {
    float x = 0.0f;
    bool reachedFocus = false;
    person.allSiblingsIterator(true, [&](TreeViewPerson& sibling) {
        // The one place that goes without the callback where it is empty.
        if (!dataAdapter->touchPerson.empty()) dataAdapter->touchPerson(sibling.personId);
        if (sibling.personId == person.personId) {
            reachedFocus = true;
            x = familyUnitWidthForProximalPerson(person) + treeSize.horzPadding;
        } else if (reachedFocus) {
            measureAndPlaceSibling(sibling, x, 0.0f);
            x = familyUnitWidthForProximalPerson(sibling) + x;
            x = x + treeSize.horzPadding;
        } else {
            calculateLayoutWidthForDescendantsOfProximalPerson(sibling);
            x = x - familyUnitWidthForProximalPerson(sibling) - treeSize.horzPadding;
            layoutFamilyUnitOfProximalPerson(sibling, x, 0.0f);
        }
    });
    return x;
}

float TreeViewFamilyLayouter::layoutFatherSiblings(TreeViewPerson& person, float x, float y) {
    TreeViewPerson& father = focusPerson.getPreferredFather();
    if (father.getSiblingCount() == 0) return x;
    TreeViewPerson& leftmost =
        outermostSibling(person, [](float siblingX, float keptX) { return keptX > siblingX; });
    dataAdapter->touchPerson(leftmost.personId);
    const TreeViewPerson& anchor = outerEndOfUnit(leftmost, !leftmost.gender);
    x = std::min(father.getNodeCenter().x, anchor.getNodeCenter().x) + treeSize.nodeWidth * -0.5f;
    father.allSiblingsReverseIterator([&](TreeViewPerson& sibling, int) {
        if (sibling.personId == father.personId) return;
        dataAdapter->touchPerson(sibling.personId);
        calculateLayoutWidthForDescendantsOfProximalPerson(sibling);
        x = x - familyUnitWidthForProximalPerson(sibling) - treeSize.horzPadding;
        layoutFamilyUnitOfProximalPerson(sibling, x, y);
    });
    return x;
}

float TreeViewFamilyLayouter::layoutMotherSiblings(TreeViewPerson& person, float x, float y) {
    TreeViewPerson& mother = focusPerson.getPreferredMother();
    if (mother.getSiblingCount() == 0) return x;
    TreeViewPerson& rightmost =
        outermostSibling(person, [](float siblingX, float keptX) { return siblingX > keptX; });
    const TreeViewPerson& anchor = outerEndOfUnit(rightmost, rightmost.gender);
    x = std::max(mother.getNodeCenter().x, anchor.getNodeCenter().x) + treeSize.nodeWidth +
        (treeSize.horzPadding + treeSize.horzPadding);
    mother.allSiblingsIterator(false, [&](TreeViewPerson& sibling) {
        if (sibling.personId == mother.personId) return;
        measureAndPlaceSibling(sibling, x, y);
        x = x + familyUnitWidthForProximalPerson(sibling);
        x = x + treeSize.horzPadding;
    });
    return x;
}

}  // namespace SharedTreeViewer
