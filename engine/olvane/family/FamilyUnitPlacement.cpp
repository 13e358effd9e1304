// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the persons of one family unit stand, packed from left to right at the running x. A person with
// several spouses gets a block for each. At most one spouse is combined with the person into a couple over
// their common children: a man's first, at the left end of his unit, a woman's last, at the right end of
// hers. The others stand alone over their own children. A person with unknown children stands alone as well,
// and there is no couple.
//
//     a man:    [him]--[1st]   [2nd]   [3rd]            a woman:   [1st]   [2nd]   [3rd]--[her]
//     with children of his own:  [him]  [1st]  [2nd]    of her own:    [1st]  [2nd]  [her]
//
// Each person is placed once, children before the next spouse, and nothing is moved afterwards.

#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/graph/PersonWalksInternal.h>
#include <olvane/graph/WholePointInternal.h>

#include <algorithm>

namespace SharedTreeViewer {

void TreeViewFamilyLayouter::layoutFamilyUnitOfProximalPerson(TreeViewPerson& person, float x, float y) {
    const int spouseCount = person.getSpouseCount();
    const bool hasUnknownChildren = countOfChildren(person, TreeViewPerson::kNoKey) > 0;
    const int offset = getLineOffset(spouseCount, person.gender);
    if (spouseCount == 0) {
        layoutUnknownChildrenAndPerson(person, x, y);
    } else if (hasUnknownChildren && person.gender) {
        placeManAndNonCombinedSpouses(person, x, y, offset);
    } else if (hasUnknownChildren) {
        placeNonCombinedSpousesAndWoman(person, x, y, offset);
    } else if (person.gender) {
        placeCoupleAndLaterSpouses(person, x, y, offset);
    } else {
        placeEarlierSpousesAndCouple(person, x, y, offset);
    }
}

int TreeViewFamilyLayouter::getLineOffset(int spouseCount, bool isMale) const {
    if (spouseCount < 2) return 0;
    const float step = isMale ? treeSize.spouseLineStep : -treeSize.spouseLineStep;
    const float steps = spouseCount == 2 ? 0.5f : static_cast<float>(spouseCount >> 1);
    return olvane::wholePoint(step * steps);
}

void TreeViewFamilyLayouter::placeManAndNonCombinedSpouses(TreeViewPerson& man, float x, float y,
                                                           int offset) {
    layoutUnknownChildrenAndPerson(man, x, y);
    float runningX = x + man.layoutWidth + treeSize.horzPadding;
    for (TreeViewPerson& spouse : man.spouses) {
        layoutSpouse(spouse, man.getChildrenIterator(spouse.personId), y, &runningX, &offset, true);
    }
}

// The offset runs away from zero here, unlike for a woman in a couple. Nothing draws by it; hosts that read
// the field see it as it is.
void TreeViewFamilyLayouter::placeNonCombinedSpousesAndWoman(TreeViewPerson& woman, float x, float y,
                                                             int offset) {
    float runningX = x;
    for (TreeViewPerson& spouse : woman.spouses) {
        layoutSpouse(spouse, woman.getChildrenIterator(spouse.personId), y, &runningX, &offset, true);
    }
    layoutUnknownChildrenAndPerson(woman, runningX, y);
}

void TreeViewFamilyLayouter::placeCoupleAndLaterSpouses(TreeViewPerson& man, float x, float y, int offset) {
    TreeViewPerson& first = man.getPreferredSpouse();
    float runningX = x;
    const float width = layoutTraditionalHusbandAndWife(
        man, first, man.getChildrenAndBastardsWithSpouseIterator(first), runningX, y);
    runningX = runningX + width + treeSize.horzPadding;
    first.spouseLineOffset = static_cast<float>(offset);
    offset = olvane::wholePoint(static_cast<float>(offset) - treeSize.spouseLineStep);
    for (auto later = man.spouses.begin() + 1; later != man.spouses.end(); ++later) {
        layoutSpouse(*later, man.getChildrenIterator(later->personId), y, &runningX, &offset, true);
    }
}

void TreeViewFamilyLayouter::placeEarlierSpousesAndCouple(TreeViewPerson& woman, float x, float y,
                                                          int offset) {
    TreeViewPerson& last = woman.spouses.back();
    float runningX = x;
    for (auto earlier = woman.spouses.begin(); earlier != woman.spouses.end() - 1; ++earlier) {
        layoutSpouse(*earlier, woman.getChildrenIterator(earlier->personId), y, &runningX, &offset, false);
    }
    layoutTraditionalHusbandAndWife(last, woman, woman.getChildrenAndBastardsWithSpouseIterator(last),
                                    runningX, y);
    last.spouseLineOffset = static_cast<float>(offset);
}

void TreeViewFamilyLayouter::layoutSpouse(TreeViewPerson& spouse, const Iterator& children, float y, float* x,
                                          int* offset, bool decrease) {
    layoutChildrenAndPersonWithNonCombinedSpouse(spouse, children, *x, y);
    const float lineOffset = static_cast<float>(*offset);
    spouse.spouseLineOffset = lineOffset;
    *offset = olvane::wholePoint(decrease ? lineOffset - treeSize.spouseLineStep
                                          : lineOffset + treeSize.spouseLineStep);
    *x = *x + spouse.layoutWidth;
    *x = *x + treeSize.horzPadding;
}

// A spouse's children by others stand on the side away from the couple: left of a man's, right of a woman's.
void TreeViewFamilyLayouter::layoutChildrenAndPersonWithNonCombinedSpouse(TreeViewPerson& spouse,
                                                                          const Iterator& children, float x,
                                                                          float y) {
    centerPerson(spouse, spouse.layoutWidth, x, y);
    const float childY = treeSize.nodeHeight + y + treeSize.vertPadding;
    if (spouse.gender) {
        const float next = layoutUnknownChildren(spouse, x, y);
        layoutChildrenOfParents(children, childY, next);
    } else {
        const float next = layoutChildrenOfParents(children, childY, x);
        layoutUnknownChildren(spouse, next, y);
    }
}

// The children start at the left edge of the span. They come out under the middle of the pair all the same:
// the span is as wide as their block wherever that is wider than the couple, and an only child was widened for
// this.
float TreeViewFamilyLayouter::layoutTraditionalHusbandAndWife(TreeViewPerson& husband, TreeViewPerson& wife,
                                                              const Iterator& children, float x, float y) {
    const float coupleWidth = static_cast<float>(2.0 * treeSize.nodeWidth + treeSize.horzPadding);
    const float width = std::max(std::max(wife.layoutWidth, husband.layoutWidth), coupleWidth);
    centerHusbandAndWife(husband, wife, width, x, y);
    const float childY = y + treeSize.nodeHeight + treeSize.vertPadding;
    float runningX = x;
    children([&](TreeViewPerson& child) {
        dataAdapter->touchPerson(child.personId);
        layoutFamilyUnitOfProximalPerson(child, runningX, childY);
        runningX = runningX + familyUnitWidthForProximalPerson(child);
        runningX = runningX + treeSize.horzPadding;
    });
    return width;
}

float TreeViewFamilyLayouter::layoutChildrenOfParents(const Iterator& children, float childY, float x) {
    float runningX = x;
    children([&](TreeViewPerson& child) {
        layoutFamilyUnitOfProximalPerson(child, runningX, childY);
        runningX = runningX + familyUnitWidthForProximalPerson(child);
        runningX = runningX + treeSize.horzPadding;
    });
    return runningX;
}

float TreeViewFamilyLayouter::layoutUnknownChildren(TreeViewPerson& person, float x, float y) {
    if (countOfChildren(person, TreeViewPerson::kNoKey) == 0) return x;
    const float childY = y + treeSize.nodeHeight + treeSize.vertPadding;
    return layoutChildrenOfParents(person.getChildrenIterator(TreeViewPerson::kNoKey), childY, x);
}

float TreeViewFamilyLayouter::layoutUnknownChildrenAndPerson(TreeViewPerson& person, float x, float y) {
    centerPerson(person, person.layoutWidth, x, y);
    return layoutUnknownChildren(person, x, y);
}

}  // namespace SharedTreeViewer
