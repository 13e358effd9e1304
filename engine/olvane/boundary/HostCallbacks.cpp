// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The road from the layouters to the data source: keys to ids and back, records from lists, and add-nodes
// where a parent is not known.
//
// Nothing is remembered from one call to the next. A person with an unknown parent gets a new add-node at
// every look, also where only hasParents wanted to know; the ids of those that were only looked at are never
// drawn. Keeping the first answer would hand out fewer keys, and children who are met later would change
// their order.
//
// An id that a host's list holds is cut to 32 bits once, as it is read; that number is what later questions
// send.

#include <olvane/boundary/LayoutPieces.h>

#include <olvane/boundary/HostText.h>

#include <cstdint>
#include <stdexcept>

namespace {

typedef std::shared_ptr<OlvaneViewerManagerWrapProtocol> ManagerReference;

// The next synthetic id. It only falls, one at a time; each thread counts its own, so that hosts may lay out
// on several threads at once.
thread_local int ADD_PARENT_ID = -1;

int lowBits(std::int64_t hostId) {
    return static_cast<int>(static_cast<std::uint32_t>(static_cast<std::uint64_t>(hostId)));
}

OlvaneViewerManagerWrapProtocol& host(const ManagerReference& manager) {
    if (!manager) throw std::invalid_argument("no data source");
    return *manager;
}

// The host's id under a key. Ids below 1 mark synthetic persons, of whom the host is never asked.
int hostId(const ViewerGlue& glue, int key) {
    return stringToInt(glue.personOfKey(key));
}

// One parent's slot: the parent's id text, whose key has been written to the slot.
struct ParentSlot {
    bool isReal;
    std::string personText;
};

ParentSlot fillSlot(ViewerGlue& glue, std::int64_t answer, int& slot) {
    const bool isReal = answer != OlvaneViewerManagerWrapProtocol::kPersonNotFound;
    ParentSlot parent{isReal, intToString(isReal ? lowBits(answer) : ADD_PARENT_ID)};
    slot = glue.getKeyFromPerson(parent.personText);
    if (!isReal) --ADD_PARENT_ID;
    return parent;
}

void getParents(ViewerGlue& glue, const ManagerReference& manager, int key, int& father, int& mother) {
    const std::string personText = glue.personOfKey(key);
    const int id = stringToInt(personText);
    if (id < 1) return;
    const ParentSlot fatherSlot = fillSlot(glue, host(manager).fatherForPersonWithID(id), father);
    const ParentSlot motherSlot = fillSlot(glue, host(manager).motherForPersonWithID(id), mother);
    if (!fatherSlot.isReal) {
        glue.addAddNodeValue(fatherSlot.personText, true, personText, motherSlot.personText);
    }
    if (!motherSlot.isReal) {
        glue.addAddNodeValue(motherSlot.personText, false, personText, fatherSlot.personText);
    }
}

void getSpouses(ViewerGlue& glue, const ManagerReference& manager, int key, SpouseSet& spouses) {
    const int id = hostId(glue, key);
    if (id < 1) return;
    int place = 0;
    for (const std::int64_t entry : host(manager).spousesForPersonWithID(id)) {
        const int spouseId = lowBits(entry);
        const std::string spouseText = intToString(spouseId);
        const int spouseKey = glue.getKeyFromPerson(spouseText);
        const bool preferred = host(manager).isPreferredSpouse(id, spouseId);
        const bool alive = !host(manager).isPersonDead(spouseId);
        const std::string date = stringToString(host(manager).dateForPersonWithID(spouseId, false));
        spouses.insert(SpouseAdapter(spouseKey, preferred, alive, date, spouseText, ++place));
    }
}

// An add-node has one child: the person for whom it stands.
void getChildOfAddNode(ViewerGlue& glue, int key, ChildrenSet& children) {
    const AddNodeValues addNode = glue.getAddNodeValue(glue.personOfKey(key));
    if (addNode.childText.empty()) return;
    const int childKey = glue.getKeyFromPerson(addNode.childText);
    children.insert(ChildrenAdapter(childKey, std::string(), addNode.childText));
}

void getChildren(ViewerGlue& glue, const ManagerReference& manager, int key, ChildrenSet& children) {
    const int id = hostId(glue, key);
    if (id < 1) {
        getChildOfAddNode(glue, key, children);
        return;
    }
    int place = 0;
    for (const std::int64_t entry : host(manager).childrenForPersonWithID(id)) {
        const int childId = lowBits(entry);
        const std::string childText = intToString(childId);
        const int childKey = glue.getKeyFromPerson(childText);
        const std::string date = stringToString(host(manager).dateForPersonWithID(childId, true));
        children.insert(ChildrenAdapter(childKey, date, childText, ++place));
    }
}

bool isMale(const ViewerGlue& glue, const ManagerReference& manager, int key) {
    const int id = hostId(glue, key);
    if (id >= 1) return host(manager).sexOfPersonWithID(id) == 0;
    return glue.getAddNodeValue(glue.personOfKey(key)).male;
}

// The writer of the result tests for an id below 0 instead. The two differ for the id 0 alone, which is
// synthetic here and has no suffix there; hosts' parsers count on the suffix standing with negative ids only.
bool isAddNode(const ViewerGlue& glue, int key) {
    return key < 0 || hostId(glue, key) < 1;
}

}  // namespace

namespace olvane {

HostCallbacks::HostCallbacks(ViewerGlue& glue, const ManagerReference& manager)
    : getParents([&glue, &manager](int key, int& father, int& mother) {
          ::getParents(glue, manager, key, father, mother);
      }),
      getSpouses([&glue, &manager](int key, SpouseSet& set) { ::getSpouses(glue, manager, key, set); }),
      getChildren([&glue, &manager](int key, ChildrenSet& set) { ::getChildren(glue, manager, key, set); }),
      isMale([&glue, &manager](int key) { return ::isMale(glue, manager, key); }),
      isAddNode([&glue](int key) { return ::isAddNode(glue, key); }),
      touchPerson([&glue](int key) { glue.personOfKey(key); }) {}

DataAdapter HostCallbacks::dataAdapter() const {
    return DataAdapter(getSpouses, getParents, getChildren, isMale, isAddNode, touchPerson);
}

void resetAddParentId() {
    ADD_PARENT_ID = -1;
}

}  // namespace olvane
