// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What C hands over for a table of a family, in the types that the table takes.

#include "FamilyInput.h"

#include <cstring>
#include <span>

namespace olvane::c {

namespace {

// A choice that does not fit its byte must not become one that does.
template <class Choice>
Choice choiceOf(std::int32_t number) {
    return static_cast<Choice>(number >= 0 && number < 255 ? number : 255);
}

}  // namespace

FamilyInput::FamilyInput(const olvane_family_columns& given) {
    const auto& persons = given.persons;
    columns_.persons = {numbers(persons.id),  numbers(persons.father),      numbers(persons.mother),
                        numbers(persons.sex), numbers(persons.dead),        texts(persons.birth),
                        texts(persons.death), texts(persons.birth_written), texts(persons.death_written)};
    columns_.spouses = {numbers(given.spouses.person), numbers(given.spouses.spouse),
                        numbers(given.spouses.preferred)};
    columns_.children = {numbers(given.children.parent), numbers(given.children.child)};
    const auto& families = given.families;
    columns_.families = {numbers(families.number),      numbers(families.partner0),
                         numbers(families.partner1),    numbers(families.state),
                         texts(families.marriage),      texts(families.marriage_written),
                         texts(families.marriage_place)};
    columns_.familyChildren = {numbers(given.family_children.family), numbers(given.family_children.child),
                               numbers(given.family_children.kind)};
    columns_.names = {numbers(given.names.person), numbers(given.names.kind), texts(given.names.text)};
    columns_.fields = {numbers(given.fields.person), texts(given.fields.key), texts(given.fields.text)};
}

NumberColumn FamilyInput::numbers(const olvane_numbers& given) {
    if (!given.data) return {};
    if (given.type < OLVANE_INT8 || given.type > OLVANE_DOUBLE) {
        typesAreKnown_ = false;
        return {};
    }
    return NumberColumn(static_cast<NumberColumn::Type>(given.type), given.data, given.count);
}

TextColumn FamilyInput::texts(const olvane_texts& given) {
    if (given.texts) return TextColumn(std::span(given.texts, given.count));
    if (!given.bytes) return {};
    if (given.starts) return TextColumn(given.bytes, given.length, std::span(given.starts, given.count + 1));
    return TextColumn(std::span<const std::string_view>(endedByZero(given)));
}

const std::vector<std::string_view>& FamilyInput::endedByZero(const olvane_texts& given) {
    std::vector<std::string_view>& views = views_.emplace_back();
    views.reserve(given.count);
    const char* at = given.bytes;
    const char* const end = given.bytes + given.length;
    while (at != end) {
        const void* const found = std::memchr(at, '\0', static_cast<std::size_t>(end - at));
        const char* const last = found ? static_cast<const char*>(found) : end;
        views.emplace_back(at, static_cast<std::size_t>(last - at));
        at = found ? last + 1 : end;
    }
    return views;
}

PersonRow rowOf(const olvane_person_row& row) {
    return {row.id,
            row.father,
            row.mother,
            choiceOf<kin::Sex>(row.sex),
            row.dead != 0,
            viewOf(row.birth),
            viewOf(row.death),
            viewOf(row.birth_written),
            viewOf(row.death_written)};
}

FamilyRow rowOf(const olvane_family_row& row) {
    return {row.number,
            row.partner0,
            row.partner1,
            choiceOf<kin::UnionState>(row.state),
            viewOf(row.marriage),
            viewOf(row.marriage_written),
            viewOf(row.marriage_place)};
}

std::vector<FamilyChild> childrenOf(const olvane_family_child* children, std::size_t count) {
    std::vector<FamilyChild> list;
    list.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        list.push_back({children[i].child, choiceOf<kin::ChildKind>(children[i].kind)});
    }
    return list;
}

std::vector<NamePart> namesOf(const olvane_name_part* names, std::size_t count) {
    std::vector<NamePart> parts;
    parts.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        parts.push_back({choiceOf<NameKind>(names[i].kind), viewOf(names[i].text)});
    }
    return parts;
}

}  // namespace olvane::c
