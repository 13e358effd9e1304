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
    std::vector<charts::Fold> folded;
    std::vector<charts::SizedBox> boxSizes;
    bool keepsPlaces = false;  // everybody: of the file's last picture that was asked for so
    double labelSize = 0;      // in points, of a text at the line of a marriage; 0 where none is wanted
    bool paths = false;        // whether lines and cells are asked for as path data, too
};

// What JavaScript last asked of a picture, for a focus. view has no branches folded and no boxes of their own size: viewOf
// adds them.
PictureRequest requestOf(kin::Place focus);

// Refers to the request, which must outlive it.
charts::ViewRequest viewOf(const PictureRequest& request);

picture::Picture pictureOf(OpenFile& file, const PictureRequest& asked);

}  // namespace olvane::js
