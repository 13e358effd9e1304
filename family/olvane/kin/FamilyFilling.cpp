// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Fills an empty table from columns: persons, then families, then the lists, by counting how long each is. Every
// row is looked at before the table is handed out, so a table that is there is a right one.

#include <olvane/kin/Family.h>

#include <memory>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

#include <olvane/kin/FamilyChecksInternal.h>
#include <olvane/kin/FamilyStateInternal.h>

namespace olvane {

using detail::RowPlace;
using detail::StoredFamily;
using detail::StoredPerson;

namespace {

// Entries that belong to rows, as lists: those of row r are order[start[r]] to order[start[r + 1] - 1].
struct Groups {
    std::vector<std::uint32_t> start;
    std::vector<std::uint32_t> order;

    Groups(std::size_t rows, const std::vector<std::uint32_t>& rowOfEntry)
        : start(rows + 1, 0), order(rowOfEntry.size()) {
        for (const std::uint32_t row : rowOfEntry) ++start[row + 1];
        for (std::size_t row = 0; row < rows; ++row) start[row + 1] += start[row];
        std::vector<std::uint32_t> next(start.begin(), start.end() - 1);
        for (std::size_t entry = 0; entry < rowOfEntry.size(); ++entry) {
            order[next[rowOfEntry[entry]]++] = static_cast<std::uint32_t>(entry);
        }
    }
    std::span<const std::uint32_t> of(std::size_t row) const {
        return std::span(order).subspan(start[row], start[row + 1] - start[row]);
    }
};

// Whose list has whom, in the order of the lists.
struct Pairs {
    std::vector<std::uint32_t> ownerRow;
    std::vector<FamilyId> listed;

    void add(std::uint32_t row, FamilyId id) {
        ownerRow.push_back(row);
        listed.push_back(id);
    }
};

// The rows of one list of the columns; a column in it has as many.
class Table {
public:
    Table(FamilyTable table, const NumberColumn& key, std::string_view keyField)
        : table_(table), size_(key.size()), keyField_(keyField), keyIsGiven_(key.isGiven()) {}

    bool isGiven() const { return keyIsGiven_; }
    std::size_t size() const { return size_; }
    RowPlace place(std::size_t row) const { return {table_, row, 0}; }

    template <class Column>
    void check(const Column& column, std::string_view field, bool isNeeded = false) const {
        const RowPlace place{table_};
        if (!column.isGiven()) {
            if (isNeeded && (size_ > 0 || keyIsGiven_)) place.fail(field, "the column is missing");
            return;
        }
        if (!keyIsGiven_) place.fail(keyField_, "the column is missing");
        if (column.size() != size_) {
            place.fail(field, "the column has " + std::to_string(column.size()) + " rows, and " +
                                  std::string(keyField_) + " has " + std::to_string(size_));
        }
    }

    std::int64_t number(const NumberColumn& column, std::size_t row, std::string_view field,
                        std::int64_t otherwise = 0) const {
        if (!column.isGiven()) return otherwise;
        const std::optional<std::int64_t> number = column.at(row);
        if (!number) place(row).fail(field, "the number is not whole");
        return *number;
    }
    std::string_view text(const TextColumn& column, std::size_t row, std::string_view field) const {
        if (!column.isGiven()) return {};
        const std::optional<std::string_view> text = column.at(row);
        if (!text) place(row).fail(field, "the starts of the texts are not in order");
        detail::checkText(place(row), field, *text);
        return *text;
    }

private:
    FamilyTable table_;
    std::size_t size_;
    std::string_view keyField_;
    bool keyIsGiven_;
};

}  // namespace

class FamilyFilling {
public:
    FamilyFilling(Family::State& state, const FamilyColumns& columns) : state_(state), columns_(columns) {}

