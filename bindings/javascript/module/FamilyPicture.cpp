// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pictures of a family that is a table in the module's memory, as runs of numbers.

#include <cstdint>
#include <vector>

#include <olvane/charts/Views.h>

#include "HeldFamily.h"
#include "PictureAnswer.h"
#include "PictureRequest.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

using namespace olvane;
using js::HeldFamily;

// As gedcom_picture, of a person by id.
OLVANE_EXPORT("family_picture") std::vector<double>* familyPicture(HeldFamily* family, std::int32_t focus) {
    return js::pictureAnswer([&] {
        const js::PictureRequest request = js::requestOf(0);
        const charts::ViewRequest view = js::viewOf(request);
        return charts::pictureOf(family->table, focus, view, std::int64_t{view.chart.to} + 1);
    });
}
