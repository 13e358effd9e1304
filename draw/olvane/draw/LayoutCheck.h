// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <utility>
#include <vector>

#include <olvane/draw/DrawingShape.h>
#include <olvane/host/LayoutText.h>

namespace olvane::draw {

using IdPair = std::pair<std::int64_t, std::int64_t>;

// A person with several boxes.
struct RepeatedPerson {
    std::int64_t id = 0;
    int boxes = 0;
};

// What makes a layout hard to read. Ids are the records' own, add-nodes' ids included.
struct LayoutFindings {
    std::vector<IdPair> overlappingBoxes;
    // Whose line, and through whose box. A piece of line that is held several times counts once.
    std::vector<IdPair> linesThroughBoxes;
    // Two families of which lines lie on one another, each named by its first child.
    std::vector<IdPair> sharedTracks;
    std::vector<RepeatedPerson> repeatedPersons;

    bool anyTrouble() const {
        return !overlappingBoxes.empty() || !linesThroughBoxes.empty() || !sharedTracks.empty();
    }
};

// Looks at a layout as the engine gave it, before a drawing puts lines apart. Boxes that share no more than
// an edge do not overlap, and a line that ends on an edge, or runs along one, does not run through the box.
LayoutFindings checkLayout(const std::vector<LayoutRecord>& records, LineDirection direction,
                           const BoxSize& box);

}  // namespace olvane::draw
