// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/unordered_map.hpp>

#include <memory_resource>
#include <string>
#include <vector>

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
// Holds: keyToPerson and personToKey mirror each other. Entries are never changed or removed, and only the
//        operations here add any.
// Fails: a look-up of an unknown key or add-node throws std::out_of_range ("Unable to find key in
//        unordered_map."). No text is refused a key.
class OLVANE_API ViewerGlue {
private:
    // The tables' entries lie in blocks that go all at once. Declared ahead of the tables, so destroyed after
    // them.
    std::pmr::monotonic_buffer_resource blocks_;

public:
    template <class Key, class Value>
    using Table = boost::unordered_map<Key, Value, boost::hash<Key>, std::equal_to<Key>,
                                       std::pmr::polymorphic_allocator<std::pair<const Key, Value>>>;

    ViewerGlue();
    ViewerGlue(const ViewerGlue&) = delete;
    ViewerGlue& operator=(const ViewerGlue&) = delete;

    // The key of a person; a new one where the text has none yet.
    int getKeyFromPerson(std::string personText);
    // The same for the decimal text of a number, without making that text where the number has been seen.
    int keyOfNumber(int id);

    // The first record of a text stands; a later one for the same text is dropped.
    void addAddNodeValue(const std::string& addNodeText, bool male, const std::string& childText,
                         const std::string& otherParentText);
    AddNodeValues getAddNodeValue(std::string personText) const;
    // The same record where it lies.
    const AddNodeValues& addNode(const std::string& personText) const;

    // The id text under a key, and the number that it says (0 for none).
    const std::string& personOfKey(int key) const { return entryOfKey(key).text(); }
    int numberOfKey(int key) const { return entryOfKey(key).number; }

    Table<int, std::string> keyToPerson;
    Table<std::string, int> personToKey;
    Table<std::string, AddNodeValues> addNodes;

private:
    // What is asked over and over, by key: the entry of keyToPerson, and its number.
    struct KeyEntry {
        const std::string* personText;
        int number;
        const std::string& text() const { return *personText; }
    };
    // A slot of the table from numbers to keys, which answers ahead of personToKey.
    struct NumberSlot {
        int number = 0;
        int key = kNoSlot;
    };
    static constexpr int kNoSlot = -1;

    const KeyEntry& entryOfKey(int key) const;
    int addEntry(const std::string& personText, int number);
    NumberSlot& slotOf(int number);
    void growSlots();

    std::vector<KeyEntry> entries_;  // by key
    std::vector<NumberSlot> slots_;  // a power of two; open addressing, one step at a time
    std::size_t usedSlots_ = 0;
};
