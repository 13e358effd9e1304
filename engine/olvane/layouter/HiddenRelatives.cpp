// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Looks for relatives off the picture, shared by the views. Each view decides on its own when to look and
// what a later look may overwrite; here stands only what the two ask in the very same words.

#include <olvane/graph/PersonWalksInternal.h>
#include <olvane/layouter/HiddenRelativesInternal.h>

namespace SharedTreeViewer {

void loadHostSpouses(TreeViewLayouter& layouter, TreeViewPerson& person) {
    person.getNonDisplayedSpouses(layouter.dataAdapter->getSpouses);
}

void flagGreatGrandparentsWithParents(TreeViewLayouter& layouter, TreeViewPerson& focus) {
    focus.greatGrandparentsIterator([&layouter](TreeViewPerson& greatGrandparent) {
        if (layouter.hasParents(greatGrandparent)) greatGrandparent.hasNonDisplayedRelationships = true;
    });
}

bool spouseHasRelativesElsewhere(TreeViewLayouter& layouter, TreeViewPerson& spouse) {
    loadHostSpouses(layouter, spouse);
    return spouse.getNonDisplayedSpouseCount() > 1 || layouter.hasParents(spouse);
}

ParentKeys parentKeysOf(TreeViewLayouter& layouter, const TreeViewPerson& child) {
    ParentKeys parents;
    layouter.dataAdapter->getParents(child.personId, parents.father, parents.mother);
    return parents;
}

bool parentsAreAShownCouple(TreeViewLayouter& layouter, TreeViewPerson& parent, const ParentKeys& parents) {
    bool shown = false;
    for (const TreeViewPerson& spouse : parent.spouses) {
        if (layouter.dataAdapter->isAddNode(spouse.personId)) continue;
        if (parents.has(spouse.personId) && parents.has(parent.personId)) shown = true;
    }
    return shown;
}

void flagChildrenWithFamilies(TreeViewLayouter& layouter, TreeViewPerson& person) {
    visitAllChildren(person, true, [&layouter](TreeViewPerson& child) {
        loadHostSpouses(layouter, child);
        child.hasNonDisplayedRelationships =
            child.getNonDisplayedSpouseCount() > 0 || child.getSpouseCount() > 0 ||
            !child.getAllChildrenVector(layouter.dataAdapter->getChildren).empty();
    });
}

}  // namespace SharedTreeViewer
