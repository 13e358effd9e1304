// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/draw/SheetPlan.h>
#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

// Millimetres of a px, 1/96 inch.
inline constexpr double kMillimetresOfPx = 25.4 / 96;

// A finished picture as something to lay out on paper; its unit is a px.
SheetSubject subjectOf(const SvgPicture& picture);

// A picture on sheets, with the plan that they follow.
struct SheetDrawing {
    SheetPlan plan;
    std::vector<SvgPicture> sheets;
};

// Draws a picture on paper. One sheet has it in its middle. Of several, each says which one it is and which follow in
// its margins, has a triangle where a line goes on there, and dashed seams to put it together by; the first one has a
// map of all, where the picture leaves room for it, or else above the picture.
//
// Units: request.scale is in millimetres for each px. Sheets are pictures in px, with their size in millimetres
//        written in them.
// Holds: a sheet holds those boxes and strokes alone that it shows.
// Fails: as planSheets.
SheetDrawing drawSheets(const SvgPicture& picture, const SheetRequest& request, const std::string& title,
                        kin::Language language = kin::Language::english);

}  // namespace olvane::draw
