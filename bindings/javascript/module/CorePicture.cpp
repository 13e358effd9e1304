// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The pictures of the engine's own two views alone, for the module without charts.

#include <cstdint>
#include <memory>
#include <vector>

#include <olvane/picture/LayoutPicture.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/LimitedDataSource.h>

#include "LayoutAnswer.h"
#include "OpenFile.h"
#include "PictureAnswer.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

using namespace olvane;

// As gedcom_picture of the whole module, with the usual options.
OLVANE_EXPORT("gedcom_picture")
std::vector<double>* gedcomPicture(js::OpenFile* file, std::int32_t focus, int view) {
    return js::pictureAnswer([&] {
        const auto source = std::make_shared<gedcom::LimitedDataSource>(file->source, js::kMostRelatives);
        picture::LayoutPictureOptions options;
        options.known = &file->kin();
        const bool isFamily = static_cast<js::View>(view) == js::View::family;
        return picture::pictureOf(isFamily ? familyLayout(focus, source) : pedigreeLayout(focus, source),
                                  options);
    });
}
