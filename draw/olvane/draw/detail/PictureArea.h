// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

namespace olvane::draw {

// A place in a picture or on paper; x grows right, y grows down. The unit is that of whatever holds it.
struct PictureArea {
    double x = 0;
    double y = 0;
    double width = 0;
    double height = 0;
};

}  // namespace olvane::draw
