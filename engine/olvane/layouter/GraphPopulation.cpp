// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Who is admitted to the graph, and as what. One person's relatives are fetched through the callbacks and
// entered into that person: who is a child of which couple, who a child of one parent alone, who a full and
// who a half sibling.
//
// Two things here look wasteful and are not. Parents are asked for again at every look: each answer for a
// person with an unknown parent makes new keys, and the keys of everybody met later, and with them
// the order of children, depend on how many were made. And a child is looked up by the order of its records,
// not by its key: the record from a real parent and the one from an unknown parent differ where there is a birth
// date, so such a child counts as a child of the real parent alone.

#include <olvane/layouter/TreeViewLayouter.h>

#include <algorithm>
#include <vector>

namespace SharedTreeViewer {

namespace {

bool allHavePlaces(const ChildrenSet& set) {
    return std::all_of(set.begin(), set.end(),
                       [](const ChildrenAdapter& record) { return record.hostOrder >= 1; });
}

// The children of several persons, for asking whether a record is among them.
//
// Records that all have a place are in one order, by key, so they are looked up in the sets where they lie.
// Others may contradict each other's order (see above), and then an answer depends on the order in which one
// set was filled with all of them: one plain insert after another.
class ChildrenOfOthers {
public:
    explicit ChildrenOfOthers(olvane::Arena& memory) : sets_(&memory), together_(&memory) {}

    void add(const ChildrenSet& children) {
        if (children.empty()) return;
        sets_.push_back(&children);
        allHavePlaces_ = allHavePlaces_ && allHavePlaces(children);
    }

    bool contains(const ChildrenAdapter& record) {
        if (allHavePlaces_ && record.hostOrder >= 1) {
            return std::any_of(sets_.begin(), sets_.end(),
                               [&record](const ChildrenSet* set) { return set->find(record) != set->end(); });
        }
        if (together_.empty()) putTogether();
        return together_.find(record) != together_.end();
    }

private:
    void putTogether() {
        for (const ChildrenSet* set : sets_) {
            for (const ChildrenAdapter& record : *set) together_.insert(record);
        }
    }

