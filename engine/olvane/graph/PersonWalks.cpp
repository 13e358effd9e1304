// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The walks over a person's relatives. Children are placed in the order of the walk, so with the man drawn at
// the left of his wife the rule is one of sides: a man's children by nobody else come before all his
// marriages, a woman's after all of hers, and a spouse's own such children stand on the spouse's side.
//
// Asking for children by key leaves an empty list under a key that is missing. An empty list behaves as no
// list everywhere, so no caller can see the difference; a constant person cannot answer these questions, though.

#include <olvane/graph/PersonWalksInternal.h>
#include <olvane/graph/TreeViewPerson.h>

#include <algorithm>
#include <span>

namespace {

typedef TreeViewPerson::Persons Persons;
typedef TreeViewPerson::Visitor Visitor;

void walk(Persons& persons, const Visitor& visitor) {
    for (TreeViewPerson& person : persons) visitor(person);
}

template <class Walk>
int countVisits(Walk walkWith) {
    int count = 0;
    walkWith(Visitor([&count](TreeViewPerson&) { ++count; }));
    return count;
}

}  // namespace

void TreeViewPerson::parentsIterator(const Visitor& visitor) {
    walk(parents, visitor);
}

void TreeViewPerson::spouseIterator(const Visitor& visitor) {
    walk(spouses, visitor);
}

void TreeViewPerson::nonDisplayedSpouseIterator(const Visitor& visitor) {
    walk(nonDisplayedSpouses, visitor);
}

void TreeViewPerson::childrenIterator(int key, const Visitor& visitor) {
    walk(childrenUnder(key), visitor);
}

void TreeViewPerson::grandparentsIterator(const Visitor& visitor) {
    for (TreeViewPerson& parent : parents) parent.parentsIterator(visitor);
}

void TreeViewPerson::greatGrandparentsIterator(const Visitor& visitor) {
    for (TreeViewPerson& parent : parents) parent.grandparentsIterator(visitor);
}

void TreeViewPerson::allChildrenIterator(bool includeBastards, const Visitor& visitor) {
    visitListsOfChildren(*this, includeBastards, [&visitor](TreeViewPerson& parent, int key) {
        parent.childrenIterator(key, visitor);
    });
}

void TreeViewPerson::allChildrenWithSpouseIterator(TreeViewPerson& spouse, const Visitor& visitor) {
    TreeViewPerson& left = gender ? *this : spouse;
    TreeViewPerson& right = gender ? spouse : *this;
    left.childrenIterator(kNoKey, visitor);
    childrenIterator(spouse.personId, visitor);
    right.childrenIterator(kNoKey, visitor);
}

void TreeViewPerson::childAndSpouseIterator(const PairVisitor& visitor) {
    visitChildrenBySpouse(*this, [&visitor](std::span<TreeViewPerson> list, TreeViewPerson& other) {
        for (TreeViewPerson& child : list) visitor(child, other);
    });
}

// From self: outward to the left from the person's own entry, then that entry, then on to the right. Without
// an own entry the whole list runs backwards.
void TreeViewPerson::allSiblingsIterator(bool fromSelf, const Visitor& visitor) {
    if (!fromSelf) {
        walk(siblings, visitor);
        return;
    }
    const Persons::iterator own =
        std::find_if(siblings.begin(), siblings.end(),
                     [this](const TreeViewPerson& sibling) { return sibling.personId == personId; });
    const Persons::iterator first = siblings.begin();
    const Persons::iterator last = siblings.end();
    for (Persons::iterator left = own; left != first;) visitor(*--left);
    for (Persons::iterator right = own; right != last; ++right) visitor(*right);
}

void TreeViewPerson::allSiblingsReverseIterator(const ReverseVisitor& visitor) {
    const Persons::reverse_iterator end = siblings.rend();
    for (Persons::reverse_iterator sibling = siblings.rbegin(); sibling != end; ++sibling) {
        visitor(*sibling, -1);
    }
}

TreeViewPerson::Iterator TreeViewPerson::getChildrenIterator(int key) {
    return [this, key](const Visitor& visitor) { childrenIterator(key, visitor); };
}

TreeViewPerson::Iterator TreeViewPerson::getAllChildrenIterator(bool includeBastards) {
    return [this, includeBastards](const Visitor& visitor) { allChildrenIterator(includeBastards, visitor); };
}

TreeViewPerson::Iterator TreeViewPerson::getSpouseIterator() {
    return [this](const Visitor& visitor) { spouseIterator(visitor); };
}

TreeViewPerson::Iterator TreeViewPerson::getSelfAndSpousesIterator() {
    return [this](const Visitor& visitor) {
        visitor(*this);
        spouseIterator(visitor);
    };
}

TreeViewPerson::Iterator TreeViewPerson::getParentIterator() {
    return [this](const Visitor& visitor) { parentsIterator(visitor); };
}

TreeViewPerson::Iterator TreeViewPerson::getGrandparentIterator() {
    return [this](const Visitor& visitor) { grandparentsIterator(visitor); };
}

TreeViewPerson::Iterator TreeViewPerson::getGreatGrandparentIterator() {
    return [this](const Visitor& visitor) { greatGrandparentsIterator(visitor); };
}

TreeViewPerson::Iterator TreeViewPerson::getChildrenAndBastardsWithSpouseIterator(TreeViewPerson& spouse) {
    return [this, &spouse](const Visitor& visitor) {
        if (gender) childrenIterator(spouse.personId, visitor);
        spouse.childrenIterator(kNoKey, visitor);
        if (!gender) childrenIterator(spouse.personId, visitor);
    };
}

TreeViewPerson::Iterator TreeViewPerson::getNonDisplayedSpouseIterator(const SpousesLoader& loader) {
    getNonDisplayedSpouses(loader);
    return [this](const Visitor& visitor) { nonDisplayedSpouseIterator(visitor); };
}

void TreeViewPerson::loadNonDisplayedSpouses(const SpousesLoader& loader) {
    nonDisplayedSpousesLoaded = true;
    SpouseSet records(arena());
    loader(personId, records);
    nonDisplayedSpouses.reserve(nonDisplayedSpouses.size() + records.size());
    for (const SpouseAdapter& record : records) addNonDisplayedSpouse(record.key);
}

void TreeViewPerson::loadAllChildren(const ChildrenLoader& loader) {
    allChildrenLoaded = true;
    loader(personId, allChildren);
}

int TreeViewPerson::getGrandparentCount() {
    return countVisits([this](const Visitor& visitor) { grandparentsIterator(visitor); });
}

int TreeViewPerson::getGreatGrandparentCount() {
    return countVisits([this](const Visitor& visitor) { greatGrandparentsIterator(visitor); });
}

int TreeViewPerson::getChildrenWithSpouseCount(int key) {
    return countOf(childrenUnder(key));
}

int TreeViewPerson::getChildrenWithNoOtherParentCount() {
    return getChildrenWithSpouseCount(kNoKey);
}

int TreeViewPerson::getAllChildrenCount() {
    int count = 0;
    for (const TreeViewPerson& spouse : spouses) count += getChildrenWithSpouseCount(spouse.personId);
    return count + getChildrenWithNoOtherParentCount();
}

bool TreeViewPerson::hasChildWithSpouse(int spouseKey, int childKey) {
    const Persons& list = childrenUnder(spouseKey);
    return std::any_of(list.begin(), list.end(),
                       [childKey](const TreeViewPerson& child) { return child.personId == childKey; });
}
