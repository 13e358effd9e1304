// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/draw/SvgDrawing.h>
#include <olvane/gedcom/GedcomData.h>

namespace olvane::cli {

// A layout with everything that a picture tells of its persons. Refers to the data, which must outlive it.
//
// living: who is drawn as living, an entry for each person; empty for nobody.
draw::DrawingContent pictureContent(const gedcom::GedcomData& data, std::vector<LayoutRecord> records,
                                    gedcom::PersonId focus, std::vector<bool> living = {});

}  // namespace olvane::cli
