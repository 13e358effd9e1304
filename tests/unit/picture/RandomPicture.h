// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

#include <olvane/picture/Picture.h>

namespace olvane::test {

// A picture without sense: boxes, families, right-angled pieces and marks at random on a small grid, so that
// pieces often meet, run along edges and end on one another. The same seed gives the same picture.
picture::Picture randomPicture(std::uint32_t seed);

}  // namespace olvane::test
