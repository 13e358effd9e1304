// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <vector>

#include <olvane/Export.h>
#include <olvane/graph/TreeViewPerson.h>
#include <olvane/layouter/LineRole.h>

namespace SharedTreeViewer {

// What each line of one layout is for, recorded beside the segments while they are made: role, family, child.
// A layouter records only where it was given a record (TreeViewLayouter::recordLinesIn).
//
// Persons are known by their number in the walk of the result, counted from 0. A host that lists a spouse twice
// makes the walk visit the couple's children twice; such a person has the number of the first visit, and the
// later ones take numbers too.
// Holds: the entries of a person stand in the order of its lineSegments, one for each segment.
// Fails: std::bad_alloc.
class OLVANE_API LineRecord {
public:
    static constexpr int kNone = -1;

    struct Entry {
        int family;  // place in families()
        int child;   // number of the child, or kNone for a marriage line
        int next;    // the same person's next entry, or kNone
        olvane::LineRole role;
    };
    // The man or the father first; second is kNone for a lone parent.
    struct Family {
        int first;
        int second;
        int next;  // of those that have the same later parent
    };
    struct Child {
        int family;
        int child;
    };

    // Gives the next visited person its number. All persons are numbered before the first line.
    void number(TreeViewPerson& person);

    void addMarriage(const TreeViewPerson& holder, const TreeViewPerson& person,
                     const TreeViewPerson& spouse);
    // The three pieces to one child, in the order of their making. The last two are held by the child. other
    // is null for the child of a lone parent.
    void addChildLines(const TreeViewPerson& dropHolder, const TreeViewPerson& child,
                       const TreeViewPerson& parent, const TreeViewPerson* other);

    std::size_t visits() const { return persons_.size(); }
    const std::vector<Entry>& entries() const { return entries_; }
    int firstEntryOf(const TreeViewPerson& person) const { return of(person).firstEntry; }
    // In the order of their first line; every couple and every lone parent once.
    const std::vector<Family>& families() const { return families_; }
    // Once for each time that the lines to a child were made.
    const std::vector<Child>& children() const { return children_; }

private:
    struct Person {
        int firstEntry = kNone;
        int lastEntry = kNone;
        int lastFamily = kNone;  // of those in which this is the parent with the greater number
    };

    const Person& of(const TreeViewPerson& person) const {
        return persons_[static_cast<std::size_t>(person.walkNumber())];
    }
    int familyOf(const TreeViewPerson& parent, const TreeViewPerson* other);
    void add(const TreeViewPerson& holder, int family, int child, olvane::LineRole role);

    std::vector<Person> persons_;  // by number
    std::vector<Entry> entries_;
    std::vector<Family> families_;
    std::vector<Child> children_;
};

}  // namespace SharedTreeViewer
