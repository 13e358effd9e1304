// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The sentence that says what is wrong where.

#include <olvane/kin/FamilyError.h>

namespace olvane {

namespace {

std::string placeOf(FamilyTable table, std::size_t row, std::int64_t id) {
    if (row != FamilyError::kNoRow)
        return std::string(familyTableName(table)) + " row " + std::to_string(row);
    if (id == 0) return std::string(familyTableName(table));
    const bool ofFamily = table == FamilyTable::families || table == FamilyTable::familyChildren;
    return std::string(ofFamily ? "family " : "person ") + std::to_string(id);
}

}  // namespace

std::string_view familyTableName(FamilyTable table) {
    switch (table) {
        case FamilyTable::persons:
            return "persons";
        case FamilyTable::spouses:
            return "spouses";
        case FamilyTable::children:
            return "children";
        case FamilyTable::families:
            return "families";
        case FamilyTable::familyChildren:
            return "family children";
        case FamilyTable::names:
            return "names";
        case FamilyTable::fields:
            return "fields";
    }
    return "rows";
}

FamilyError::FamilyError(FamilyTable table, std::size_t row, std::int64_t id, std::string_view field,
                         const std::string& reason)
    : std::invalid_argument(placeOf(table, row, id) + ", field " + std::string(field) + ": " + reason),
      table_(table),
      row_(row),
      id_(id),
      field_(field),
      reason_(reason) {}

}  // namespace olvane
