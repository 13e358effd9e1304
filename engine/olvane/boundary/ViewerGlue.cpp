// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Keys by first sight, and the records of unknown parents.
//
// A layout asks about eleven questions for each record that it writes, each begins with a key or a number,
// and most of the unknown parents that it makes are never drawn. So all is kept as numbers: an array by key, and a
// hash from numbers to keys. Texts are made when somebody looks. A number stands for its plain decimal text
// alone; "017" and "17" are two persons with one number, and such odd texts are kept apart.

#include <olvane/boundary/ViewerGlue.h>

#include <olvane/boundary/DecimalInternal.h>
#include <olvane/boundary/HostText.h>

#include <stdexcept>

namespace {

constexpr std::size_t kFirstSlots = 256;  // at most half of them full
constexpr std::size_t kFirstAddNodes = 32;

}  // namespace

ViewerGlue::ViewerGlue()
    : keyToPerson(*this, &ViewerGlue::fillKeyToPerson),
      personToKey(*this, &ViewerGlue::fillPersonToKey),
      addNodes(*this, &ViewerGlue::fillAddNodes),
      slots_(kFirstSlots),
      slotMask_(kFirstSlots - 1) {
    entries_.reserve(kFirstSlots / 2);
}

int ViewerGlue::getKeyFromPerson(std::string personText) {
    const int number = stringToInt(personText);
    if (personText == intToString(number)) return keyOfNumber(number);
    const auto known = nonCanonicalIds_.find(personText);
    if (known != nonCanonicalIds_.end()) return known->second;
    const auto entry = nonCanonicalIds_.emplace(personText, static_cast<int>(entries_.size())).first;
    return addEntry(number, &entry->first);
}

int ViewerGlue::addNumber(NumberSlot& slot, int number) {
    const int key = addEntry(number, nullptr);
    slot = NumberSlot{number, key};
    if (++usedSlots_ * 2 > slots_.size()) growSlots();
    return key;
}

void ViewerGlue::failToFind() {
    throw std::out_of_range("Unable to find key in unordered_map.");
}

void ViewerGlue::growSlots() {
    std::vector<NumberSlot> smaller(slots_.size() * 2);
    smaller.swap(slots_);
    slotMask_ = slots_.size() - 1;
    for (const NumberSlot& slot : smaller) {
        if (slot.key != kNone) slotOf(slot.number) = slot;
    }
}

std::string ViewerGlue::personOfKey(int key) const {
    DecimalBuffer buffer;
    return std::string(textOfKey(key, buffer));
}

std::string_view ViewerGlue::textOfKey(int key, DecimalBuffer& buffer) const {
    static_assert(sizeof buffer >= olvane::kLongestDecimal);
    const KeyEntry& entry = entryOfKey(key);
    if (entry.nonCanonicalId != nullptr) return *entry.nonCanonicalId;
    return std::string_view(buffer,
                            static_cast<std::size_t>(olvane::writeDecimal(buffer, entry.number) - buffer));
}

// kNone for a text that has no key.
int ViewerGlue::knownKeyOf(const std::string& personText) const {
    const int number = stringToInt(personText);
    if (personText == intToString(number)) return slotOf(number).key;
    const auto known = nonCanonicalIds_.find(personText);
    return known != nonCanonicalIds_.end() ? known->second : kNone;
}

void ViewerGlue::addAddNodeValue(const std::string& addNodeText, bool male, const std::string& childText,
                                 const std::string& otherParentText) {
    const int key = knownKeyOf(addNodeText);
    if (key != kNone && recordOfKey(key) != nullptr) return;
    textAddNodes_.emplace(addNodeText, AddNodeValues{male, addNodeText, childText, otherParentText});
}

void ViewerGlue::addAddNode(int key, bool male, int childKey, int otherParentKey) {
    if (recordOfKey(key) != nullptr) return;
    if (!textAddNodes_.empty() && textAddNodes_.count(personOfKey(key)) != 0) return;
    if (records_.empty()) records_.reserve(kFirstAddNodes);
    records_.push_back(AddNodeRecord{key, childKey, otherParentKey, male});
    entries_[static_cast<std::size_t>(key)].addNode = static_cast<int>(records_.size()) - 1;
}

AddNodeValues ViewerGlue::getAddNodeValue(std::string personText) const {
    const int key = knownKeyOf(personText);
    const AddNodeRecord* const record = key != kNone ? recordOfKey(key) : nullptr;
    return record != nullptr ? valuesOf(*record) : textAddNode(personText);
}

bool ViewerGlue::addNodeIsMale(int key) const {
    const AddNodeRecord* const record = recordOfKey(key);
    return record != nullptr ? record->male : textAddNode(personOfKey(key)).male;
}

std::string ViewerGlue::childTextOfAddNode(int key) const {
    const AddNodeRecord* const record = recordOfKey(key);
    return record != nullptr ? personOfKey(record->childKey) : textAddNode(personOfKey(key)).childText;
}

int ViewerGlue::childNumberOfAddNode(int key) const {
    const AddNodeRecord* const record = recordOfKey(key);
    return record != nullptr ? numberOfKey(record->childKey) : stringToInt(childTextOfAddNode(key));
}

// Null where the unknown parent came as text, or where there is none.
const ViewerGlue::AddNodeRecord* ViewerGlue::recordOfKey(int key) const {
    const int place = entryOfKey(key).addNode;
    return place != kNone ? &records_[static_cast<std::size_t>(place)] : nullptr;
}

const AddNodeValues& ViewerGlue::textAddNode(const std::string& personText) const {
    const auto entry = textAddNodes_.find(personText);
    if (entry == textAddNodes_.end()) failToFind();
    return entry->second;
}

AddNodeValues ViewerGlue::valuesOf(const AddNodeRecord& record) const {
    return AddNodeValues{record.male, personOfKey(record.key), personOfKey(record.childKey),
                         personOfKey(record.otherParentKey)};
}

void ViewerGlue::fillKeyToPerson(boost::unordered_map<int, std::string>& map) const {
    for (int key = static_cast<int>(map.size()); static_cast<std::size_t>(key) < entries_.size(); ++key) {
        map.emplace(key, personOfKey(key));
    }
}

void ViewerGlue::fillPersonToKey(boost::unordered_map<std::string, int>& map) const {
    for (int key = static_cast<int>(map.size()); static_cast<std::size_t>(key) < entries_.size(); ++key) {
        map.emplace(personOfKey(key), key);
    }
}

// An unknown parent is in one of the two collections, so as many entries as both have together is all of them.
void ViewerGlue::fillAddNodes(boost::unordered_map<std::string, AddNodeValues>& map) const {
    if (map.size() == records_.size() + textAddNodes_.size()) return;
    for (const AddNodeRecord& record : records_) map.emplace(personOfKey(record.key), valuesOf(record));
    for (const auto& entry : textAddNodes_) map.insert(entry);
}
