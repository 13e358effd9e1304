// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane_family.h>

#include <cstddef>
#include <list>
#include <string_view>
#include <vector>

#include <olvane/kin/Family.h>

namespace olvane::c {

// Columns as the table takes them. Texts that end with zero bytes are searched once for where they begin.
//
// Lifetime: refers to the numbers and texts that it was made of.
class FamilyInput {
public:
    explicit FamilyInput(const olvane_family_columns& given);
    FamilyInput(const FamilyInput&) = delete;
    FamilyInput& operator=(const FamilyInput&) = delete;

    const FamilyColumns& columns() const { return columns_; }
    bool areOfKnownTypes() const { return typesAreKnown_; }

private:
    NumberColumn numbers(const olvane_numbers& given);
    TextColumn texts(const olvane_texts& given);
    // As many as there are, which may be another number than the column states: the table refuses that.
    const std::vector<std::string_view>& endedByZero(const olvane_texts& given);

    FamilyColumns columns_;
    std::list<std::vector<std::string_view>> views_;
    bool typesAreKnown_ = true;
};

// Empty for null. Lifetime: refers to the text.
inline std::string_view viewOf(const char* text) {
    return text ? std::string_view(text) : std::string_view();
}

// Rows of one person or family. A number of no enumeration stays one, so that the table refuses it.
// Lifetime: they refer to the texts of the row.
PersonRow rowOf(const olvane_person_row& row);
FamilyRow rowOf(const olvane_family_row& row);
std::vector<FamilyChild> childrenOf(const olvane_family_child* children, std::size_t count);
std::vector<NamePart> namesOf(const olvane_name_part* names, std::size_t count);

}  // namespace olvane::c
