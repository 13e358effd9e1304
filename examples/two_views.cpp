// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lays a small family out in both views: each is one call, with options where others than the usual are wanted, and
// returns boxes and lines as values, and the result text.

#include <olvane/boundary/TypedLayout.h>

#include <iostream>
#include <memory>

#include "SmallFamily.h"

int main() {
    const auto source = std::make_shared<SmallFamily>();

    const olvane::TypedLayout family = olvane::familyLayout(1, source);
    for (const auto& box : family.boxes) std::cout << box.id << " at " << box.x << "," << box.y << "\n";
    std::cout << "family   " << family.text << "\n";

    olvane::LayoutOptions options;
    options.generations = 4;  // columns, the focus's own included
    const olvane::TypedLayout pedigree = olvane::pedigreeLayout(1, source, options);
    std::cout << "pedigree " << pedigree.text << "\n";
}
