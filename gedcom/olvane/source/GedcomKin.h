// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/KinGraph.h>

namespace olvane::gedcom {

// A GEDCOM file as persons and unions: the person of id n has the place n - 1 and the id n.
//
// Holds: unions stand in the order of the file's families, and each has its family's number. A family without any
//        partner who is known is no union. Husband and wife take the slots that the record gives them. Children
//        stand in the order of the CHIL lines; behind them, in the order of the persons, those whose own record
//        alone names the family. Their kind is that of the child's own FAMC, and birth where that says nothing.
//        unionsAsPartner follows the person's FAMS lines; unionsAsChild has the family first that gives the
//        person's father and mother, then the others as the person's FAMC lines name them.
// Units: time and memory grow with the number of persons and links.
// Lifetime: the graph keeps nothing of the data.
kin::KinGraph kinGraphOf(const GedcomData& data);

}  // namespace olvane::gedcom
