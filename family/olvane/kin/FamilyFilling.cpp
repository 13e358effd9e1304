// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Fills an empty table from columns: persons, then families, then the lists, by counting how long each is. Every
// row is checked before the table is handed out, so a table that is there is a right one.

#include <olvane/kin/FamilyFillingInternal.h>

#include <memory>

namespace olvane {

// An id that the columns name, of a person who is there.
FamilyId FamilyFilling::personId(const ColumnRows& table, const NumberColumn& column, std::size_t row,
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
    const ColumnRows table(FamilyTable::persons, persons.id, "id");
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

void FamilyFilling::addPerson(const ColumnRows& table, std::size_t row) {
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
    const ColumnRows table(FamilyTable::persons, columns_.persons.id, "id");
    for (std::size_t row = 0; row < table.size(); ++row) {
        personId(table, columns_.persons.father, row, "father", true);
        personId(table, columns_.persons.mother, row, "mother", true);
    }
}

void FamilyFilling::addFamilies() {
    const FamilyColumns::Families& families = columns_.families;
    const ColumnRows table(FamilyTable::families, families.number, "number");
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

Family::Family(const FamilyColumns& columns) {
    auto filled = std::make_unique<State>();
    FamilyFilling(*filled, columns).run();
    filled->tidyWords = filled->blobs.addedWords();
    state_ = filled.release();
}

}  // namespace olvane
