// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <span>
#include <string>
#include <vector>

#include <olvane/Export.h>
#include <olvane/picture/Picture.h>

namespace olvane::picture {

// What the plates of a picture of kinship look like, and what stands around boxes.
//
// Units: those of the picture.
struct PlateStyle {
    double letters = 0;   // size of the letters, which are bold
    double pitch = 0;     // from line to line
    double inset = 0;     // from both sides to the text
    double frame = 0;     // above and below all lines together
    double onBorder = 0;  // by which a plate reaches into the border of its own box
    double marks = 0;     // how far marks reach out of the upper and the lower edge of a box
    double frames = 0;    // how far the frames of ends and common ancestors reach out of their boxes
};

// At which edges of a box marks stand.
struct MarkedEdges {
    bool top = false;
    bool bottom = false;
};

// What the person at one end of a kinship is to the one at the other, on a plate at that person's box.
struct KinshipPlate {
    Index box = kNone;
    double x = 0;  // the upper left corner
    double y = 0;
    double width = 0;
    double height = 0;
    std::vector<std::string> lines;  // the whole text

    double right() const { return x + width; }
    double bottom() const { return y + height; }
};

// The plates of the focus and of the other person, where they have something to say. A plate touches its box or the marks
// at its edge, above, below or at a side: at the place where it covers no box with its marks and not the other plate, and
// where the fewest lines run below it; the text is broken into up to four lines for it.
//
// Holds: marked has one entry for each box. Where every place covers something, it is the one that covers least of boxes and plates.
OLVANE_API std::vector<KinshipPlate> kinshipPlates(const Picture& picture, const PlateStyle& style,
                                                   std::span<const MarkedEdges> marked);

}  // namespace olvane::picture
