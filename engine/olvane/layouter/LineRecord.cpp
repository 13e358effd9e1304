// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One entry for each segment, chained by the person that holds it, and each family once.
//
// A spouse is numbered after the person that it hangs from, and a mother after the father, so the parent with
// the greater number has hardly ever a second family: the search for a family looks at one.

#include <olvane/layouter/LineRecord.h>

#include <algorithm>
#include <utility>

namespace SharedTreeViewer {

using olvane::LineRole;

void LineRecord::number(TreeViewPerson& person) {
    if (person.walkNumber() == kNone) person.setWalkNumber(static_cast<int>(persons_.size()));
    persons_.emplace_back();
}

void LineRecord::addMarriage(const TreeViewPerson& holder, const TreeViewPerson& person,
                             const TreeViewPerson& spouse) {
    add(holder, familyOf(person, &spouse), kNone, LineRole::marriage);
}

void LineRecord::addChildLines(const TreeViewPerson& dropHolder, const TreeViewPerson& child,
                               const TreeViewPerson& parent, const TreeViewPerson* other) {
    const int family = familyOf(parent, other);
    const int number = child.walkNumber();
    children_.push_back({family, number});
    add(dropHolder, family, number, LineRole::drop);
    add(child, family, number, LineRole::bar);
    add(child, family, number, LineRole::stem);
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
    families_.push_back({first, second, newest});
    newest = static_cast<int>(families_.size()) - 1;
    return newest;
}

void LineRecord::add(const TreeViewPerson& holder, int family, int child, LineRole role) {
    const int place = static_cast<int>(entries_.size());
    entries_.push_back({family, child, kNone, role});
    Person& person = persons_[static_cast<std::size_t>(holder.walkNumber())];
    if (person.lastEntry == kNone) {
        person.firstEntry = place;
    } else {
        entries_[static_cast<std::size_t>(person.lastEntry)].next = place;
    }
    person.lastEntry = place;
}

}  // namespace SharedTreeViewer
