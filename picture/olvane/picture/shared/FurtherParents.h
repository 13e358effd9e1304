// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/picture/Picture.h>

namespace olvane::picture {

// Sets furtherParents of every box, by a graph with the ids of the picture.
OLVANE_API void countFurtherParents(Picture& picture, const kin::KinGraph& graph);

}  // namespace olvane::picture
