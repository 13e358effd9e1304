// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Who has relatives that the family view leaves out, found by the plain layout. The passes before the last one
// are overwritten by it on every real person; they are kept because they ask the host, and each question can
// use up negative ids.

#include <support/plain/PlainFamily.h>

namespace plain {

namespace {

bool stands(int key, const std::vector<Person*>& displayed) {
    for (const Person* person : displayed) {
        if (person->key == key) return true;
    }
    return false;
}

}  // namespace

void FamilyLayouter::flagHiddenRelatives() {
    flagTopOfTree();
    flagSiblings();
    std::vector<Person*> climbed;
    climb(0, 4, focus, climbed);
    forEachChild(focus, true, [this](Person& child) {
        flagChildByParents(focus, child);
        flagSpouses(child, true);
        flagChildrenWithFamilies(child);
    });
    for (Person* person : climbed) person->visited = false;
    flagSpouses(focus, false);

    std::vector<Person*> displayed;
    walk([&](Person& person) { displayed.push_back(&person); });
    walk([&](Person& person) { flagByDisplay(person, displayed); });
}

void FamilyLayouter::flagSiblings() {
    forEach(focus.siblings, [this](Person& sibling) {
        if (sibling.childRecordsRead) flagSpouses(sibling, true);
        if (!sibling.flagged && hasParents(sibling)) flagSiblingByParents(sibling);
        flagChildrenWithFamilies(sibling);
    });
}

// Whether the sibling has a parent of its own beside the focus's.
void FamilyLayouter::flagSiblingByParents(Person& sibling) {
    int father = -1;
    int mother = -1;
    data.parents(sibling.key, father, mother);
    const bool otherFather =
        !data.isAddNode(father) && focus.fatherIndex != -1 && fatherOf(focus).key != father;
    if (otherFather) {
        sibling.flagged = true;
    } else if (data.isAddNode(mother) || focus.motherIndex == -1) {
        sibling.flagged = false;
    } else {
        sibling.flagged = motherOf(focus).key != mother;
    }
}

void FamilyLayouter::flagSpouses(Person& person, bool checkChildren) {
    forEach(person.spouses, [&](Person& spouse) {
        readHostSpouses(spouse);
        bool flag = countOf(spouse.hostSpouses) > 1 || hasParents(spouse);
        if (checkChildren && !childRecords(spouse).empty()) {
            const int firstKey = childRecords(spouse).begin()->key;
            if (!isPreferredParent(person, firstKey, spouse.key)) flag = true;
        }
        spouse.flagged = flag;
    });
}

void FamilyLayouter::flagChildByParents(Person& parent, Person& child) {
    int father = -1;
    int mother = -1;
    data.parents(child.key, father, mother);
    bool hidden = true;
    const bool isParent = parent.key == mother || parent.key == father;
    forEach(parent.spouses, [&](Person& spouse) {
        const bool spouseIsParent = spouse.key == mother || spouse.key == father;
        if (!data.isAddNode(spouse.key) && spouseIsParent && isParent) hidden = false;
    });
    if (hidden) {
        readHostSpouses(parent);
        if (data.isAddNode(father) || data.isAddNode(mother)) hidden = false;
    }
    child.flagged = hidden;
}

void FamilyLayouter::flagByDisplay(Person& person, const std::vector<Person*>& displayed) {
    if (data.isAddNode(person.key)) return;
    const bool hiddenChildren = hidesChildren(person, displayed);
    const bool hiddenSpouses = hidesSpouses(person, displayed);
    int father = person.fatherIndex == -1 ? -1 : fatherOf(person).key;
    int mother = person.motherIndex == -1 ? -1 : motherOf(person).key;
    if (father == -1 || mother == -1) data.parents(person.key, father, mother);
    const bool hiddenFather = hidesParent(father, displayed);
    const bool hiddenMother = hidesParent(mother, displayed);
    person.flagged = hiddenChildren || hiddenSpouses || hiddenFather || hiddenMother;
}

bool FamilyLayouter::hidesChildren(Person& person, const std::vector<Person*>& displayed) {
    const std::set<ChildRecord>& records = childRecords(person);
    if (static_cast<int>(records.size()) == drawnChildCount(person)) return false;
    for (const ChildRecord& record : records) {
        if (!stands(record.key, displayed)) return true;
    }
    return false;
}

bool FamilyLayouter::hidesSpouses(Person& person, const std::vector<Person*>& displayed) {
    std::set<SpouseRecord> records;
    data.spouses(person.key, records);
    if (static_cast<int>(records.size()) == countOf(person.spouses)) return false;
    for (const SpouseRecord& record : records) {
        if (!stands(record.key, displayed)) return true;
    }
    return false;
}

bool FamilyLayouter::hidesParent(int parentKey, const std::vector<Person*>& displayed) const {
    return parentKey != -1 && !data.isAddNode(parentKey) && !stands(parentKey, displayed);
}

}  // namespace plain
