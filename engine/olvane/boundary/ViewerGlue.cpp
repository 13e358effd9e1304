// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Keys by first sight, and the records of add-nodes.
//
// A layout asks about eleven questions for each record that it writes, and each begins with a key or a
// number. So the tables of texts are kept true, but two small indexes answer first: an array by key, and a
// hash from numbers to keys. A number's slot stands for its plain decimal text alone; "017" and "17" are two
// persons with one number.

#include <olvane/boundary/ViewerGlue.h>

#include <olvane/boundary/HostText.h>

#include <cstdint>
#include <stdexcept>

namespace {

constexpr std::size_t kLeastBuckets = 11;
constexpr std::size_t kFirstSlots = 64;

[[noreturn]] void failToFind() {
    throw std::out_of_range("Unable to find key in unordered_map.");
}

std::size_t scattered(int number) {
    const std::uint64_t product = static_cast<std::uint32_t>(number) * std::uint64_t{0x9E3779B97F4A7C15};
    return static_cast<std::size_t>(product >> 32);
}

}  // namespace

ViewerGlue::ViewerGlue()
    : keyToPerson(kLeastBuckets, &blocks_),
      personToKey(kLeastBuckets, &blocks_),
      addNodes(kLeastBuckets, &blocks_),
      slots_(kFirstSlots) {
    keyToPerson.max_load_factor(1.0f);
    personToKey.max_load_factor(1.0f);
    addNodes.max_load_factor(1.0f);
}

int ViewerGlue::getKeyFromPerson(std::string personText) {
    const int number = stringToInt(personText);
    if (personText == intToString(number)) return keyOfNumber(number);
    const auto known = personToKey.find(personText);
    return known != personToKey.end() ? known->second : addEntry(personText, number);
}

int ViewerGlue::keyOfNumber(int id) {
    NumberSlot& slot = slotOf(id);
    if (slot.key != kNoSlot) return slot.key;
    const int key = addEntry(intToString(id), id);
    slot = NumberSlot{id, key};
    if (++usedSlots_ * 2 > slots_.size()) growSlots();
    return key;
}

int ViewerGlue::addEntry(const std::string& personText, int number) {
    const int key = static_cast<int>(keyToPerson.size());
    const auto entry = keyToPerson.emplace(key, personText).first;
    personToKey.emplace(personText, key);
    entries_.push_back(KeyEntry{&entry->second, number});
    return key;
}

// The slot that holds the number, or the empty one where it belongs.
ViewerGlue::NumberSlot& ViewerGlue::slotOf(int number) {
    const std::size_t mask = slots_.size() - 1;
    std::size_t place = scattered(number) & mask;
    while (slots_[place].key != kNoSlot && slots_[place].number != number) place = (place + 1) & mask;
    return slots_[place];
}

void ViewerGlue::growSlots() {
    std::vector<NumberSlot> smaller(slots_.size() * 2);
    smaller.swap(slots_);
    for (const NumberSlot& slot : smaller) {
        if (slot.key != kNoSlot) slotOf(slot.number) = slot;
    }
}

void ViewerGlue::addAddNodeValue(const std::string& addNodeText, bool male, const std::string& childText,
                                 const std::string& otherParentText) {
    if (addNodes.find(addNodeText) != addNodes.end()) return;
    addNodes.emplace(addNodeText, AddNodeValues{male, addNodeText, childText, otherParentText});
}

AddNodeValues ViewerGlue::getAddNodeValue(std::string personText) const {
    return addNode(personText);
}

const AddNodeValues& ViewerGlue::addNode(const std::string& personText) const {
    const auto entry = addNodes.find(personText);
    if (entry == addNodes.end()) failToFind();
    return entry->second;
}

const ViewerGlue::KeyEntry& ViewerGlue::entryOfKey(int key) const {
    if (key < 0 || static_cast<std::size_t>(key) >= entries_.size()) failToFind();
    return entries_[static_cast<std::size_t>(key)];
}
