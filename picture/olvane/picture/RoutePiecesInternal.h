// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/picture/Picture.h>
#include <olvane/picture/RoutePlanInternal.h>
#include <olvane/picture/RowsInternal.h>

namespace olvane::picture {

// Where a plan runs, in points along the frame.
//
// Lifetime: refers to what it is made of.
struct RoutePlaces {
    const RouteFrame& frame;
    const std::vector<double>& shift;  // how far each row was moved, of all rows
    const std::vector<bool>& dropped;  // the families that get marks instead of lines, of all families
};

// Replaces the lines of a picture and their bridges by the pieces of a plan whose tracks have their places, family by
// family. Pieces of dropped families are left out.
void writePieces(const RoutePlan& plan, const RoutePlaces& places, Picture& picture);

}  // namespace olvane::picture
