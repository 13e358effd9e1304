// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/graph/TreeViewPerson.h>

// The walks that have a rule, for any callable, and the counts: the layouters walk the graph over and over,
// and a callable that the compiler sees through costs next to nothing there. Unlike a person's own walks and
// counts, these leave no empty list under a key that is missing. Plain walks are loops over a person's lists.

// The lists of children in the order of TreeViewPerson::allChildrenIterator: visit receives whose list, and the
// key of the other parent.
template <class VisitList>
void visitListsOfChildren(TreeViewPerson& person, bool includeBastards, const VisitList& visit) {
    if (person.gender) visit(person, TreeViewPerson::kNoKey);
    for (TreeViewPerson& spouse : person.spouses) {
        if (person.gender) visit(person, spouse.personId);
        if (includeBastards) visit(spouse, TreeViewPerson::kNoKey);
        if (!person.gender) visit(person, spouse.personId);
    }
    if (!person.gender) visit(person, TreeViewPerson::kNoKey);
}

// The children themselves.
template <class Visit>
void visitAllChildren(TreeViewPerson& person, bool includeBastards, const Visit& visit) {
    visitListsOfChildren(person, includeBastards, [&visit](TreeViewPerson& parent, int key) {
        for (TreeViewPerson& child : parent.childrenBy(key)) visit(child);
    });
}

// Those who come behind a person in the order of the result, but for siblings.
template <class Visit>
void visitParentsSpousesAndChildren(TreeViewPerson& person, const Visit& visit) {
    for (TreeViewPerson& parent : person.parents) visit(parent);
    for (TreeViewPerson& spouse : person.spouses) visit(spouse);
    visitAllChildren(person, false, visit);
}

// The lists of children in the order of TreeViewPerson::childAndSpouseIterator, each with the other parent, or with
// the person where there is none.
template <class VisitList>
void visitChildrenBySpouse(TreeViewPerson& person, const VisitList& visit) {
    if (person.gender) visit(person.childrenBy(TreeViewPerson::kNoKey), person);
    for (TreeViewPerson& spouse : person.spouses) visit(person.childrenBy(spouse.personId), spouse);
    if (!person.gender) visit(person.childrenBy(TreeViewPerson::kNoKey), person);
}

inline int countOfChildren(TreeViewPerson& person, int key) {
    return static_cast<int>(person.childrenBy(key).size());
}

// As TreeViewPerson::getAllChildrenCount.
inline int countOfAllChildren(TreeViewPerson& person) {
    int count = countOfChildren(person, TreeViewPerson::kNoKey);
    for (const TreeViewPerson& spouse : person.spouses) count += countOfChildren(person, spouse.personId);
    return count;
}
