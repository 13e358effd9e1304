// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/adapters/DataAdapter.h>
#include <olvane/graph/TreeViewPerson.h>

namespace SharedTreeViewer {

// A partner of an ancestral couple has a host spouse other than the other partner.
inline void flagPartnerWithAnotherSpouse(const DataAdapter& data, TreeViewPerson& partner,
                                         const TreeViewPerson& other) {
    for (const TreeViewPerson& spouse : partner.getNonDisplayedSpouses(data.getSpouses)) {
        if (spouse.personId != other.personId) partner.hasNonDisplayedRelationships = true;
    }
}

// Climbs the preferred ancestors of a person, the father's line first, marks each as visited and collects it,
// and flags the couples on the way back, so that ancestors are done before their children's couple. It places
// nothing, whatever the name of the operations that call it. Stacked is a list of pointers that do not own.
template <class Stacked>
void stackPreferredAncestors(const DataAdapter& data, int maxStackDepth, Stacked& stacked, int depth,
                             TreeViewPerson& person) {
    if (data.isAddNode(person.personId)) return;
    if (maxStackDepth <= depth) return;
    if (person.hasBeenVisited()) return;
    person.setHasBeenVisited(true);
    stacked.push_back(&person);

    const bool hasFather = person.preferredFatherIndex != -1;
    const bool hasMother = person.preferredMotherIndex != -1;
    if (hasFather) {
        stackPreferredAncestors(data, maxStackDepth, stacked, depth + 1, person.getPreferredFather());
    }
    if (!hasMother) return;
    stackPreferredAncestors(data, maxStackDepth, stacked, depth + 1, person.getPreferredMother());
    if (!hasFather) return;
    TreeViewPerson& father = person.getPreferredFather();
    TreeViewPerson& mother = person.getPreferredMother();
    flagPartnerWithAnotherSpouse(data, father, mother);
    flagPartnerWithAnotherSpouse(data, mother, father);
}

}  // namespace SharedTreeViewer
