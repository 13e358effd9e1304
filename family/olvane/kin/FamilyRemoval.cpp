// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Removes a person. Data may contradict themselves, so those that name the person are found by a look at every row.

#include <olvane/kin/Family.h>

#include <algorithm>
#include <string>

#include <olvane/kin/FamilyChecksInternal.h>
#include <olvane/kin/FamilyEditInternal.h>
#include <olvane/kin/FamilyStateInternal.h>

namespace olvane {

using detail::StoredFamily;
using detail::StoredPerson;

namespace {

bool contains(std::span<const FamilyId> list, FamilyId id) {
    return std::find(list.begin(), list.end(), id) != list.end();
}

void removeFromPersons(FamilyEdit& edit, FamilyId id) {
    const auto& state = edit.state();
    for (std::uint32_t row = 0; row < state.persons.size(); ++row) {
        const StoredPerson& person = state.persons[row];
        if (person.id == 0 || person.id == id) continue;
        const bool namesIt = person.father == id || person.mother == id ||
                             contains(state.blobs.list(person.spouses), id) ||
                             contains(state.blobs.list(person.children), id);
        if (!namesIt) continue;
        StoredPerson& draft = edit.newDraftOf(row);
        if (draft.father == id) draft.father = 0;
        if (draft.mother == id) draft.mother = 0;
        if (draft.preferred == id) draft.preferred = 0;
        draft.spouses = edit.without(draft.spouses, id);
        draft.children = edit.without(draft.children, id);
    }
}

void removeChild(FamilyEdit& edit, StoredFamily& family, FamilyId id) {
    const std::span<const FamilyId> children = edit.blobs().list(family.children);
    const auto found = std::find(children.begin(), children.end(), id);
    if (found == children.end()) return;
    std::string kinds(edit.blobs().text(family.kinds));
    if (!kinds.empty()) kinds.erase(static_cast<std::size_t>(found - children.begin()), 1);
    if (kinds.find_first_not_of('\0') == std::string::npos) kinds.clear();
    family.kinds = edit.blobs().add(std::string_view(kinds));
    family.children = edit.without(family.children, id);
}

// A family that is left without anybody goes too.
void removeFromFamilies(FamilyEdit& edit, FamilyId id) {
    const auto& state = edit.state();
    for (std::uint32_t row = 0; row < state.families.size(); ++row) {
        const StoredFamily& family = state.families[row];
        if (family.number == 0) continue;
        const bool namesIt =
            family.partner0 == id || family.partner1 == id || contains(state.blobs.list(family.children), id);
        if (!namesIt) continue;
        StoredFamily& draft = edit.draftOfFamily(row);
        if (draft.partner0 == id) draft.partner0 = 0;
        if (draft.partner1 == id) draft.partner1 = 0;
        removeChild(edit, draft, id);
        if (draft.partner0 == 0 && draft.partner1 == 0 && draft.children == 0) edit.removeFamily(row);
    }
}

}  // namespace

void Family::removePerson(std::int64_t id) {
    const detail::RowPlace place{FamilyTable::persons, FamilyError::kNoRow, id};
    if (!hasPerson(id)) place.fail("id", std::to_string(id) + " is not the id of a person");
    FamilyEdit edit(*this);
    removeFromPersons(edit, static_cast<FamilyId>(id));
    removeFromFamilies(edit, static_cast<FamilyId>(id));
    edit.removePerson(edit.state().personRow(id));
    edit.commit();
}

}  // namespace olvane
