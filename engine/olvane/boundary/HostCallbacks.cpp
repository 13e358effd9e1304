// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The path from the layouters to the data source: keys to ids and back, records from lists, and unknown parents
// where a parent is not known.
//
// Nothing is remembered from one call to the next. A person without a known parent gets a new unknown parent at
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
#include <string_view>

namespace {

typedef std::shared_ptr<OlvaneViewerManagerWrapProtocol> ManagerReference;

// The next negative id. It only falls, one at a time; each thread counts its own, so that hosts may lay out
// on several threads at once.
thread_local int ADD_PARENT_ID = -1;

int lowBits(std::int64_t hostId) {
    return static_cast<int>(static_cast<std::uint32_t>(static_cast<std::uint64_t>(hostId)));
}

OlvaneViewerManagerWrapProtocol& host(const ManagerReference& manager) {
    if (!manager) throw std::invalid_argument("no data source");
    return *manager;
}

// A parent's key, and whether the host knows that parent.
struct Parent {
    bool isReal;
    int key;
};

Parent parentOf(ViewerGlue& glue, std::int64_t answer) {
    if (answer != OlvaneViewerManagerWrapProtocol::kPersonNotFound) {
        return Parent{true, glue.keyOfNumber(lowBits(answer))};
    }
    const int key = glue.keyOfNumber(ADD_PARENT_ID);
    --ADD_PARENT_ID;
    return Parent{false, key};
}

// Ids below 1 mark unknown parents, of whom the host is never asked.
void getParents(ViewerGlue& glue, const ManagerReference& manager, int key, int& father, int& mother) {
    const int id = glue.numberOfKey(key);
    if (id < 1) return;
    OlvaneViewerManagerWrapProtocol& source = host(manager);
    const Parent first = parentOf(glue, source.fatherForPersonWithID(id));
    father = first.key;
    const Parent second = parentOf(glue, source.motherForPersonWithID(id));
    mother = second.key;
    if (!first.isReal) glue.addAddNode(first.key, true, key, second.key);
    if (!second.isReal) glue.addAddNode(second.key, false, key, first.key);
}

void getSpouses(ViewerGlue& glue, const ManagerReference& manager, int key, SpouseSet& spouses) {
    const int id = glue.numberOfKey(key);
    if (id < 1) return;
    // Places follow one another, so in a set that was empty each record comes last. Records that were there before
    // may lack a place, and then the way by which a record comes in decides where it goes.
    const bool endFirst = spouses.empty();
    OlvaneViewerManagerWrapProtocol& source = host(manager);
    int place = 0;
    const auto addEntry = [&](std::int64_t entry) {
        const int spouseId = lowBits(entry);
        const int spouseKey = glue.keyOfNumber(spouseId);
        const bool preferred = source.isPreferredSpouse(id, spouseId);
        const bool alive = !source.isPersonDead(spouseId);
        const std::string date = source.dateForPersonWithID(spouseId, false);
        ViewerGlue::DecimalBuffer buffer;
        const std::string_view text = glue.textOfKey(spouseKey, buffer);
        ++place;
        if (endFirst) {
            spouses.emplace_hint(spouses.end(), spouseKey, preferred, alive, firstCharacterOf(date), text,
                                 place);
        } else {
            spouses.emplace(spouseKey, preferred, alive, firstCharacterOf(date), text, place);
        }
    };
    source.visitSpousesOfPerson(id, PersonIdVisitor(addEntry));
}

// An unknown parent has one child: the person for whom it stands.
void getChildOfAddNode(ViewerGlue& glue, int key, ChildrenSet& children) {
    const std::string childText = glue.childTextOfAddNode(key);
    if (childText.empty()) return;
    children.insert(ChildrenAdapter(glue.getKeyFromPerson(childText), std::string(), childText));
}

void getChildren(ViewerGlue& glue, const ManagerReference& manager, int key, ChildrenSet& children) {
    const int id = glue.numberOfKey(key);
    if (id < 1) {
        getChildOfAddNode(glue, key, children);
        return;
    }
    // Children met for the first time come in the order of the set; the rest is as with spouses.
    const bool endFirst = children.empty();
    OlvaneViewerManagerWrapProtocol& source = host(manager);
    int place = 0;
    const auto addEntry = [&](std::int64_t entry) {
        const int childKey = glue.keyOfNumber(lowBits(entry));
        const std::string date = source.dateForPersonWithID(lowBits(entry), true);
        ViewerGlue::DecimalBuffer buffer;
        const std::string_view text = glue.textOfKey(childKey, buffer);
        ++place;
        if (endFirst) {
            children.emplace_hint(children.end(), childKey, firstCharacterOf(date), text, place);
        } else {
            children.emplace(childKey, firstCharacterOf(date), text, place);
        }
    };
    source.visitChildrenOfPerson(id, PersonIdVisitor(addEntry));
}

bool isMale(const ViewerGlue& glue, const ManagerReference& manager, int key) {
    const int id = glue.numberOfKey(key);
    if (id >= 1) return host(manager).sexOfPersonWithID(id) == 0;
    return glue.addNodeIsMale(key);
}

// The writer of the result tests for an id below 0 instead. The two differ for the id 0 alone, which is
// an unknown parent here and has no suffix there; hosts' parsers count on the suffix standing with negative ids only.
bool isAddNode(const ViewerGlue& glue, int key) {
    return key < 0 || glue.numberOfKey(key) < 1;
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
      touchPerson([&glue](int key) { glue.numberOfKey(key); }) {}

DataAdapter HostCallbacks::dataAdapter() const {
    return DataAdapter(getSpouses, getParents, getChildren, isMale, isAddNode, touchPerson);
}

void resetAddParentId() {
    ADD_PARENT_ID = -1;
}

NegativeIds::NegativeIds() : before_(ADD_PARENT_ID) {
    resetAddParentId();
}

NegativeIds::~NegativeIds() {
    ADD_PARENT_ID = before_;
}

}  // namespace olvane
