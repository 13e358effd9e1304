// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/Export.h>
#include <olvane/picture/Picture.h>

namespace olvane::picture {

enum class LabelSide : std::uint8_t { none, above, below, right };

// Where a short text such as the year of a marriage stands at a family's lines.
//
// Units: points. (x, y) is a place on a marriage line. Above and below it the middle of the text stands there, to the right
//        its beginning.
struct LabelPlace {
    double x = 0;
    double y = 0;
    LabelSide side = LabelSide::none;  // none: the family has no marriage line
};

// Of a text of such a size, in parts of it: the room of a year, and the gap to the line.
constexpr double kLabelWidth = 2.8;
constexpr double kLabelHeight = 0.75;
constexpr double kLabelGap = 0.4;

// From a place to where the text's baseline begins, or above and below a line has its middle; in the unit of size.
struct LabelOffset {
    double x = 0;
    double y = 0;
};

OLVANE_API LabelOffset labelOffsetOf(LabelSide side, double size);

// A place for each family of the picture: over the middle of its longest level marriage line, or beside an upright one.
// Where somebody has several marriages, whose lines run side by side, the place is the first at the line where the text
// covers neither box nor line nor the year of another such marriage; where there is none, the one that covers least.
//
// size: of the text, in points.
OLVANE_API std::vector<LabelPlace> marriageLabelPlaces(const Picture& picture, double size);

}  // namespace olvane::picture
