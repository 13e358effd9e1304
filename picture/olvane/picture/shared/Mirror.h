// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/picture/Picture.h>

namespace olvane::picture {

// The picture with right and left exchanged, between the same bounds, for those who read from right to left. Boxes, families
// and marks keep their order. What is written in a box is no part of a picture, and is not turned around.
OLVANE_API void mirror(Picture& picture);

}  // namespace olvane::picture
