// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/draw/SvgDrawing.h>
#include <olvane/picture/KinshipPlates.h>

namespace olvane::draw {

// What all pages share: margins, the beginning with its headline, and the end. In px.
constexpr int kMargin = 28;
constexpr int kHeadlineHeight = 40;

// In points of the layout.
struct Bounds {
    double left = 0;
    double top = 0;
    double right = 0;
    double bottom = 0;

    void include(double x, double y);
};

// Of boxes, lines and plates; of an empty picture, the room that its sentence needs.
Bounds boundsOf(const picture::Picture& picture, const std::vector<picture::KinshipPlate>& plates);

// Up to the next whole px; a picture is at most as large as a renderer's numbers.
int wholePx(double size);

// What the headline needs with its margins, as far as a long one may widen a picture; 0 without one.
int headlineWidth(const DrawingOptions& options);

// From the beginning to the headline; the picture's size is known.
void openPage(SvgPicture& picture, const DrawingOptions& options);
void closePage(SvgPicture& picture);

}  // namespace olvane::draw
