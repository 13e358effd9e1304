// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The rules by which relatives enter a chart, for both views of the plain layout, written one question after the
// other. Nothing is asked once where the rules ask twice, since every question can use up negative ids.

#include <support/plain/PlainLayouter.h>

namespace plain {

namespace {

// The records of the first that have an equivalent in the second.
std::set<ChildRecord> inBoth(const std::set<ChildRecord>& first, const std::set<ChildRecord>& second) {
    std::set<ChildRecord> result;
    auto a = first.begin();
    auto b = second.begin();
    while (a != first.end() && b != second.end()) {
        if (*a < *b) {
            ++a;
        } else if (*b < *a) {
            ++b;
        } else {
            result.insert(*a);
            ++a;
            ++b;
        }
    }
    return result;
}

Walk walkOver(People& list) {
    return [&list](const Visit& visit) { forEach(list, visit); };
}

}  // namespace

Layouter::Layouter(Data& source, const support::CaseFile& wanted, int focusKey, bool focusIsMale)
    : data(source), request(wanted), size(wanted.size) {
    focus.key = focusKey;
    focus.male = focusIsMale;
}

void Layouter::walk(const Visit& visit) {
    walkFrom(focus, visit);
}

bool Layouter::option(const std::string& key) const {
    const auto found = request.options.find(key);
    return found == request.options.end() || found->second;
}

// A spouse's sex is not asked: it is taken to be the other one.
void Layouter::addSpouses(Person& person) {
    std::set<SpouseRecord> records;
    data.spouses(person.key, records);
    for (const SpouseRecord& record : records) {
        shown[record.key] = true;
        addTo(person.spouses, record.key, !person.male);
    }
}

void Layouter::addParents(Person& person) {
    int father = -1;
    int mother = -1;
    data.parents(person.key, father, mother);
    if (father != -1) {
        addTo(person.parents, father, true);
        person.fatherIndex = countOf(person.parents) - 1;
    }
    if (mother != -1) {
        addTo(person.parents, mother, false);
        person.motherIndex = countOf(person.parents) - 1;
    }
}

void Layouter::addAllChildren(Person& person) {
    const std::set<ChildRecord>& records = childRecords(person);
    if (records.empty()) return;
    addChildrenWithoutOther(person, walkOver(person.spouses));
    forEach(person.spouses, [&](Person& spouse) { addChildrenWithSpouse(person, spouse, records); });
}

void Layouter::addChildrenWithoutOther(Person& person, const Walk& others) {
    for (const ChildRecord& record : childrenWithoutOther(person, others)) {
        shown[record.key] = true;
        const bool male = data.isMale(record.key);
        addTo(person.children[-1], record.key, male);
    }
}

std::set<ChildRecord> Layouter::childrenWithoutOther(Person& person, const Walk& others) {
    std::set<ChildRecord> result;
    const std::set<ChildRecord>& own = childRecords(person);
    if (own.empty()) return result;
    std::set<ChildRecord> ofOthers;
    others([&](Person& other) {
        if (other.key == person.key) return;
        for (const ChildRecord& record : childRecords(other)) ofOthers.insert(record);
    });
    for (const ChildRecord& record : own) {
        if (ofOthers.find(record) == ofOthers.end()) result.insert(record);
    }
    return result;
}

void Layouter::addChildrenWithSpouse(Person& person, Person& spouse, const std::set<ChildRecord>& records) {
    if (records.empty()) return;
    for (const ChildRecord& record : inBoth(records, childRecords(spouse))) {
        if (!isPreferredParent(person, record.key, spouse.key)) continue;
        shown[record.key] = true;
        const bool male = data.isMale(record.key);
        addTo(person.children[spouse.key], record.key, male);
    }
}

bool Layouter::hasParents(Person& person) {
    int father = -1;
    int mother = -1;
    data.parents(person.key, father, mother);
    return (father != -1 && !data.isAddNode(father)) || (mother != -1 && !data.isAddNode(mother));
}

// Whether a child with more couples than one is drawn under this one.
bool Layouter::isPreferredParent(Person& person, int childKey, int otherKey) {
    int father = -1;
    int mother = -1;
    data.parents(childKey, father, mother);
    const bool anyShown = shown.count(father) > 0 || shown.count(mother) > 0 || shown.count(childKey) > 0;
    if (!anyShown) return true;
    if (person.key == father && otherKey == mother) return true;
    if ((person.key == father || person.key == mother) && otherKey == father) return true;
    return person.key == mother && otherKey == mother;
}

const std::set<ChildRecord>& Layouter::childRecords(Person& person) {
    if (!person.childRecordsRead) {
        person.childRecordsRead = true;
        data.children(person.key, person.childRecords);
    }
    return person.childRecords;
}

void Layouter::readHostSpouses(Person& person) {
    if (person.hostSpousesRead) return;
    person.hostSpousesRead = true;
    std::set<SpouseRecord> records;
    data.spouses(person.key, records);
    for (const SpouseRecord& record : records) addTo(person.hostSpouses, record.key, false);
}

void Layouter::addSiblings(Person& person) {
    if (person.parents.empty()) return;
    const bool fatherUnset = person.fatherIndex == -1;
    const bool motherUnset = person.motherIndex == -1;
    const bool fatherReal = !fatherUnset && !data.isAddNode(fatherOf(person).key);
    const bool motherReal = !motherUnset && !data.isAddNode(motherOf(person).key);

    if (fatherReal) {
        addFathersSide(person, fatherOf(person));
        if (motherReal) addFullSiblings(person, fatherOf(person), motherOf(person));
    }
    if (motherReal) addMothersSide(person, motherOf(person));

    const bool bothUnknown = !fatherUnset && !fatherReal && !motherUnset && !motherReal;
    if (bothUnknown) addTo(person.siblings, person.key, person.male);
}

// The person comes after the half siblings here and before them on the mother's side.
void Layouter::addFathersSide(Person& person, Person& father) {
    bool personIsAmongThem = false;
    for (const ChildRecord& record : childrenWithoutOther(father, walkOver(person.parents))) {
        if (record.key == person.key) {
            personIsAmongThem = true;
        } else {
            addHalfSibling(person, record.key, father.key, data.isMale(record.key));
        }
    }
    if (personIsAmongThem) addHalfSibling(person, person.key, father.key, person.male);
}

void Layouter::addFullSiblings(Person& person, Person& father, Person& mother) {
    const std::set<ChildRecord>& fathers = childRecords(father);
    const std::set<ChildRecord>& mothers = childRecords(mother);
    for (const ChildRecord& record : inBoth(fathers, mothers)) {
        const bool male = data.isMale(record.key);
        addTo(person.siblings, record.key, male);
    }
}

void Layouter::addMothersSide(Person& person, Person& mother) {
    const std::set<ChildRecord> records = childrenWithoutOther(mother, walkOver(person.parents));
    for (const ChildRecord& record : records) {
        if (record.key == person.key) addHalfSibling(person, person.key, mother.key, person.male);
    }
    for (const ChildRecord& record : records) {
        if (record.key != person.key) {
            addHalfSibling(person, record.key, mother.key, data.isMale(record.key));
        }
    }
}

void Layouter::addHalfSibling(Person& person, int key, int parentKey, bool male) {
    addTo(person.siblings, key, male).parentKey = parentKey;
}

// The father's whole line, then the mother's, then the couple itself.
void Layouter::climb(int depth, int maxDepth, Person& person, std::vector<Person*>& climbed) {
    if (data.isAddNode(person.key) || maxDepth <= depth || person.visited) return;
    person.visited = true;
    climbed.push_back(&person);
    if (person.fatherIndex != -1) climb(depth + 1, maxDepth, fatherOf(person), climbed);
    if (person.motherIndex == -1) return;
    climb(depth + 1, maxDepth, motherOf(person), climbed);
    if (person.fatherIndex == -1) return;
    flagWherePartnerHasOther(fatherOf(person), motherOf(person));
    flagWherePartnerHasOther(motherOf(person), fatherOf(person));
}

void Layouter::flagWherePartnerHasOther(Person& partner, const Person& other) {
    readHostSpouses(partner);
    forEach(partner.hostSpouses, [&](Person& spouse) {
        if (spouse.key != other.key) partner.flagged = true;
    });
}

void Layouter::flagTopOfTree() {
    forEachGreatGrandparent(focus, [&](Person& ancestor) {
        if (hasParents(ancestor)) ancestor.flagged = true;
    });
}

void Layouter::flagChildrenWithFamilies(Person& person) {
    forEachChild(person, true, [&](Person& child) {
        readHostSpouses(child);
        const bool married = !child.hostSpouses.empty() || !child.spouses.empty();
        child.flagged = married || !childRecords(child).empty();
    });
}

}  // namespace plain
