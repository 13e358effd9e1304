// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

#include <olvane/gedcom/GedcomData.h>

namespace olvane::gedcom {

// Which parents come first for somebody who is a child of several families.
enum class ParentOrder : std::uint8_t {
    birth,     // those by birth, as Person::father and mother
    adoptive,  // the first who adopted the person; where nobody did, those by birth
    inOrder    // the first of the file's links
};

struct ParentChoice {
    ParentOrder order = ParentOrder::birth;
    // For this one person another family, whatever the order says, if the person is a child of it; 0 for nobody.
    PersonId child = 0;
    FamilyId family = 0;

    bool operator==(const ParentChoice&) const = default;
};

// The family whose partners are the person's father and mother by that choice; 0 for none.
FamilyId parentFamilyOf(const GedcomData& data, PersonId id, const ParentChoice& choice);

}  // namespace olvane::gedcom
