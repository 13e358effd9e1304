// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Knows of nothing but the table of a family.

#include <iostream>

#include <olvane/kin/Family.h>
#include <olvane/kin/Kinship.h>
#include <olvane/kin/KinshipText.h>

int main() {
    olvane::Family family;
    family.addPerson({.id = 1, .sex = olvane::kin::Sex::male});
    family.addPerson({.id = 2, .father = 1, .sex = olvane::kin::Sex::female});
    const olvane::kin::KinGraph graph = olvane::kinGraphOf(family);
    olvane::kin::KinshipFinder finder(graph);
    const auto kinship = finder.between(graph.placeOf(1), graph.placeOf(2));
    std::cout << kinshipText(graph, kinship, olvane::kin::Language::english) << "\n";
}
