// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/picture/Picture.h>

namespace olvane::picture {

// Fills wayPieces: the line of each way, from box to box along the lines of the families that join them. A step that
// no line of the picture joins, but a mark, has none. Ways that run over the same line lie side by side, a few points
// apart; where three run already, further ones have no line of their own, and leave these where they part from them.
//
// Holds: whatever a family's lines are, each way's line lies on them, moved as a whole by the same number of points
//        to the right and down; no piece of it lies on another of its own. The picture must not be round.
OLVANE_API void addWayLines(Picture& picture);

}  // namespace olvane::picture
