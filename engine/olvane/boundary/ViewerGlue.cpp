// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Keys by first sight, and the records of add-nodes.

#include <olvane/boundary/ViewerGlue.h>

#include <stdexcept>

namespace {

constexpr std::size_t kLeastBuckets = 11;

template <class Table, class Key>
const typename Table::mapped_type& entryOf(const Table& table, const Key& key) {
    const auto entry = table.find(key);
    if (entry == table.end()) throw std::out_of_range("Unable to find key in unordered_map.");
    return entry->second;
}

}  // namespace

ViewerGlue::ViewerGlue() : keyToPerson(kLeastBuckets), personToKey(kLeastBuckets), addNodes(kLeastBuckets) {
    keyToPerson.max_load_factor(1.0f);
    personToKey.max_load_factor(1.0f);
    addNodes.max_load_factor(1.0f);
}

int ViewerGlue::getKeyFromPerson(std::string personText) {
    const auto known = personToKey.find(personText);
    if (known != personToKey.end()) return known->second;
    const int key = static_cast<int>(keyToPerson.size());
    keyToPerson.emplace(key, personText);
    personToKey.emplace(personText, key);
    return key;
}

void ViewerGlue::addAddNodeValue(const std::string& addNodeText, bool male, const std::string& childText,
                                 const std::string& otherParentText) {
    if (addNodes.find(addNodeText) != addNodes.end()) return;
    addNodes.emplace(addNodeText, AddNodeValues{male, addNodeText, childText, otherParentText});
}

AddNodeValues ViewerGlue::getAddNodeValue(std::string personText) const {
    return entryOf(addNodes, personText);
}

const std::string& ViewerGlue::personOfKey(int key) const {
    return entryOf(keyToPerson, key);
}