    TreeViewPerson::List<const ChildrenSet*> sets_;
    bool allHavePlaces_ = true;
    ChildrenSet together_;
};

typedef TreeViewPerson::List<const ChildrenAdapter*> Records;

ChildrenSet copyOf(const Records& records) {
    ChildrenSet set;
    for (const ChildrenAdapter* record : records) set.insert(*record);
    return set;
}

// Records of first that are equivalent to one of second, in the order of first.
Records commonRecords(const ChildrenSet& first, const ChildrenSet& second, olvane::Arena* memory) {
    Records common(memory);
    ChildrenSet::const_iterator a = first.begin();
    ChildrenSet::const_iterator b = second.begin();
    while (a != first.end() && b != second.end()) {
        if (*a < *b) {
            ++a;
        } else if (*b < *a) {
            ++b;
        } else {
            common.push_back(&*a);
            ++a;
            ++b;
        }
    }
    return common;
}

// The walk over a list, in the form of an Iterator.
auto walkOver(TreeViewPerson::Persons& list) {
    return [&list](const auto& visit) {
        for (TreeViewPerson& person : list) visit(person);
    };
}

}  // namespace

void TreeViewLayouter::addSpousesToPerson(TreeViewPerson& person) {
    SpouseSet records(&memory);
    dataAdapter->getSpouses(person.personId, records);
    person.spouses.reserve(person.spouses.size() + records.size());
    for (const SpouseAdapter& record : records) {
        admit(record.key);
        person.addSpouse(record.key, !person.gender);
    }
}

void TreeViewLayouter::addParentsToPerson(TreeViewPerson& person) {
    int father = TreeViewPerson::kNoKey;
    int mother = TreeViewPerson::kNoKey;
    dataAdapter->getParents(person.personId, father, mother);
    if (father != TreeViewPerson::kNoKey && mother != TreeViewPerson::kNoKey) {
        person.setParents(father, mother);
    } else if (father != TreeViewPerson::kNoKey) {
        person.setParentsFatherOnly(father);
    } else if (mother != TreeViewPerson::kNoKey) {
        person.setParentsMotherOnly(mother);
    }
}

bool TreeViewLayouter::hasParents(TreeViewPerson& person) {
    int father = TreeViewPerson::kNoKey;
    int mother = TreeViewPerson::kNoKey;
    dataAdapter->getParents(person.personId, father, mother);
    return (father != TreeViewPerson::kNoKey && !dataAdapter->isAddNode(father)) ||
           (mother != TreeViewPerson::kNoKey && !dataAdapter->isAddNode(mother));
}

void TreeViewLayouter::addAllChildrenToPerson(TreeViewPerson& person) {
    const ChildrenSet& children = person.getAllChildrenVector(dataAdapter->getChildren);
    if (children.empty()) return;
    addChildrenWithoutSecondParent(person, childrenWithoutSecondParent(person, walkOver(person.spouses)));
    for (TreeViewPerson& spouse : person.spouses) addChildrenWithSpousesToPerson(person, spouse, children);
}

void TreeViewLayouter::addBastardChildrenToPerson(TreeViewPerson& person, Iterator iterator) {
    addChildrenWithoutSecondParent(person, childrenWithoutSecondParent(person, iterator));
}

void TreeViewLayouter::addChildrenWithoutSecondParent(TreeViewPerson& person, const Records& alone) {
    if (alone.empty()) return;
    TreeViewPerson::Persons& list = person.childrenWithSpouse(TreeViewPerson::kNoKey, alone.size());
    for (const ChildrenAdapter* record : alone) {
        admit(record->key);
        person.addChild(record->key, list, dataAdapter->isMale(record->key));
    }
}

ChildrenSet TreeViewLayouter::getBastardChildrenOfPerson(TreeViewPerson& person, Iterator iterator) {
    return copyOf(childrenWithoutSecondParent(person, iterator));
}

template <class Walk>
TreeViewLayouter::Records TreeViewLayouter::childrenWithoutSecondParent(TreeViewPerson& person,
                                                                        const Walk& walk) {
    Records alone(&memory);
    const ChildrenSet& own = person.getAllChildrenVector(dataAdapter->getChildren);
    if (own.empty()) return alone;
    ChildrenOfOthers others(memory);
    walk([&](TreeViewPerson& other) {
        if (other.personId != person.personId)
            others.add(other.getAllChildrenVector(dataAdapter->getChildren));
    });
    for (const ChildrenAdapter& record : own) {
        if (!others.contains(record)) alone.push_back(&record);
    }
    return alone;
}

ChildrenSet TreeViewLayouter::getIntersectingVector(const ChildrenSet& first,
                                                    const ChildrenSet& second) const {
    return copyOf(commonRecords(first, second, nullptr));
}

void TreeViewLayouter::addChildrenWithSpousesToPerson(TreeViewPerson& person, TreeViewPerson& spouse,
                                                      const ChildrenSet& children) {
    if (children.empty()) return;
    const ChildrenSet& spousesChildren = spouse.getAllChildrenVector(dataAdapter->getChildren);
    const Records common = commonRecords(children, spousesChildren, &memory);
    if (common.empty()) return;
    TreeViewPerson::Persons& list = person.childrenWithSpouse(spouse.personId, common.size());
    for (const ChildrenAdapter* record : common) {
        int child = record->key;
        int other = spouse.personId;
        if (!checkIfPrefferedParent(person, child, other)) continue;
        admit(child);
        const bool male = dataAdapter->isMale(child);
        person.addChild(child, list, male);
    }
}

// The mixed cases look redundant and are kept: sexes that contradict each other in the data (a man listed as
// a mother) come through here, and a child would vanish from its couple without them. So is the last test
// over the whole record of the admitted: a child of whom nobody stands on the chart yet is let through,
// for any person.
bool TreeViewLayouter::checkIfPrefferedParent(TreeViewPerson& person, int& child, int& other) {
    int father = TreeViewPerson::kNoKey;
    int mother = TreeViewPerson::kNoKey;
    dataAdapter->getParents(child, father, mother);
    const int self = person.personId;
    if (self == father && other == mother) return true;
    if ((self == father || self == mother) && other == father) return true;
    if (self == mother && other == mother) return true;
    return !isAdmitted(father) && !isAdmitted(mother) && !isAdmitted(child);
}

// The person comes in among its own siblings: its place in the list is how the row later finds where it
// stands.
void TreeViewLayouter::addSiblingsToPerson(TreeViewPerson& person) {
    if (person.getParentCount() == 0) return;
    const bool hasFather = person.preferredFatherIndex != -1;
    const bool hasMother = person.preferredMotherIndex != -1;
    const bool fatherIsReal = hasFather && !dataAdapter->isAddNode(person.getPreferredFather().personId);
    const bool motherIsReal = hasMother && !dataAdapter->isAddNode(person.getPreferredMother().personId);

    if (fatherIsReal) addFatherSide(person, motherIsReal);
    if (motherIsReal) addMotherSide(person);
    const bool bothAreAddNodes = hasFather && !fatherIsReal && hasMother && !motherIsReal;
    if (bothAreAddNodes) person.addSibling(person.personId, person.gender);
}

// The father's own children, the person last among them, then the children of both parents. On the mother's
// side the person comes first instead; the two differ on purpose, since each side grows away from the person.
void TreeViewLayouter::addFatherSide(TreeViewPerson& person, bool motherIsReal) {
    TreeViewPerson& father = person.getPreferredFather();
    bool personIsAmongThem = false;
    const Records alone = childrenWithoutSecondParent(father, walkOver(person.parents));
    person.siblings.reserve(person.siblings.size() + alone.size());
    for (const ChildrenAdapter* record : alone) {
        if (record->key == person.personId) {
            personIsAmongThem = true;
        } else {
            person.addHalfSibling(record->key, father.personId, dataAdapter->isMale(record->key));
        }
    }
    if (personIsAmongThem) person.addHalfSibling(person.personId, father.personId, person.gender);
    if (!motherIsReal) return;

    TreeViewPerson& mother = person.getPreferredMother();
    const ChildrenSet& fathersChildren = father.getAllChildrenVector(dataAdapter->getChildren);
    const ChildrenSet& mothersChildren = mother.getAllChildrenVector(dataAdapter->getChildren);
    const Records common = commonRecords(fathersChildren, mothersChildren, &memory);
    person.siblings.reserve(person.siblings.size() + common.size());
    for (const ChildrenAdapter* record : common) {
        person.addSibling(record->key, dataAdapter->isMale(record->key));
    }
}

void TreeViewLayouter::addMotherSide(TreeViewPerson& person) {
    TreeViewPerson& mother = person.getPreferredMother();
    const Records alone = childrenWithoutSecondParent(mother, walkOver(person.parents));
    person.siblings.reserve(person.siblings.size() + alone.size());
    for (const ChildrenAdapter* record : alone) {
        if (record->key == person.personId) {
            person.addHalfSibling(person.personId, mother.personId, person.gender);
        }
    }
    for (const ChildrenAdapter* record : alone) {
        if (record->key != person.personId) {
            person.addHalfSibling(record->key, mother.personId, dataAdapter->isMale(record->key));
        }
    }
}

}  // namespace SharedTreeViewer
