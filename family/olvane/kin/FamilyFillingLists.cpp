// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lists of an empty table: children of families, spouses and children of persons, names and fields. Entries are grouped
// by the row that they belong to, and keep their order in each group.

#include <olvane/kin/FamilyFillingInternal.h>

namespace olvane {

void FamilyFilling::addFamilyChildren() {
    const ColumnRows table(FamilyTable::familyChildren, columns_.familyChildren.family, "family");
    table.check(columns_.familyChildren.child, "child", true);
    table.check(columns_.familyChildren.kind, "kind");
    const ChildEntries entries = childEntries(table);
    const GroupedRows groups(state_.families.size(), entries.familyRow);
    for (std::size_t family = 0; family < state_.families.size(); ++family) {
        if (!groups.of(family).empty()) storeFamilyChildren(table, entries, family, groups.of(family));
    }
}

FamilyFilling::ChildEntries FamilyFilling::childEntries(const ColumnRows& table) {
    const FamilyColumns::FamilyChildren& columns = columns_.familyChildren;
    ChildEntries entries;
    for (std::size_t row = 0; row < table.size(); ++row) {
        const RowPlace place = table.place(row);
        const FamilyId number =
            detail::checkedId(place, "family", table.number(columns.family, row, "family"));
        entries.familyRow.push_back(state_.familyRow(number));
        if (entries.familyRow.back() == detail::IdIndex::kNoRow) {
            place.fail("family", std::to_string(number) + " is not the number of a family");
        }
        entries.child.push_back(personId(table, columns.child, row, "child", false));
        entries.kind += static_cast<char>(
            detail::checkedChoice(place, "kind", table.number(columns.kind, row, "kind"), 5));
    }
    return entries;
}

void FamilyFilling::storeFamilyChildren(const ColumnRows& table, const ChildEntries& entries,
                                        std::size_t family, std::span<const std::uint32_t> rows) {
    ids_.clear();
    packed_.clear();
    for (const std::uint32_t row : rows) {
        ids_.push_back(entries.child[row]);
        packed_ += entries.kind[row];
    }
    detail::findRepeats(ids_, repeats_);
    if (!repeats_.empty()) {
        table.place(rows[repeats_[0]])
            .fail("child", std::to_string(ids_[repeats_[0]]) + " is in this family already");
    }
    StoredFamily& stored = state_.families.edit(family);
    stored.children = state_.blobs.add(std::span<const FamilyId>(ids_));
    const bool allByBirth = packed_.find_first_not_of('\0') == std::string::npos;
    stored.kinds = allByBirth ? 0 : state_.blobs.add(std::string_view(packed_));
}

// The lists that follow from the families.
void FamilyFilling::pairsOfFamilies(ListPairs& spouses, ListPairs& children) const {
    for (std::size_t i = 0; i < state_.families.size(); ++i) {
        const StoredFamily& family = state_.families[i];
        const FamilyId two[2] = {family.partner0, family.partner1};
        for (int k = 0; k < 2; ++k) {
            if (two[k] == 0 || (k == 1 && two[0] == two[1])) continue;
            const std::uint32_t row = state_.personRow(two[k]);
            if (two[1 - k] != 0) spouses.add(row, two[1 - k]);
            for (const FamilyId child : state_.blobs.list(family.children)) children.add(row, child);
        }
    }
}

// table is null for lists that follow from other rows, where a repeated person is left out and not refused.
void FamilyFilling::storeLists(const ListPairs& pairs, detail::Reference StoredPerson::*list,
                               const ColumnRows* table, std::string_view field) {
    const GroupedRows groups(state_.persons.size(), pairs.ownerRow);
    std::vector<FamilyId> ids;
    std::vector<std::size_t> repeats;
    for (std::size_t person = 0; person < state_.persons.size(); ++person) {
        const auto entries = groups.of(person);
        if (entries.empty()) continue;
        ids.clear();
        for (const std::uint32_t entry : entries) ids.push_back(pairs.listed[entry]);
        detail::findRepeats(ids, repeats);
        if (table != nullptr && !repeats.empty()) {
            table->place(entries[repeats[0]])
                .fail(field, std::to_string(ids[repeats[0]]) + " is in the list of person " +
                                 std::to_string(state_.persons[person].id) + " already");
        }
        for (auto at = repeats.rbegin(); at != repeats.rend(); ++at) {
            ids.erase(ids.begin() + static_cast<std::ptrdiff_t>(*at));
        }
        state_.persons.edit(person).*list = state_.blobs.add(std::span<const FamilyId>(ids));
    }
}

void FamilyFilling::addSpouses() {
    const FamilyColumns::Spouses& rows = columns_.spouses;
    const ColumnRows table(FamilyTable::spouses, rows.person, "person");
    table.check(rows.spouse, "spouse", true);
    table.check(rows.preferred, "preferred");
    ListPairs pairs;
    ListPairs unused;
    if (!table.isGiven()) pairsOfFamilies(pairs, unused);
    for (std::size_t row = 0; row < table.size(); ++row) {
        const std::uint32_t owner = personRow(table, rows.person, row, "person");
        pairs.add(owner, personId(table, rows.spouse, row, "spouse", false));
    }
    storeLists(pairs, &StoredPerson::spouses, table.isGiven() ? &table : nullptr, "spouse");
    addPreferred(table);
}

void FamilyFilling::addPreferred(const ColumnRows& table) {
    const FamilyColumns::Spouses& rows = columns_.spouses;
    if (!table.isGiven() || !rows.preferred.isGiven()) {
        for (std::size_t person = 0; person < state_.persons.size(); ++person) {
            const auto spouses = state_.blobs.list(state_.persons[person].spouses);
            if (!spouses.empty()) state_.persons.edit(person).preferred = spouses[0];
        }
        return;
    }
    for (std::size_t row = 0; row < table.size(); ++row) {
        const RowPlace place = table.place(row);
        if (detail::checkedChoice(place, "preferred", table.number(rows.preferred, row, "preferred"), 1) == 0)
            continue;
        StoredPerson& person = state_.persons.edit(personRow(table, rows.person, row, "person"));
        if (person.preferred != 0) {
            place.fail("preferred", std::to_string(person.preferred) + " is the preferred spouse of person " +
                                        std::to_string(person.id) + " already");
        }
        person.preferred = personId(table, rows.spouse, row, "spouse", false);
    }
}

void FamilyFilling::addChildren() {
    const FamilyColumns::Children& rows = columns_.children;
    const ColumnRows table(FamilyTable::children, rows.parent, "parent");
    table.check(rows.child, "child", true);
    ListPairs pairs;
    for (std::size_t row = 0; row < table.size(); ++row) {
        const std::uint32_t owner = personRow(table, rows.parent, row, "parent");
        pairs.add(owner, personId(table, rows.child, row, "child", false));
    }
    if (!table.isGiven()) {
        ListPairs unused;
        pairsOfFamilies(unused, pairs);
        for (std::size_t row = 0; row < state_.persons.size(); ++row) {
            const StoredPerson& person = state_.persons[row];
            if (person.father != 0) pairs.add(state_.personRow(person.father), person.id);
            if (person.mother != 0) pairs.add(state_.personRow(person.mother), person.id);
        }
    }
    storeLists(pairs, &StoredPerson::children, table.isGiven() ? &table : nullptr, "child");
}

void FamilyFilling::addNames() {
    const FamilyColumns::Names& rows = columns_.names;
    const ColumnRows table(FamilyTable::names, rows.person, "person");
    table.check(rows.kind, "kind");
    table.check(rows.text, "text", true);
    std::vector<std::uint32_t> owners(table.size());
    for (std::size_t row = 0; row < table.size(); ++row)
        owners[row] = personRow(table, rows.person, row, "person");
    const GroupedRows groups(state_.persons.size(), owners);
    std::string packed;
    for (std::size_t person = 0; person < state_.persons.size(); ++person) {
        if (groups.of(person).empty()) continue;
        packed.clear();
        for (const std::uint32_t row : groups.of(person)) {
            const std::uint8_t kind =
                detail::checkedChoice(table.place(row), "kind", table.number(rows.kind, row, "kind"),
                                      static_cast<std::uint8_t>(NameKind::other));
            detail::appendPacked(packed, {kind, table.text(rows.text, row, "text")}, detail::kNameHeadBytes);
        }
        state_.persons.edit(person).names = state_.blobs.add(std::string_view(packed));
    }
}

std::uint32_t FamilyFilling::keyNumber(const RowPlace& place, std::string_view key) {
    if (key.empty()) place.fail("key", "the key is empty");
    const auto [entry, isNew] = keyNumbers_.try_emplace(std::string(key), keyNumbers_.size());
    if (isNew) {
        if (state_.fieldKeys.size() >= Family::kMostFieldKeys)
            place.fail("key", "there are too many different keys");
        state_.fieldKeys.emplace_back(key);
    }
    return entry->second;
}

void FamilyFilling::addFields() {
    const FamilyColumns::Fields& rows = columns_.fields;
    const ColumnRows table(FamilyTable::fields, rows.person, "person");
    table.check(rows.key, "key", true);
    table.check(rows.text, "text", true);
    std::vector<std::uint32_t> owners(table.size());
    std::vector<std::uint32_t> keys(table.size());
    for (std::size_t row = 0; row < table.size(); ++row) {
        owners[row] = personRow(table, rows.person, row, "person");
        keys[row] = keyNumber(table.place(row), table.text(rows.key, row, "key"));
    }
    const GroupedRows groups(state_.persons.size(), owners);
    for (std::size_t person = 0; person < state_.persons.size(); ++person) {
        if (!groups.of(person).empty()) storeFields(table, keys, person, groups.of(person));
    }
}

void FamilyFilling::storeFields(const ColumnRows& table, const std::vector<std::uint32_t>& keys,
                                std::size_t person, std::span<const std::uint32_t> rows) {
    ids_.clear();
    for (const std::uint32_t row : rows) ids_.push_back(keys[row]);
    detail::findRepeats(ids_, repeats_);
    if (!repeats_.empty()) {
        table.place(rows[repeats_[0]])
            .fail("key", "person " + std::to_string(state_.persons[person].id) + " has this field already");
    }
    packed_.clear();
    for (const std::uint32_t row : rows) {
        const std::string_view text = table.text(columns_.fields.text, row, "text");
        if (!text.empty()) detail::appendPacked(packed_, {keys[row], text}, detail::kFieldHeadBytes);
    }
    state_.persons.edit(person).fields = state_.blobs.add(std::string_view(packed_));
}

}  // namespace olvane
