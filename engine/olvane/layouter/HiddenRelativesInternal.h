// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/layouter/TreeViewLayouter.h>

namespace SharedTreeViewer {

// The looks for relatives off the picture that both views take word for word. Each asks the data source again,
// and the order of the questions is behaviour: every look at unknown parents uses up negative ids.

// Asks for all the host's spouses of the person, shown or not, at most once for each node.
void loadHostSpouses(TreeViewLayouter& layouter, TreeViewPerson& person);

// Flags each great-grandparent of the focus who has a real parent.
void flagGreatGrandparentsWithParents(TreeViewLayouter& layouter, TreeViewPerson& focus);

// The spouse has a second marriage, or real parents. The second is asked for only where the first says no.
bool spouseHasRelativesElsewhere(TreeViewLayouter& layouter, TreeViewPerson& spouse);

// The two keys of a child's parents, as the data source answers them now.
struct ParentKeys {
    int father = TreeViewPerson::kNoKey;
    int mother = TreeViewPerson::kNoKey;

    bool has(int key) const { return key == mother || key == father; }
};
ParentKeys parentKeysOf(TreeViewLayouter& layouter, const TreeViewPerson& child);

// The child's two parents are this parent and one of its shown spouses.
bool parentsAreAShownCouple(TreeViewLayouter& layouter, TreeViewPerson& parent, const ParentKeys& parents);

// Sets the flag of each child of the person: that child has a spouse or children of its own.
void flagChildrenWithFamilies(TreeViewLayouter& layouter, TreeViewPerson& person);

}  // namespace SharedTreeViewer
