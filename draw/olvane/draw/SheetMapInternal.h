// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <optional>
#include <string>

#include <olvane/draw/SheetPlan.h>
#include <olvane/kin/Language.h>

namespace olvane::draw {

// The map of the sheets: the whole picture in small, with the number of each sheet where it lies.
//
// Units: places on paper are in millimetres from the corner of the sheet.

// The size that a map has when it must stand above the picture.
PictureArea mapAboveOf(const SheetPlan& plan);

// Where the first sheet has room for the map among its boxes and lines; nothing where it has none.
std::optional<PictureArea> freePlaceOfMap(const SheetSubject& subject, const SheetPlan& plan);

// Draws it, in units of pxOfMm px a millimetre.
void appendSheetMap(std::string& svg, const SheetSubject& subject, const SheetPlan& plan,
                    const PictureArea& place, double pxOfMm, kin::Language language);

}  // namespace olvane::draw
