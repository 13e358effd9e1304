// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/Family.h>

namespace olvane::gedcom {

// A GEDCOM file as a table: the person of id n is the n-th of the file, the family of number n its n-th family.
//
// Holds: the table answers as GedcomDataSource does. Families have the children and kinds of kinGraphOf; families
//        without a known partner have the children of their CHIL lines. Every name of a person begins with its full
//        form, which the given name, surname, prefix, suffix and nickname follow where the record has them. The field
//        "xref" is the identifier of the person's record. Texts beyond Family::kMostTextBytes are cut.
// Lifetime: the table keeps nothing of the data.
olvane::Family familyOf(const GedcomData& data);

}  // namespace olvane::gedcom
