// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Entries are chained by the person that holds the segments, and each family is there once.
//
// A spouse is numbered after the person that it hangs from, and a mother after the father, so the parent with
// the greater number has hardly ever a second family: the search for a family looks at one.

#include <olvane/layouter/LineRecordInternal.h>

#include <algorithm>
#include <utility>

namespace SharedTreeViewer {

using olvane::LineRole;

// Most persons have a bar and a stem of their own and a drop or a marriage line.
void LineRecord::reserve(std::size_t persons) {
    persons_.reserve(persons);
    entries_.reserve(persons * 2);
    children_.reserve(persons);
    families_.reserve(persons / 2);
}

inline void LineRecord::addChild(Family& family, int child) {
    const int place = static_cast<int>(children_.size());
    children_.push_back({child, kNone});
    if (family.lastChild == kNone) {
        family.firstChild = place;
    } else {
        children_[static_cast<std::size_t>(family.lastChild)].next = place;
    }
    family.lastChild = place;
}

inline void LineRecord::add(const TreeViewPerson& holder, const Entry& entry) {
    const int place = static_cast<int>(entries_.size());
    entries_.push_back(entry);
    segments_ += entry.segments;
    Person& person = persons_[static_cast<std::size_t>(holder.walkNumber())];
    if (person.lastEntry == kNone) {
        person.firstEntry = place;
    } else {
        entries_[static_cast<std::size_t>(person.lastEntry)].next = place;
    }
    person.lastEntry = place;
}

void LineRecord::addMarriage(const TreeViewPerson& holder, const TreeViewPerson& person,
                             const TreeViewPerson& spouse) {
    add(holder, {familyOf(person, &spouse), kNone, kNone, LineRole::marriage, 1});
}

void LineRecord::addChildLines(const TreeViewPerson& dropHolder, const TreeViewPerson& child,
                               const TreeViewPerson& parent, const TreeViewPerson* other) {
    const int family = familyOf(parent, other);
    const int number = child.walkNumber();
    addChild(families_[static_cast<std::size_t>(family)], number);
    if (&dropHolder == &child) {
        add(child, {family, number, kNone, LineRole::drop, 3});
    } else {
        add(dropHolder, {family, number, kNone, LineRole::drop, 1});
        add(child, {family, number, kNone, LineRole::bar, 2});
    }
}

int LineRecord::familyOf(const TreeViewPerson& parent, const TreeViewPerson* other) {
    int first = parent.walkNumber();
    int second = other != nullptr ? other->walkNumber() : kNone;
    const int greater = std::max(first, second);
    if (other != nullptr && !parent.gender && other->gender) std::swap(first, second);
    int& newest = persons_[static_cast<std::size_t>(greater)].lastFamily;
    for (int place = newest; place != kNone;) {
        const Family& family = families_[static_cast<std::size_t>(place)];
        if (family.first == first && family.second == second) return place;
        place = family.next;
    }
    families_.push_back({first, second, newest, kNone, kNone});
    newest = static_cast<int>(families_.size()) - 1;
    return newest;
}

}  // namespace SharedTreeViewer
