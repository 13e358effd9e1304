// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A chart of two persons.

#include <iostream>

#include <olvane/charts/Charts.h>
#include <olvane/kin/Family.h>

int main() {
    olvane::Family family;
    family.addPerson({.id = 1, .sex = olvane::kin::Sex::male});
    family.addPerson({.id = 2, .father = 1});
    const olvane::kin::KinGraph graph = olvane::kinGraphOf(family);
    olvane::charts::ChartRequest request;
    request.focus = graph.placeOf(1);
    std::cout << olvane::charts::chartOf(graph, request).boxes.size() << " boxes\n";
}
