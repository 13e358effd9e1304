// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// What bulk filling and edits check alike.

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/kin/Family.h>

namespace olvane::detail {

// The row that is looked at, for the error that names it.
struct RowPlace {
    FamilyTable table;
    std::size_t row = FamilyError::kNoRow;
    std::int64_t id = 0;

    [[noreturn]] void fail(std::string_view field, const std::string& reason) const {
        throw FamilyError(table, row, id, field, reason);
    }
};

// The number as an id, which is 1 to 2^31 - 1.
FamilyId checkedId(const RowPlace& place, std::string_view field, std::int64_t id);
// The same, or 0 for nobody: 0, and what a data source answers for a person who is not known.
FamilyId checkedIdOrNobody(const RowPlace& place, std::string_view field, std::int64_t id);
// Valid UTF-8 without a zero byte and not longer than Family::kMostTextBytes.
void checkText(const RowPlace& place, std::string_view field, std::string_view text);
// 0 to most.
std::uint8_t checkedChoice(const RowPlace& place, std::string_view field, std::int64_t choice,
                           std::uint8_t most);

// The places in the list, ascending, of ids that stand in front of them already.
void findRepeats(std::span<const FamilyId> list, std::vector<std::size_t>& repeats);

}  // namespace olvane::detail
