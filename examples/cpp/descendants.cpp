// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <iostream>

#include <olvane/charts/Charts.h>
#include <olvane/kin/Family.h>

int main() {
    olvane::Family family;
    family.addPerson({.id = 1, .sex = olvane::kin::Sex::male});
    family.addPerson({.id = 2, .sex = olvane::kin::Sex::female});
    family.addPerson({.id = 3, .father = 1, .mother = 2});
    const olvane::kin::KinGraph graph = olvane::kinGraphOf(family);

    olvane::charts::ChartRequest request;
    request.view = olvane::charts::View::descendants;
    request.focus = graph.placeOf(1);
    request.down = 3;  // generations; 0 means all
    for (const auto& box : olvane::charts::chartOf(graph, request).boxes) {
        std::cout << box.id << " at " << box.x << "," << box.y << "\n";
    }
}
