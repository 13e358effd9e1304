// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A table of columns: each is written to a place in the module's memory, and all are handed over in one call.

#include <array>
#include <cstddef>
#include <memory>
#include <new>
#include <span>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/kin/Family.h>

#include "FamilyOutcome.h"
#include "HeldFamily.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

// Columns on their way in. JavaScript gives each a place to be written to, which lives as long as this object.
struct ColumnsInMaking {
    FamilyColumns columns;
    std::vector<std::unique_ptr<char[]>> places;
    std::vector<std::unique_ptr<std::vector<std::string_view>>> texts;
};

std::array<NumberColumn*, 20> numberColumns(FamilyColumns& to) {
    return {&to.persons.id,           &to.persons.father,      &to.persons.mother,
            &to.persons.sex,          &to.persons.dead,        &to.spouses.person,
            &to.spouses.spouse,       &to.spouses.preferred,   &to.children.parent,
            &to.children.child,       &to.families.number,     &to.families.partner0,
            &to.families.partner1,    &to.families.state,      &to.familyChildren.family,
            &to.familyChildren.child, &to.familyChildren.kind, &to.names.person,
            &to.names.kind,           &to.fields.person};
}

std::array<TextColumn*, 10> textColumns(FamilyColumns& to) {
    return {&to.persons.birth,
            &to.persons.death,
            &to.persons.birthWritten,
            &to.persons.deathWritten,
            &to.families.marriage,
            &to.families.marriageWritten,
            &to.families.marriagePlace,
            &to.names.text,
            &to.fields.key,
            &to.fields.text};
}

}  // namespace
}  // namespace olvane::js

using namespace olvane;
using js::ColumnsInMaking;
using js::HeldFamily;

OLVANE_EXPORT("family_columns") ColumnsInMaking* familyColumns() {
    return new (std::nothrow) ColumnsInMaking;
}

OLVANE_EXPORT("family_columns_free") void familyColumnsFree(ColumnsInMaking* columns) {
    delete columns;
}

// Where JavaScript writes the bytes of a column; null where memory is short.
OLVANE_EXPORT("family_place") char* familyPlace(ColumnsInMaking* columns, std::size_t bytes) {
    try {
        // Zeros behind the bytes align the next place and end the last text.
        return columns->places.emplace_back(new char[bytes + 8]).get();
    } catch (const std::bad_alloc&) {
        return nullptr;
    }
}

// The column of that number is what was written to place.
OLVANE_EXPORT("family_numbers")
void familyNumbers(ColumnsInMaking* columns, std::size_t column, int type, const char* place,
                   std::size_t count) {
    *js::numberColumns(columns->columns)[column] =
        NumberColumn(static_cast<NumberColumn::Type>(type), place, count);
}

// The texts at place, each ended by a zero byte. 0, or 2 where memory is short.
OLVANE_EXPORT("family_texts")
int familyTexts(ColumnsInMaking* columns, std::size_t column, const char* place, std::size_t count) {
    return js::outcomeOf([&] {
        auto texts = std::make_unique<std::vector<std::string_view>>();
        texts->reserve(count);
        for (const char* at = place; texts->size() < count; at += texts->back().size() + 1)
            texts->emplace_back(at);
        *js::textColumns(columns->columns)[column] = std::span<const std::string_view>(*texts);
        columns->texts.push_back(std::move(texts));
    });
}

// 0 with the family in *family; 1 with an error in last_family_text; 2 where memory is short.
OLVANE_EXPORT("family_create") int familyCreate(const ColumnsInMaking* columns, HeldFamily** family) {
    *family = nullptr;
    return js::outcomeOf([&] { *family = new HeldFamily{Family(columns->columns)}; });
}
