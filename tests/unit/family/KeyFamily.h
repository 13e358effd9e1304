// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include <olvane/adapters/DataAdapter.h>

namespace views {

// A family stated by keys, behind the six callbacks of a layouter, so that one act can be run on a graph that a
// test builds by hand.
//
// Holds: a person of whom nothing is said has no relatives, is a woman and is real. A parent of -1 is left at
//        what the caller set. The child of an unknown parent comes without a place in a list and without a date.
class KeyFamily {
public:
    typedef std::vector<int> Keys;

    std::map<int, Keys> spouses;
    std::map<int, Keys> children;
    std::map<int, std::pair<int, int>> parents;  // (father, mother)
    std::set<int> men;
    std::set<int> addNodes;

    // The questions asked, in order, such as "getSpouses 3". isAddNode is not among them: it never reaches a
    // data source.
    Keys touched;
    std::vector<std::string> questions;

    KeyFamily() = default;
    KeyFamily(const KeyFamily&) = delete;
    KeyFamily& operator=(const KeyFamily&) = delete;

    // Callbacks that point to this family, which must outlive them.
    DataAdapter adapter();

    bool wasAsked(const std::string& question) const;

private:
    void answerSpouses(int key, SpouseSet& answer);
    void answerParents(int key, int& father, int& mother);
    void answerChildren(int key, ChildrenSet& answer);
};

}  // namespace views
