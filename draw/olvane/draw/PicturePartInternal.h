// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

// The elements of a picture, without its prologue, so that another one can hold it, and without the strokes
// and boxes that the window does not show. In px.
std::string elementsWithin(const SvgPicture& picture, const PictureArea& window);

}  // namespace olvane::draw
