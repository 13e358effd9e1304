// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
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
// Holds: the entries of a person stand in the order of its lineSegments, and together cover each segment once.
// Fails: std::bad_alloc.
class OLVANE_API LineRecord {
public:
    static constexpr int kNone = -1;

    // Segments side by side in one person's list, of one family and one child.
    struct Entry {
        int family;              // place in families()
        int child;               // number of the child, or kNone for a marriage line
        int next;                // the same person's next entry, or kNone
        olvane::LineRole first;  // of the first segment; the next ones have the next roles
        std::uint8_t segments;
    };
    // The man or the father first; second is kNone for a lone parent.
    struct Family {
        int first;
        int second;
        int next;        // of those that have the same later parent
        int firstChild;  // places in children(), or kNone
        int lastChild;
    };
    struct Child {
        int child;  // its number
        int next;   // the same family's next child, or kNone
    };

    // Gives the next visited person its number. All persons are numbered before the first line. Room for them
    // is made ahead where about how many there are is known.
    void reserve(std::size_t persons);
    void number(TreeViewPerson& person) {
        if (person.walkNumber() == kNone) {
            person.setWalkNumber(static_cast<int>(persons_.size()));
        } else {
            hasRepeatedVisits_ = true;
        }
        persons_.emplace_back().visited = &person;
    }

    void addMarriage(const TreeViewPerson& holder, const TreeViewPerson& person,
                     const TreeViewPerson& spouse);
    // The three pieces to one child, in the order of their making. The last two are held by the child. other
    // is null for the child of a lone parent.
    void addChildLines(const TreeViewPerson& dropHolder, const TreeViewPerson& child,
                       const TreeViewPerson& parent, const TreeViewPerson* other);

    std::size_t visits() const { return persons_.size(); }
    // Whom the walk visits as the nth. Persons are not moved any more once they are numbered.
    const TreeViewPerson& visited(std::size_t n) const { return *persons_[n].visited; }
    bool hasRepeatedVisits() const { return hasRepeatedVisits_; }
    const std::vector<Entry>& entries() const { return entries_; }
    int firstEntryOf(const TreeViewPerson& person) const { return of(person).firstEntry; }
    std::size_t segments() const { return segments_; }
    // In the order of their first line; every couple and every lone parent once.
    const std::vector<Family>& families() const { return families_; }
    // Once for each time that the lines to a child were made: a person whom the walk visits twice may stand twice.
    const std::vector<Child>& children() const { return children_; }

private:
    struct Person {
        const TreeViewPerson* visited = nullptr;
        int firstEntry = kNone;
        int lastEntry = kNone;
        int lastFamily = kNone;  // of those in which this is the parent with the greater number
    };

    const Person& of(const TreeViewPerson& person) const {
        return persons_[static_cast<std::size_t>(person.walkNumber())];
    }
    int familyOf(const TreeViewPerson& parent, const TreeViewPerson* other);
    void add(const TreeViewPerson& holder, const Entry& entry);
    void addChild(Family& family, int child);

    std::vector<Person> persons_;  // by number, and so in the order of the walk
    std::vector<Entry> entries_;
    std::vector<Family> families_;
    std::vector<Child> children_;
    std::size_t segments_ = 0;
    bool hasRepeatedVisits_ = false;
};

}  // namespace SharedTreeViewer
