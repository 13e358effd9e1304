// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

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

// A table as the text of a GEDCOM file: what is made from files can be made from a program's own data.
//
// Holds: UTF-8. The person of id 17 has the identifier "17", and persons stand in the order of the table. Families are
//        the unions of kinGraphOf, so parents, spouses and children may come from any of the table's lists; one with a
//        number n has the identifier "Fn". The spouse who is preferred comes first. Dates are the written ones; a
//        sorting date of the form 1901-05-03 stands for one that is not written.
//        Of the fields for labels, "occupation", "note", "birthPlace" and "deathPlace" are written as GEDCOM has them, all
//        others as facts whose type is the key. "xref" is left out.
std::string gedcomTextOf(const olvane::Family& table);

}  // namespace olvane::gedcom
