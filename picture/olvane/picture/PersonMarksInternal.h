// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/kin/KinGraph.h>
#include <olvane/picture/Picture.h>

namespace olvane::picture {

// What the boxes of a layout say of persons beyond its lines: who has several boxes, who has none, and who is shown apart
// from relatives. The graph has the ids of the picture.

// Numbers the boxes of persons with more than one, the nearest to the focus first, and adds a mark for each further one.
void numberRepeats(Picture& picture);

// Counts for every box the relatives of the first degree who have none.
void countHidden(const kin::KinGraph& graph, Picture& picture);

// Adds marks for partners, and for parents and children, who are shown but joined by no family of the picture.
// Needs repeats that are numbered.
void markShownElsewhere(const kin::KinGraph& graph, Picture& picture);

}  // namespace olvane::picture
