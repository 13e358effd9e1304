// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/graph/TreeViewPerson.h>

// The walks that have a rule, for any callable: the layouters walk the graph over and over, and a callable
// that the compiler sees through costs next to nothing there. Plain walks are loops over a person's lists.

// The order of TreeViewPerson::allChildrenIterator.
template <class Visit>
void visitAllChildren(TreeViewPerson& person, bool includeBastards, const Visit& visit) {
    const auto visitChildrenOf = [&visit](TreeViewPerson& parent, int key) {
        for (TreeViewPerson& child : parent.childrenUnder(key)) visit(child);
    };
    if (person.gender) visitChildrenOf(person, TreeViewPerson::kNoKey);
    for (TreeViewPerson& spouse : person.spouses) {
        if (person.gender) visitChildrenOf(person, spouse.personId);
        if (includeBastards) visitChildrenOf(spouse, TreeViewPerson::kNoKey);
        if (!person.gender) visitChildrenOf(person, spouse.personId);
    }
    if (!person.gender) visitChildrenOf(person, TreeViewPerson::kNoKey);
}

// The order of TreeViewPerson::childAndSpouseIterator.
template <class VisitPair>
void visitChildrenAndSpouses(TreeViewPerson& person, const VisitPair& visit) {
    const auto visitChildrenWith = [&visit, &person](int key, TreeViewPerson& other) {
        for (TreeViewPerson& child : person.childrenUnder(key)) visit(child, other);
    };
    if (person.gender) visitChildrenWith(TreeViewPerson::kNoKey, person);
    for (TreeViewPerson& spouse : person.spouses) visitChildrenWith(spouse.personId, spouse);
    if (!person.gender) visitChildrenWith(TreeViewPerson::kNoKey, person);
}
