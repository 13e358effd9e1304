// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <stdexcept>
#include <string>
#include <string_view>

#include <olvane/Export.h>

namespace olvane {

// The lists of rows that a table of a family is filled from.
enum class FamilyTable : std::uint8_t { persons, spouses, children, families, familyChildren, names, fields };

// "persons", "spouses", "children", "families", "family children", "names" or "fields". Valid until the program ends.
OLVANE_API std::string_view familyTableName(FamilyTable table);

// What a table of a family refuses. Thrown before anything of the table changes.
//
// Holds: row counts from 0 in the columns that were handed over; kNoRow for an edit of one row, which id names
//        instead. field is the name of the column or of the member. what() is a sentence such as
//        "persons row 12, field father: 99 is not the id of a person".
class OLVANE_API FamilyError : public std::invalid_argument {
public:
    static constexpr std::size_t kNoRow = static_cast<std::size_t>(-1);

    FamilyError(FamilyTable table, std::size_t row, std::int64_t id, std::string_view field,
                const std::string& reason);

    FamilyTable table() const { return table_; }
    std::size_t row() const { return row_; }
    // Of the person or family that was edited; 0 where row counts, and where a whole column is wrong.
    std::int64_t id() const { return id_; }
    const std::string& field() const { return field_; }
    const std::string& reason() const { return reason_; }

private:
    FamilyTable table_;
    std::size_t row_;
    std::int64_t id_;
    std::string field_;
    std::string reason_;
};

}  // namespace olvane
