// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The table of a family in C: made, changed and read; what it refuses becomes a status and an error.

#include <olvane_family.h>

#include <algorithm>
#include <cstring>
#include <memory>
#include <new>
#include <string_view>
#include <vector>

#include "FamilyInput.h"
#include "FamilyInternal.h"

namespace {

using olvane::Family;
using olvane::FamilyError;
using olvane::c::childrenOf;
using olvane::c::rowOf;
using olvane::c::viewOf;

template <std::size_t size>
void copyText(char (&target)[size], std::string_view text) {
    const std::size_t length = std::min(text.size(), size - 1);
    std::memcpy(target, text.data(), length);
    target[length] = '\0';
}

olvane_status refused(const FamilyError& refusal, olvane_family_error* error) {
    if (!error) return OLVANE_REFUSED;
    error->table = static_cast<olvane_family_table>(refusal.table());
    error->row = refusal.row();
    error->id = refusal.id();
    copyText(error->field, refusal.field());
    copyText(error->message, refusal.what());
    return OLVANE_REFUSED;
}

void clear(olvane_family_error* error) {
    if (!error) return;
    *error = {};
    error->row = OLVANE_NO_ROW;
}

// A status for whatever the work throws.
template <class Work>
olvane_status guarded(olvane_family_error* error, Work work) noexcept {
    clear(error);
    try {
        work();
    } catch (const FamilyError& refusal) {
        return refused(refusal, error);
    } catch (const std::bad_alloc&) {
        if (error) copyText(error->message, "there is not enough memory");
        return OLVANE_OUT_OF_MEMORY;
    } catch (...) {
        return OLVANE_OUT_OF_MEMORY;  // std::length_error: a list that no memory could hold
    }
    return OLVANE_OK;
}

olvane_text textOf(std::string_view text) {
    return {text.empty() ? "" : text.data(), text.size()};
}

olvane_status copyIds(const std::vector<olvane::FamilyId>& ids, std::uint32_t* target, std::size_t room) {
    if (ids.size() > room || (!target && !ids.empty())) return OLVANE_INVALID_ARGUMENT;
    std::copy(ids.begin(), ids.end(), target);
    return OLVANE_OK;
}

}  // namespace

olvane_status olvane_family_create(const olvane_family_columns* columns, olvane_family** family,
                                   olvane_family_error* error) {
    if (!family) return OLVANE_INVALID_ARGUMENT;
    *family = nullptr;
    bool isKnown = true;
    const olvane_status status = guarded(error, [&] {
        auto made = std::make_unique<olvane_family>();
        if (columns) {
            const olvane::c::FamilyInput given(*columns);
            isKnown = given.areOfKnownTypes();
            if (isKnown) made->table = Family(given.columns());
        }
        if (isKnown) *family = made.release();
    });
    return isKnown ? status : OLVANE_INVALID_ARGUMENT;
}

olvane_status olvane_family_copy(const olvane_family* family, olvane_family** copy) {
    if (!copy) return OLVANE_INVALID_ARGUMENT;
    *copy = nullptr;
    if (!family) return OLVANE_INVALID_ARGUMENT;
    return guarded(nullptr, [&] { *copy = new olvane_family{family->table}; });
}

void olvane_family_free(olvane_family* family) {
    delete family;
}

olvane_status olvane_family_add_person(olvane_family* family, const olvane_person_row* row,
                                       olvane_family_error* error) {
    if (!family || !row) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.addPerson(rowOf(*row)); });
}

olvane_status olvane_family_set_person(olvane_family* family, const olvane_person_row* row,
                                       olvane_family_error* error) {
    if (!family || !row) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.setPerson(rowOf(*row)); });
}

olvane_status olvane_family_remove_person(olvane_family* family, int64_t id, olvane_family_error* error) {
    if (!family) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.removePerson(id); });
}

olvane_status olvane_family_set_spouses(olvane_family* family, int64_t id, const int64_t* spouses,
                                        size_t count, int64_t preferred, olvane_family_error* error) {
    if (!family || (!spouses && count > 0)) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.setSpouses(id, std::span(spouses, count), preferred); });
}

olvane_status olvane_family_set_children(olvane_family* family, int64_t id, const int64_t* children,
                                         size_t count, olvane_family_error* error) {
    if (!family || (!children && count > 0)) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.setChildren(id, std::span(children, count)); });
}

olvane_status olvane_family_set_names(olvane_family* family, int64_t id, const olvane_name_part* names,
                                      size_t count, olvane_family_error* error) {
    if (!family || (!names && count > 0)) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.setNames(id, olvane::c::namesOf(names, count)); });
}

olvane_status olvane_family_set_field(olvane_family* family, int64_t id, const char* key, const char* text,
                                      olvane_family_error* error) {
    if (!family) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.setField(id, viewOf(key), viewOf(text)); });
}

olvane_status olvane_family_add_family(olvane_family* family, const olvane_family_row* row,
                                       const olvane_family_child* children, size_t count,
                                       olvane_family_error* error) {
    if (!family || !row || (!children && count > 0)) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.addFamily(rowOf(*row), childrenOf(children, count)); });
}

olvane_status olvane_family_set_family(olvane_family* family, const olvane_family_row* row,
                                       const olvane_family_child* children, size_t count,
                                       olvane_family_error* error) {
    if (!family || !row || (!children && count > 0)) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.setFamily(rowOf(*row), childrenOf(children, count)); });
}

