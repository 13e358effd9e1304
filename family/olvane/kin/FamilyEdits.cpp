// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The edits of a table: each checks what it was given, draws up the changed rows, and puts them in place.

#include <olvane/kin/Family.h>

#include <algorithm>
#include <string>

#include <olvane/kin/FamilyChecksInternal.h>
#include <olvane/kin/FamilyEditInternal.h>
#include <olvane/kin/FamilyStateInternal.h>

namespace olvane {

using detail::Reference;
using detail::RowPlace;
using detail::StoredFamily;
using detail::StoredPerson;

namespace {

RowPlace placeOf(FamilyTable table, std::int64_t id) {
    return {table, FamilyError::kNoRow, id};
}

void checkKnown(const Family& family, const RowPlace& place, std::string_view field, std::int64_t id) {
    if (!family.hasPerson(id)) place.fail(field, std::to_string(id) + " is not the id of a person");
}

FamilyId knownOrNobody(const Family& family, const RowPlace& place, std::string_view field, std::int64_t id) {
    const FamilyId checked = detail::checkedIdOrNobody(place, field, id);
    if (checked != 0) checkKnown(family, place, field, id);
    return checked;
}

void checkPerson(const Family& family, FamilyTable table, std::int64_t id) {
    const RowPlace place = placeOf(table, id);
    detail::checkedId(place, "id", id);
    checkKnown(family, place, "id", id);
}

// Ids of known persons, each once.
std::vector<FamilyId> checkedList(const Family& family, const RowPlace& place, std::string_view field,
                                  std::span<const std::int64_t> ids) {
    std::vector<FamilyId> list;
    list.reserve(ids.size());
    for (const std::int64_t id : ids) {
        list.push_back(detail::checkedId(place, field, id));
        checkKnown(family, place, field, id);
    }
    std::vector<std::size_t> repeats;
    detail::findRepeats(list, repeats);
    if (!repeats.empty()) place.fail(field, std::to_string(list[repeats[0]]) + " is in the list twice");
    return list;
}

// A parent need not be there before a person who is their own.
FamilyId checkedParent(const Family& family, const RowPlace& place, std::string_view field, std::int64_t id) {
    return id == place.id ? detail::checkedId(place, field, id) : knownOrNobody(family, place, field, id);
}

struct CheckedPerson {
    StoredPerson stored;
    const PersonRow& row;

    CheckedPerson(const Family& family, const PersonRow& given) : row(given) {
        const RowPlace place = placeOf(FamilyTable::persons, row.id);
        stored.id = detail::checkedId(place, "id", row.id);
        stored.father = checkedParent(family, place, "father", row.father);
        stored.mother = checkedParent(family, place, "mother", row.mother);
        detail::checkedChoice(place, "sex", static_cast<std::int64_t>(row.sex), 2);
        stored.sex = row.sex;
        stored.dead = row.dead;
        detail::checkText(place, "birth", row.birth);
        detail::checkText(place, "death", row.death);
        detail::checkText(place, "birthWritten", row.birthWritten);
        detail::checkText(place, "deathWritten", row.deathWritten);
    }

    void store(detail::BlobStore& blobs) {
        stored.birth = blobs.add(row.birth);
        stored.death = blobs.add(row.death);
        const bool sameBirth = row.birthWritten.empty() || row.birthWritten == row.birth;
        const bool sameDeath = row.deathWritten.empty() || row.deathWritten == row.death;
        stored.birthWritten = sameBirth ? stored.birth : blobs.add(row.birthWritten);
        stored.deathWritten = sameDeath ? stored.death : blobs.add(row.deathWritten);
    }
};

struct CheckedFamily {
    StoredFamily stored;
    const FamilyRow& row;
    std::vector<FamilyId> children;
    std::string kinds;  // empty where all are children by birth

    CheckedFamily(const Family& family, const FamilyRow& given, std::span<const FamilyChild> givenChildren)
        : row(given) {
        const RowPlace place = placeOf(FamilyTable::families, row.number);
        stored.number = detail::checkedId(place, "number", row.number);
        stored.partner0 = knownOrNobody(family, place, "partner0", row.partner0);
        stored.partner1 = knownOrNobody(family, place, "partner1", row.partner1);
        detail::checkedChoice(place, "state", static_cast<std::int64_t>(row.state), 3);
        stored.state = row.state;
        detail::checkText(place, "marriage", row.marriage);
        detail::checkText(place, "marriageWritten", row.marriageWritten);
        detail::checkText(place, "marriagePlace", row.marriagePlace);
        std::vector<std::int64_t> ids;
        for (const FamilyChild& child : givenChildren) {
            ids.push_back(child.child);
            kinds +=
                static_cast<char>(detail::checkedChoice(placeOf(FamilyTable::familyChildren, row.number),
                                                        "kind", static_cast<std::int64_t>(child.kind), 5));
        }
        children = checkedList(family, placeOf(FamilyTable::familyChildren, row.number), "child", ids);
        if (kinds.find_first_not_of('\0') == std::string::npos) kinds.clear();
    }

