// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A person's relatives, and how they come in. Every entry goes through addPerson, which builds a bare person
// and appends a copy of it, so that a failed allocation leaves the list untouched.

#include <olvane/graph/TreeViewPerson.h>

#include <cstddef>

TreeViewPerson::TreeViewPerson(int key, olvane::Arena* arena)
    : personId(key),
      spouseEdges(arena),
      unownedSpouseEdges(arena),
      generationEdges(arena),
      allChildren(arena),
      parents(arena),
      spouses(arena),
      nonDisplayedSpouses(arena),
      children(arena),
      siblings(arena),
      lineSegments(arena),
      spouseLines(arena) {}

TreeViewPerson::~TreeViewPerson() {
    for (const auto& owned : spouseEdges) delete owned.second;
}

TreeViewPerson& TreeViewPerson::addPerson(int id, Persons& list, bool male) {
    list.emplace_back(id, list.get_allocator().arena());
    list.back().gender = male;
    return list.back();
}

TreeViewPerson& TreeViewPerson::addChild(int id, Persons& list, bool male) {
    return addPerson(id, list, male);
}

TreeViewPerson& TreeViewPerson::addSiblingHelper(int id, Persons& list, bool male) {
    return addPerson(id, list, male);
}

// The new person is built bare and moved in, so that a failed allocation leaves the list untouched.
TreeViewPerson& TreeViewPerson::addPerson(int id, std::vector<TreeViewPerson>& list, bool male) {
    list.emplace_back(id);
    list.back().gender = male;
    return list.back();
}

TreeViewPerson& TreeViewPerson::addChild(int id, std::vector<TreeViewPerson>& list, bool male) {
    return addPerson(id, list, male);
}

TreeViewPerson& TreeViewPerson::addSiblingHelper(int id, std::vector<TreeViewPerson>& list, bool male) {
    return addPerson(id, list, male);
}

TreeViewPerson& TreeViewPerson::addParent(int id, bool male) {
    return addPerson(id, parents, male);
}

void TreeViewPerson::setParents(int fatherId, int motherId) {
    parents.reserve(parents.size() + 2);
    setParentsFatherOnly(fatherId);
    setParentsMotherOnly(motherId);
}

void TreeViewPerson::setParentsFatherOnly(int fatherId) {
    addParent(fatherId, true);
    preferredFatherIndex = getParentCount() - 1;
}

void TreeViewPerson::setParentsMotherOnly(int motherId) {
    addParent(motherId, false);
    preferredMotherIndex = getParentCount() - 1;
}

TreeViewPerson& TreeViewPerson::addSibling(int id, bool male) {
    return addSiblingHelper(id, siblings, male);
}

TreeViewPerson& TreeViewPerson::addHalfSibling(int id, int sharedParentId, bool male) {
    TreeViewPerson& sibling = addSiblingHelper(id, siblings, male);
    sibling.parentId = sharedParentId;
    return sibling;
}

TreeViewPerson& TreeViewPerson::addSpouse(int id, bool male) {
    return addPerson(id, spouses, male);
}

TreeViewPerson& TreeViewPerson::addNonDisplayedSpouse(int id) {
    return addPerson(id, nonDisplayedSpouses, false);
}

TreeViewPerson& TreeViewPerson::addChildWithSpouse(int childId, int spouseId, bool male) {
    return addChild(childId, childrenUnder(spouseId), male);
}

TreeViewPerson& TreeViewPerson::addChildWithNoOtherSpouse(int childId, bool male) {
    return addChildWithSpouse(childId, kNoKey, male);
}

TreeViewPerson::Persons& TreeViewPerson::childrenWithSpouse(int spouseId, std::size_t more) {
    Persons& list = childrenUnder(spouseId);
    list.reserve(list.size() + more);
    return list;
}

TreeViewPerson::Persons& TreeViewPerson::childrenUnder(int key) {
    return children.try_emplace(key, arena()).first->second;
}

// An index of -1 wraps to one that no list can hold, so it fails like any other.
TreeViewPerson& TreeViewPerson::getPreferredFather() {
    return parents.at(static_cast<std::size_t>(preferredFatherIndex));
}

TreeViewPerson& TreeViewPerson::getPreferredMother() {
    return parents.at(static_cast<std::size_t>(preferredMotherIndex));
}

TreeViewPerson& TreeViewPerson::getPreferredSpouse() {
    return spouses.at(0);
}
