// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/source/ParentChoice.h>

namespace olvane::gedcom {

// A GEDCOM file as persons and unions: the person of id n has the place n - 1 and the id n.
//
// Holds: unions stand in the order of the file's families, and each has its family's number. A family without any
//        partner who is known is no union. Partner 0 is the husband, partner 1 the wife. Children stand as the family's
//        childLinks; their kind is that of their own parent link to the family, and birth where it gives none.
//        unionsAsPartner follows coupleLinks; unionsAsChild has the family of
//        parentFamilyOf first, then the others as parentLinks.
// Units: time and memory grow with the number of persons and links.
// Lifetime: the graph keeps nothing of the data.
kin::KinGraph kinGraphOf(const GedcomData& data, const ParentChoice& parents = {});

}  // namespace olvane::gedcom
