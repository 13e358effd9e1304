// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/charts/Views.h>
#include <olvane/source/GedcomDataSource.h>

#include "OpenFile.h"

namespace olvane::js {

// A request, and whose parents come first.
struct PictureRequest {
    charts::ViewRequest view;
    gedcom::ParentChoice parents;
    bool keepsPlaces = false;  // everybody: of the file's last picture that was asked for so
};

// What JavaScript last asked of a picture, for a focus.
PictureRequest requestOf(kin::Place focus);

picture::Picture pictureOf(OpenFile& file, const PictureRequest& asked);

}  // namespace olvane::js