    void run() {
        addPersons();
        checkParents();
        addFamilies();
        addFamilyChildren();
        addSpouses();
        addChildren();
        addNames();
        addFields();
    }

private:
    void addPersons();
    void addPerson(const Table& table, std::size_t row);
    void checkParents();
    void addFamilies();
    void addFamilyChildren();
    void addSpouses();
    void addPreferred(const Table& table);
    void addChildren();
    void addNames();
    void addFields();
    std::uint32_t keyNumber(const RowPlace& place, std::string_view key);

    FamilyId personId(const Table& table, const NumberColumn& column, std::size_t row, std::string_view field,
                      bool mayBeNobody);
    std::uint32_t personRow(const Table& table, const NumberColumn& column, std::size_t row,
                            std::string_view field) {
        return state_.personRow(personId(table, column, row, field, false));
    }
    detail::Reference writtenDate(std::string_view written, std::string_view sorting,
                                  detail::Reference sortingPlace);
    void pairsOfFamilies(Pairs& spouses, Pairs& children) const;
    void storeLists(const Pairs& pairs, detail::Reference StoredPerson::*list, const Table* table,
                    std::string_view field);

    Family::State& state_;
    const FamilyColumns& columns_;
    std::unordered_map<std::string, std::uint32_t> keyNumbers_;
};

// An id that the columns name, of a person who is there.
FamilyId FamilyFilling::personId(const Table& table, const NumberColumn& column, std::size_t row,
                                 std::string_view field, bool mayBeNobody) {
    const std::int64_t number = table.number(column, row, field);
    const FamilyId id = mayBeNobody ? detail::checkedIdOrNobody(table.place(row), field, number)
                                    : detail::checkedId(table.place(row), field, number);
    if (id != 0 && state_.personRow(id) == detail::IdIndex::kNoRow) {
        table.place(row).fail(field, std::to_string(id) + " is not the id of a person");
    }
    return id;
}

detail::Reference FamilyFilling::writtenDate(std::string_view written, std::string_view sorting,
                                             detail::Reference sortingPlace) {
    return written.empty() || written == sorting ? sortingPlace : state_.blobs.add(written);
}

void FamilyFilling::addPersons() {
    const FamilyColumns::Persons& persons = columns_.persons;
    const Table table(FamilyTable::persons, persons.id, "id");
    table.check(persons.father, "father");
    table.check(persons.mother, "mother");
    table.check(persons.sex, "sex");
    table.check(persons.dead, "dead");
    table.check(persons.birth, "birth");
    table.check(persons.death, "death");
    table.check(persons.birthWritten, "birthWritten");
    table.check(persons.deathWritten, "deathWritten");
    for (std::size_t row = 0; row < table.size(); ++row) addPerson(table, row);
    state_.personCount = table.size();
}

void FamilyFilling::addPerson(const Table& table, std::size_t row) {
    const FamilyColumns::Persons& persons = columns_.persons;
    const RowPlace place = table.place(row);
    StoredPerson stored;
    stored.id = detail::checkedId(place, "id", table.number(persons.id, row, "id"));
    if (state_.personRow(stored.id) != detail::IdIndex::kNoRow) {
        place.fail("id", std::to_string(stored.id) + " is the id of another row");
    }
    stored.father = detail::checkedIdOrNobody(place, "father", table.number(persons.father, row, "father"));
    stored.mother = detail::checkedIdOrNobody(place, "mother", table.number(persons.mother, row, "mother"));
    stored.sex = static_cast<kin::Sex>(
        detail::checkedChoice(place, "sex", table.number(persons.sex, row, "sex", 2), 2));
    stored.dead = detail::checkedChoice(place, "dead", table.number(persons.dead, row, "dead"), 1) != 0;
    const std::string_view birth = table.text(persons.birth, row, "birth");
    const std::string_view death = table.text(persons.death, row, "death");
    stored.birth = state_.blobs.add(birth);
    stored.death = state_.blobs.add(death);
    stored.birthWritten =
        writtenDate(table.text(persons.birthWritten, row, "birthWritten"), birth, stored.birth);
    stored.deathWritten =
        writtenDate(table.text(persons.deathWritten, row, "deathWritten"), death, stored.death);
    state_.personIndex.add(stored.id);
    state_.persons.add(stored);
}

// Parents may stand behind their children, so they are looked for when everybody is there.
void FamilyFilling::checkParents() {
    const Table table(FamilyTable::persons, columns_.persons.id, "id");
    for (std::size_t row = 0; row < table.size(); ++row) {
        personId(table, columns_.persons.father, row, "father", true);
        personId(table, columns_.persons.mother, row, "mother", true);
    }
}

void FamilyFilling::addFamilies() {
    const FamilyColumns::Families& families = columns_.families;
    const Table table(FamilyTable::families, families.number, "number");
    table.check(families.partner0, "partner0");
    table.check(families.partner1, "partner1");
    table.check(families.state, "state");
    table.check(families.marriage, "marriage");
    table.check(families.marriageWritten, "marriageWritten");
    table.check(families.marriagePlace, "marriagePlace");
    for (std::size_t row = 0; row < table.size(); ++row) {
        const RowPlace place = table.place(row);
        StoredFamily stored;
        stored.number = detail::checkedId(place, "number", table.number(families.number, row, "number"));
        if (state_.familyRow(stored.number) != detail::IdIndex::kNoRow) {
            place.fail("number", std::to_string(stored.number) + " is the number of another row");
        }
        stored.partner0 = personId(table, families.partner0, row, "partner0", true);
        stored.partner1 = personId(table, families.partner1, row, "partner1", true);
        stored.state = static_cast<kin::UnionState>(
            detail::checkedChoice(place, "state", table.number(families.state, row, "state", 3), 3));
        const std::string_view marriage = table.text(families.marriage, row, "marriage");
        stored.marriage = state_.blobs.add(marriage);
        stored.marriageWritten = writtenDate(table.text(families.marriageWritten, row, "marriageWritten"),
                                             marriage, stored.marriage);
        stored.marriagePlace = state_.blobs.add(table.text(families.marriagePlace, row, "marriagePlace"));
        state_.familyIndex.add(stored.number);
        state_.families.add(stored);
    }
    state_.familyCount = table.size();
}

void FamilyFilling::addFamilyChildren() {
    const FamilyColumns::FamilyChildren& entries = columns_.familyChildren;
    const Table table(FamilyTable::familyChildren, entries.family, "family");
    table.check(entries.child, "child", true);
    table.check(entries.kind, "kind");
    std::vector<std::uint32_t> familyOf(table.size());
    std::vector<FamilyId> children(table.size());
    std::string kinds(table.size(), '\0');
    for (std::size_t row = 0; row < table.size(); ++row) {
        const RowPlace place = table.place(row);
        const FamilyId number =
            detail::checkedId(place, "family", table.number(entries.family, row, "family"));
        familyOf[row] = state_.familyRow(number);
        if (familyOf[row] == detail::IdIndex::kNoRow) {
            place.fail("family", std::to_string(number) + " is not the number of a family");
        }
        children[row] = personId(table, entries.child, row, "child", false);
        kinds[row] = static_cast<char>(
            detail::checkedChoice(place, "kind", table.number(entries.kind, row, "kind"), 5));
    }
    const Groups groups(state_.families.size(), familyOf);
    std::vector<FamilyId> list;
    std::string listKinds;
    std::vector<std::size_t> repeats;
    for (std::size_t family = 0; family < state_.families.size(); ++family) {
        const auto rows = groups.of(family);
        if (rows.empty()) continue;
        list.clear();
        listKinds.clear();
        for (const std::uint32_t row : rows) {
            list.push_back(children[row]);
            listKinds += kinds[row];
        }
        detail::findRepeats(list, repeats);
        if (!repeats.empty()) {
            table.place(rows[repeats[0]])
                .fail("child", std::to_string(list[repeats[0]]) + " is in this family already");
        }
        StoredFamily& stored = state_.families.edit(family);
        stored.children = state_.blobs.add(std::span<const FamilyId>(list));
        const bool allByBirth = listKinds.find_first_not_of('\0') == std::string::npos;
        stored.kinds = allByBirth ? 0 : state_.blobs.add(std::string_view(listKinds));
    }
}

// The lists that follow from the families.
void FamilyFilling::pairsOfFamilies(Pairs& spouses, Pairs& children) const {
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
void FamilyFilling::storeLists(const Pairs& pairs, detail::Reference StoredPerson::*list, const Table* table,
                               std::string_view field) {
    const Groups groups(state_.persons.size(), pairs.ownerRow);
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
    const Table table(FamilyTable::spouses, rows.person, "person");
    table.check(rows.spouse, "spouse", true);
    table.check(rows.preferred, "preferred");
    Pairs pairs;
    Pairs unused;
    if (!table.isGiven()) pairsOfFamilies(pairs, unused);
    for (std::size_t row = 0; row < table.size(); ++row) {
        const std::uint32_t owner = personRow(table, rows.person, row, "person");
        pairs.add(owner, personId(table, rows.spouse, row, "spouse", false));
    }
    storeLists(pairs, &StoredPerson::spouses, table.isGiven() ? &table : nullptr, "spouse");
    addPreferred(table);
}

void FamilyFilling::addPreferred(const Table& table) {
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
    const Table table(FamilyTable::children, rows.parent, "parent");
    table.check(rows.child, "child", true);
    Pairs pairs;
    for (std::size_t row = 0; row < table.size(); ++row) {
        const std::uint32_t owner = personRow(table, rows.parent, row, "parent");
        pairs.add(owner, personId(table, rows.child, row, "child", false));
    }
    if (!table.isGiven()) {
        Pairs unused;
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
    const Table table(FamilyTable::names, rows.person, "person");
    table.check(rows.kind, "kind");
    table.check(rows.text, "text", true);
    std::vector<std::uint32_t> owners(table.size());
    for (std::size_t row = 0; row < table.size(); ++row)
        owners[row] = personRow(table, rows.person, row, "person");
    const Groups groups(state_.persons.size(), owners);
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
    const Table table(FamilyTable::fields, rows.person, "person");
    table.check(rows.key, "key", true);
    table.check(rows.text, "text", true);
    std::vector<std::uint32_t> owners(table.size());
    std::vector<std::uint32_t> keys(table.size());
    for (std::size_t row = 0; row < table.size(); ++row) {
        owners[row] = personRow(table, rows.person, row, "person");
        keys[row] = keyNumber(table.place(row), table.text(rows.key, row, "key"));
    }
    const Groups groups(state_.persons.size(), owners);
    std::string packed;
    std::vector<FamilyId> keysOfPerson;
    std::vector<std::size_t> repeats;
    for (std::size_t person = 0; person < state_.persons.size(); ++person) {
        const auto entries = groups.of(person);
        if (entries.empty()) continue;
        packed.clear();
        keysOfPerson.clear();
        for (const std::uint32_t row : entries) keysOfPerson.push_back(keys[row]);
        detail::findRepeats(keysOfPerson, repeats);
        if (!repeats.empty()) {
            table.place(entries[repeats[0]])
                .fail("key",
                      "person " + std::to_string(state_.persons[person].id) + " has this field already");
        }
        for (const std::uint32_t row : entries) {
            const std::string_view text = table.text(rows.text, row, "text");
            if (!text.empty()) detail::appendPacked(packed, {keys[row], text}, detail::kFieldHeadBytes);
        }
        state_.persons.edit(person).fields = state_.blobs.add(std::string_view(packed));
    }
}

Family::Family(const FamilyColumns& columns) {
    auto filled = std::make_unique<State>();
    FamilyFilling(*filled, columns).run();
    filled->tidyWords = filled->blobs.addedWords();
    state_ = filled.release();
}

}  // namespace olvane
