// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/LivingPersons.h>

#include <olvane/kin/Lives.h>
#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomLives.h>

namespace olvane::cli {

std::vector<bool> livingPersons(const gedcom::GedcomData& data, int thisYear) {
    const kin::KinGraph graph = gedcom::kinGraphOf(data);
    return kin::livingPersons(graph, gedcom::livesOf(data, graph), thisYear);
}

}  // namespace olvane::cli
