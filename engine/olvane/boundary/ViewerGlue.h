// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/unordered_map.hpp>

#include <string>

#include <olvane/Export.h>

// A synthetic person that stands where the host knows no father or no mother.
struct AddNodeValues {
    bool male = false;            // a missing father
    std::string addNodeText;      // its own id as text: "-1", "-2", ...
    std::string childText;        // the person whose parent is missing
    std::string otherParentText;  // that person's other parent, real or made at the same moment
};

// Between the host's ids and the keys of the graph, for the length of one request. Every person that the
// request meets gets a key, real and synthetic ones in one sequence: 0, 1, 2, ... in order of first sight.
//
// Holds: keyToPerson and personToKey mirror each other. Entries are never changed or removed.
// Fails: a look-up of an unknown key or add-node throws std::out_of_range ("Unable to find key in
//        unordered_map."). No text is refused a key.
class OLVANE_API ViewerGlue {
public:
    ViewerGlue();
    ViewerGlue(const ViewerGlue&) = delete;
    ViewerGlue& operator=(const ViewerGlue&) = delete;

    // The key of a person; a new one where the text has none yet.
    int getKeyFromPerson(std::string personText);
    // The first record of a text stands; a later one for the same text is dropped.
    void addAddNodeValue(const std::string& addNodeText, bool male, const std::string& childText,
                         const std::string& otherParentText);
    AddNodeValues getAddNodeValue(std::string personText) const;
    // The id text under a key.
    const std::string& personOfKey(int key) const;

    boost::unordered_map<int, std::string> keyToPerson;
    boost::unordered_map<std::string, int> personToKey;
    boost::unordered_map<std::string, AddNodeValues> addNodes;
};