olvane_status olvane_family_remove_family(olvane_family* family, int64_t number, olvane_family_error* error) {
    if (!family) return OLVANE_INVALID_ARGUMENT;
    return guarded(error, [&] { family->table.removeFamily(number); });
}

size_t olvane_family_person_count(const olvane_family* family) {
    return family ? family->table.personCount() : 0;
}

size_t olvane_family_family_count(const olvane_family* family) {
    return family ? family->table.familyCount() : 0;
}

size_t olvane_family_memory_bytes(const olvane_family* family) {
    return family ? family->table.memoryBytes() : 0;
}

olvane_status olvane_family_person_ids(const olvane_family* family, uint32_t* ids, size_t room) {
    if (!family) return OLVANE_INVALID_ARGUMENT;
    olvane_status status = OLVANE_OK;
    const olvane_status made =
        guarded(nullptr, [&] { status = copyIds(family->table.personIds(), ids, room); });
    return made == OLVANE_OK ? status : made;
}

olvane_status olvane_family_family_numbers(const olvane_family* family, uint32_t* numbers, size_t room) {
    if (!family) return OLVANE_INVALID_ARGUMENT;
    olvane_status status = OLVANE_OK;
    const olvane_status made =
        guarded(nullptr, [&] { status = copyIds(family->table.familyNumbers(), numbers, room); });
    return made == OLVANE_OK ? status : made;
}

olvane_status olvane_family_person(const olvane_family* family, int64_t id, olvane_person* person) {
    if (!family || !person) return OLVANE_INVALID_ARGUMENT;
    if (!family->table.hasPerson(id)) return OLVANE_INVALID_PERSON;
    const Family& table = family->table;
    const olvane::PersonRow row = table.person(id);
    const auto spouses = table.spouses(id);
    const auto children = table.children(id);
    *person = {row.id,
               row.father,
               row.mother,
               table.preferredSpouse(id),
               static_cast<std::int32_t>(row.sex),
               row.dead ? 1 : 0,
               textOf(row.birth),
               textOf(row.death),
               textOf(row.birthWritten),
               textOf(row.deathWritten),
               spouses.data(),
               spouses.size(),
               children.data(),
               children.size()};
    return OLVANE_OK;
}

olvane_status olvane_family_name_at(const olvane_family* family, int64_t id, size_t place, int32_t* kind,
                                    olvane_text* text) {
    if (!family || !kind || !text) return OLVANE_INVALID_ARGUMENT;
    if (!family->table.hasPerson(id)) return OLVANE_INVALID_PERSON;
    bool isThere = false;
    const olvane_status made = guarded(nullptr, [&] {
        const std::vector<olvane::NamePart> names = family->table.names(id);
        isThere = place < names.size();
        if (!isThere) return;
        *kind = static_cast<std::int32_t>(names[place].kind);
        *text = textOf(names[place].text);
    });
    return made == OLVANE_OK && !isThere ? OLVANE_INVALID_ARGUMENT : made;
}

olvane_status olvane_family_field_at(const olvane_family* family, int64_t id, size_t place, olvane_text* key,
                                     olvane_text* text) {
    if (!family || !key || !text) return OLVANE_INVALID_ARGUMENT;
    if (!family->table.hasPerson(id)) return OLVANE_INVALID_PERSON;
    bool isThere = false;
    const olvane_status made = guarded(nullptr, [&] {
        const std::vector<olvane::LabelField> fields = family->table.fields(id);
        isThere = place < fields.size();
        if (!isThere) return;
        *key = textOf(fields[place].key);
        *text = textOf(fields[place].text);
    });
    return made == OLVANE_OK && !isThere ? OLVANE_INVALID_ARGUMENT : made;
}

olvane_status olvane_family_family(const olvane_family* family, int64_t number, int64_t* partner0,
                                   int64_t* partner1, int32_t* state, olvane_text* marriage,
                                   olvane_text* marriage_written, olvane_text* marriage_place) {
    if (!family || !family->table.hasFamily(number)) return OLVANE_INVALID_ARGUMENT;
    const olvane::FamilyRow row = family->table.family(number);
    if (partner0) *partner0 = row.partner0;
    if (partner1) *partner1 = row.partner1;
    if (state) *state = static_cast<std::int32_t>(row.state);
    if (marriage) *marriage = textOf(row.marriage);
    if (marriage_written) *marriage_written = textOf(row.marriageWritten);
    if (marriage_place) *marriage_place = textOf(row.marriagePlace);
    return OLVANE_OK;
}

olvane_status olvane_family_family_children(const olvane_family* family, int64_t number,
                                            olvane_family_child* children, size_t room, size_t* count) {
    if (!family || !count || (!children && room > 0) || !family->table.hasFamily(number)) {
        return OLVANE_INVALID_ARGUMENT;
    }
    return guarded(nullptr, [&] {
        const std::vector<olvane::FamilyChild> list = family->table.familyChildren(number);
        *count = list.size();
        for (std::size_t i = 0; i < std::min(room, list.size()); ++i) {
            children[i] = {list[i].child, static_cast<std::int32_t>(list[i].kind)};
        }
    });
}
