// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/unordered_map.hpp>

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/Export.h>

// An unknown parent, who stands where the host knows no father or no mother.
struct AddNodeValues {
    bool male = false;            // an unknown father
    std::string addNodeText;      // its own id as text: "-1", "-2", ...
    std::string childText;        // the person whose parent is unknown
    std::string otherParentText;  // that person's other parent, real or made at the same moment
};

// Between the host's ids and the keys of the graph, for the length of one request. Every person that the
// request meets gets a key, those of real persons and of unknown parents in one sequence: 0, 1, 2, ... in order of first sight.
//
// Holds: keyToPerson and personToKey mirror each other. Entries are never changed or removed, and only the
//        operations here add any.
// Fails: looking up a key that nobody has, or an id of no unknown parent, throws std::out_of_range ("Unable to find key in
//        unordered_map."). No text is refused a key.
class OLVANE_API ViewerGlue {
public:
    // A table as a hash map to look at. A layout never does, so its entries are made at the first look, and
    // at later ones those that have come since.
    template <class Key, class Value>
    class Table {
    public:
        typedef boost::unordered_map<Key, Value> Map;
        typedef void (ViewerGlue::*Filling)(Map&) const;

        Table(const ViewerGlue& glue, Filling fill) : glue_(glue), fill_(fill), map_(kLeastBuckets) {
            map_.max_load_factor(1.0f);
        }

        const Map& map() const {
            (glue_.*fill_)(map_);
            return map_;
        }
        operator const Map&() const { return map(); }

        typedef typename Map::key_type key_type;
        typedef typename Map::mapped_type mapped_type;
        typedef typename Map::value_type value_type;
        typedef typename Map::const_iterator const_iterator;
        typedef const_iterator iterator;

        // Fails as at() does: only the operations of the glue add entries.
        const Value& operator[](const Key& key) const { return at(key); }
        const_iterator cbegin() const { return begin(); }
        const_iterator cend() const { return end(); }
        std::pair<const_iterator, const_iterator> equal_range(const Key& key) const {
            return map().equal_range(key);
        }
        float load_factor() const { return map().load_factor(); }
        typename Map::const_iterator begin() const { return map().begin(); }
        typename Map::const_iterator end() const { return map_.end(); }
        typename Map::const_iterator find(const Key& key) const { return map().find(key); }
        const Value& at(const Key& key) const { return map().at(key); }
        std::size_t count(const Key& key) const { return map().count(key); }
        std::size_t size() const { return map().size(); }
        bool empty() const { return map().empty(); }
        std::size_t bucket_count() const { return map().bucket_count(); }
        float max_load_factor() const { return map_.max_load_factor(); }

    private:
        static constexpr std::size_t kLeastBuckets = 11;

        const ViewerGlue& glue_;
        Filling fill_;
        mutable Map map_;
    };

    ViewerGlue();
    ViewerGlue(const ViewerGlue&) = delete;
    ViewerGlue& operator=(const ViewerGlue&) = delete;

    // The key of a person; a new one where the text has none yet.
    int getKeyFromPerson(std::string personText);
    // The same for the decimal text of a number, without making that text.
    int keyOfNumber(int number) {
        NumberSlot& slot = slotOf(number);
        return slot.key != kNone ? slot.key : addNumber(slot, number);
    }

    // The id text under a key, and the number that it says (0 for none).
    std::string personOfKey(int key) const;
    // The same text where it lies, or written into the buffer, which must outlive what is returned.
    typedef char DecimalBuffer[11];
    std::string_view textOfKey(int key, DecimalBuffer& buffer) const;
    int numberOfKey(int key) const { return entryOfKey(key).number; }

    // The first record of an unknown parent stands; a later one for the same text is dropped.
    void addAddNodeValue(const std::string& addNodeText, bool male, const std::string& childText,
                         const std::string& otherParentText);
    AddNodeValues getAddNodeValue(std::string personText) const;
    // The same by keys, without making the texts.
    void addAddNode(int key, bool male, int childKey, int otherParentKey);
    bool addNodeIsMale(int key) const;
    std::string childTextOfAddNode(int key) const;
    int childNumberOfAddNode(int key) const;  // the number that the child's text says

    Table<int, std::string> keyToPerson;
    Table<std::string, int> personToKey;
    Table<std::string, AddNodeValues> addNodes;

private:
    static constexpr int kNone = -1;

    struct KeyEntry {
        int number;
        int addNode;                        // into records_
        const std::string* nonCanonicalId;  // null where the text is the plain decimal form of the number
    };
    struct AddNodeRecord {
        int key;
        int childKey;
        int otherParentKey;
        bool male;
    };
    struct NumberSlot {
        int number = 0;
        int key = kNone;
    };

    const KeyEntry& entryOfKey(int key) const {
        if (static_cast<std::size_t>(key) >= entries_.size())
            failToFind();  // no list is as long as a key below 0
        return entries_[static_cast<std::size_t>(key)];
    }
    // The slot that holds the number, or the empty one where it belongs.
    NumberSlot& slotOf(int number) { return slots_[placeOf(number)]; }
    const NumberSlot& slotOf(int number) const { return slots_[placeOf(number)]; }
    std::size_t placeOf(int number) const {
        std::size_t place = scattered(number) & slotMask_;
        while (slots_[place].key != kNone && slots_[place].number != number) place = (place + 1) & slotMask_;
        return place;
    }
    static std::size_t scattered(int number) {
        const std::uint64_t product = static_cast<std::uint32_t>(number) * std::uint64_t{0x9E3779B97F4A7C15};
        return static_cast<std::size_t>(product >> 32);
    }

    [[noreturn]] static void failToFind();
    int addNumber(NumberSlot& slot, int number);
    int addEntry(int number, const std::string* nonCanonicalId) {
        const int key = static_cast<int>(entries_.size());
        entries_.push_back(KeyEntry{number, kNone, nonCanonicalId});
        return key;
    }
    void growSlots();
    int knownKeyOf(const std::string& personText) const;
    const AddNodeRecord* recordOfKey(int key) const;
    const AddNodeValues& textAddNode(const std::string& personText) const;
    AddNodeValues valuesOf(const AddNodeRecord& record) const;

    void fillKeyToPerson(boost::unordered_map<int, std::string>& map) const;
    void fillPersonToKey(boost::unordered_map<std::string, int>& map) const;
    void fillAddNodes(boost::unordered_map<std::string, AddNodeValues>& map) const;

    std::vector<KeyEntry> entries_;  // by key
    std::vector<NumberSlot> slots_;  // a power of two; open addressing, one step at a time
    std::size_t slotMask_;           // their number less one
    std::size_t usedSlots_ = 0;
    boost::unordered_map<std::string, int> nonCanonicalIds_;  // to keys
    std::vector<AddNodeRecord> records_;
    boost::unordered_map<std::string, AddNodeValues> textAddNodes_;  // those that came as texts
};
