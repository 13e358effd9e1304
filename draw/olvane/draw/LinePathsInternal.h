// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/draw/FrameInternal.h>
#include <olvane/draw/LinePaths.h>

namespace olvane::draw {

// As for a screen, in px of the frame.
std::vector<LinePath> linePathsOf(const picture::Picture& picture, const picture::Family& family,
                                  const Frame& frame);

}  // namespace olvane::draw
