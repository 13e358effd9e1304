// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/draw/SvgDrawing.h>
#include <olvane/gedcom/GedcomData.h>

namespace olvane::cli {

// A layout with everything that a picture tells of its persons. Refers to the data, which must outlive it.
draw::DrawingContent pictureContent(const gedcom::GedcomData& data, std::vector<LayoutRecord> records,
                                    gedcom::PersonId focus);

}  // namespace olvane::cli
