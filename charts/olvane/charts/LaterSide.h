// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/charts/ViewRequest.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// Where children stand, seen from their parents, in the picture that a request asks for: below in the family view, to the
// left in a pedigree, else where the direction says; left and right are exchanged where the picture is mirrored.
OLVANE_API picture::Side laterSideOf(const ChartRequest& request);

}  // namespace olvane::charts