    void store(detail::BlobStore& blobs) {
        stored.marriage = blobs.add(row.marriage);
        const bool same = row.marriageWritten.empty() || row.marriageWritten == row.marriage;
        stored.marriageWritten = same ? stored.marriage : blobs.add(row.marriageWritten);
        stored.marriagePlace = blobs.add(row.marriagePlace);
        stored.children = blobs.add(std::span<const FamilyId>(children));
        stored.kinds = blobs.add(std::string_view(kinds));
    }
};

bool isOneOf(FamilyId id, FamilyId a, FamilyId b) {
    return id == a || id == b;
}

// The lists of children after a change of parents: the old ones may be nobody.
void moveChild(FamilyEdit& edit, FamilyId child, const StoredPerson& before, const StoredPerson& after) {
    for (const FamilyId parent : {before.father, before.mother}) {
        if (parent == 0 || isOneOf(parent, after.father, after.mother)) continue;
        StoredPerson& draft = edit.draftOf(parent);
        draft.children = edit.without(draft.children, child);
    }
    for (const FamilyId parent : {after.father, after.mother}) {
        if (parent == 0 || isOneOf(parent, before.father, before.mother)) continue;
        StoredPerson& draft = edit.draftOf(parent);
        draft.children = edit.withAll(draft.children, std::span(&child, 1));
    }
}

void addSpouse(FamilyEdit& edit, FamilyId person, FamilyId spouse) {
    StoredPerson& draft = edit.draftOf(person);
    if (draft.spouses == 0) draft.preferred = spouse;
    draft.spouses = edit.withAll(draft.spouses, std::span(&spouse, 1));
}

void addToLists(FamilyEdit& edit, const StoredFamily& family, std::span<const FamilyId> children) {
    if (family.partner0 != 0 && family.partner1 != 0) {
        addSpouse(edit, family.partner0, family.partner1);
        if (family.partner0 != family.partner1) addSpouse(edit, family.partner1, family.partner0);
    }
    for (const FamilyId partner : {family.partner0, family.partner1}) {
        if (partner == 0 || children.empty()) continue;
        StoredPerson& draft = edit.draftOf(partner);
        draft.children = edit.withAll(draft.children, children);
    }
}

bool joins(const StoredFamily& family, FamilyId a, FamilyId b) {
    return (family.partner0 == a && family.partner1 == b) || (family.partner0 == b && family.partner1 == a);
}

void removeSpouse(FamilyEdit& edit, FamilyId person, FamilyId spouse) {
    StoredPerson& draft = edit.draftOf(person);
    draft.spouses = edit.without(draft.spouses, spouse);
    if (draft.preferred == spouse) draft.preferred = 0;
}

// Partners of the family at that row, unless another one joins them.
void separate(FamilyEdit& edit, std::uint32_t row) {
    const auto& families = edit.state().families;
    const FamilyId a = families[row].partner0;
    const FamilyId b = families[row].partner1;
    if (a == 0 || b == 0) return;
    for (std::size_t other = 0; other < families.size(); ++other) {
        if (other != row && families[other].number != 0 && joins(families[other], a, b)) return;
    }
    removeSpouse(edit, a, b);
    if (a != b) removeSpouse(edit, b, a);
}

}  // namespace

void Family::addPerson(const PersonRow& row) {
    CheckedPerson checked(*this, row);
    if (hasPerson(row.id)) {
        placeOf(FamilyTable::persons, row.id)
            .fail("id", std::to_string(row.id) + " is the id of another person");
    }
    FamilyEdit edit(*this);
    checked.store(edit.blobs());
    edit.addPerson(checked.stored);
    moveChild(edit, checked.stored.id, StoredPerson(), checked.stored);
    edit.commit();
}

void Family::setPerson(const PersonRow& row) {
    CheckedPerson checked(*this, row);
    checkPerson(*this, FamilyTable::persons, row.id);
    FamilyEdit edit(*this);
    checked.store(edit.blobs());
    StoredPerson& draft = edit.draftOf(checked.stored.id);
    const StoredPerson before = draft;
    StoredPerson after = checked.stored;
    after.preferred = before.preferred;
    after.spouses = before.spouses;
    after.children = before.children;
    after.names = before.names;
    after.fields = before.fields;
    draft = after;
    moveChild(edit, after.id, before, after);
    edit.commit();
}

void Family::setSpouses(std::int64_t id, std::span<const std::int64_t> spouses, std::int64_t preferred) {
    checkPerson(*this, FamilyTable::spouses, id);
    const RowPlace place = placeOf(FamilyTable::spouses, id);
    const std::vector<FamilyId> list = checkedList(*this, place, "spouse", spouses);
    if (preferred != 0 && std::find(spouses.begin(), spouses.end(), preferred) == spouses.end()) {
        place.fail("preferred", std::to_string(preferred) + " is not in the list of spouses");
    }
    FamilyEdit edit(*this);
    StoredPerson& draft = edit.draftOf(static_cast<FamilyId>(id));
    draft.spouses = edit.blobs().add(std::span<const FamilyId>(list));
    draft.preferred = static_cast<FamilyId>(preferred);
    edit.commit();
}

void Family::setPreferredSpouse(std::int64_t id, std::int64_t preferred) {
    checkPerson(*this, FamilyTable::spouses, id);
    const std::span<const FamilyId> list = spouses(id);
    if (preferred != 0 && std::find(list.begin(), list.end(), preferred) == list.end()) {
        placeOf(FamilyTable::spouses, id)
            .fail("preferred", std::to_string(preferred) + " is not in the list of spouses");
    }
    FamilyEdit edit(*this);
    edit.draftOf(static_cast<FamilyId>(id)).preferred = static_cast<FamilyId>(preferred);
    edit.commit();
}

void Family::setChildren(std::int64_t id, std::span<const std::int64_t> children) {
    checkPerson(*this, FamilyTable::children, id);
    const std::vector<FamilyId> list =
        checkedList(*this, placeOf(FamilyTable::children, id), "child", children);
    FamilyEdit edit(*this);
    edit.draftOf(static_cast<FamilyId>(id)).children = edit.blobs().add(std::span<const FamilyId>(list));
    edit.commit();
}

void Family::setNames(std::int64_t id, std::span<const NamePart> names) {
    checkPerson(*this, FamilyTable::names, id);
    const RowPlace place = placeOf(FamilyTable::names, id);
    std::string packed;
    for (const NamePart& part : names) {
        const std::uint8_t kind = detail::checkedChoice(place, "kind", static_cast<std::int64_t>(part.kind),
                                                        static_cast<std::uint8_t>(NameKind::other));
        detail::checkText(place, "text", part.text);
        detail::appendPacked(packed, {kind, part.text}, detail::kNameHeadBytes);
    }
    FamilyEdit edit(*this);
    edit.draftOf(static_cast<FamilyId>(id)).names = edit.blobs().add(std::string_view(packed));
    edit.commit();
}

void Family::setField(std::int64_t id, std::string_view key, std::string_view text) {
    checkPerson(*this, FamilyTable::fields, id);
    const RowPlace place = placeOf(FamilyTable::fields, id);
    if (key.empty()) place.fail("key", "the key is empty");
    detail::checkText(place, "key", key);
    detail::checkText(place, "text", text);
    const std::string ownKey(key);  // which may lie in the table
    FamilyEdit edit(*this);
    std::vector<std::string>& keys = edit.fieldKeys();
    const auto known = std::find(keys.begin(), keys.end(), ownKey);
    const auto number = static_cast<std::uint32_t>(known - keys.begin());
    if (known == keys.end()) {
        if (keys.size() >= kMostFieldKeys) place.fail("key", "there are too many different keys");
        keys.push_back(ownKey);
    }
    StoredPerson& draft = edit.draftOf(static_cast<FamilyId>(id));
    std::string packed;
    bool isStored = false;
    const auto append = [&packed](std::uint32_t key_, std::string_view value) {
        if (!value.empty()) detail::appendPacked(packed, {key_, value}, detail::kFieldHeadBytes);
    };
    for (std::string_view rest = edit.blobs().text(draft.fields); !rest.empty();) {
        const detail::PackedEntry entry = detail::takePacked(rest, detail::kFieldHeadBytes);
        append(entry.number, entry.number == number ? text : entry.text);
        isStored = isStored || entry.number == number;
    }
    if (!isStored) append(number, text);
    draft.fields = edit.blobs().add(std::string_view(packed));
    edit.commit();
}

void Family::addFamily(const FamilyRow& row, std::span<const FamilyChild> children) {
    CheckedFamily checked(*this, row, children);
    if (hasFamily(row.number)) {
        placeOf(FamilyTable::families, row.number)
            .fail("number", std::to_string(row.number) + " is the number of another family");
    }
    FamilyEdit edit(*this);
    checked.store(edit.blobs());
    edit.addFamily(checked.stored);
    addToLists(edit, checked.stored, checked.children);
    edit.commit();
}

void Family::setFamily(const FamilyRow& row, std::span<const FamilyChild> children) {
    CheckedFamily checked(*this, row, children);
    const std::uint32_t at = state().familyRow(row.number);
    if (at == detail::IdIndex::kNoRow) {
        placeOf(FamilyTable::families, row.number)
            .fail("number", std::to_string(row.number) + " is not the number of a family");
    }
    FamilyEdit edit(*this);
    checked.store(edit.blobs());
    if (!joins(edit.state().families[at], checked.stored.partner0, checked.stored.partner1))
        separate(edit, at);
    edit.draftOfFamily(at) = checked.stored;
    addToLists(edit, checked.stored, checked.children);
    edit.commit();
}

void Family::removeFamily(std::int64_t number) {
    const std::uint32_t at = state().familyRow(number);
    if (at == detail::IdIndex::kNoRow) {
        placeOf(FamilyTable::families, number)
            .fail("number", std::to_string(number) + " is not the number of a family");
    }
    FamilyEdit edit(*this);
    separate(edit, at);
    edit.removeFamily(at);
    edit.commit();
}

}  // namespace olvane
