// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <string_view>

#include <olvane/kin/PersonLabel.h>

namespace olvane::draw {

// The colours of one kind of box, as "#rrggbb".
struct BoxColours {
    std::string_view fill;
    std::string_view border;
    std::string_view silhouette;
};

// The colours of a picture, as "#rrggbb".
//
// Holds: texts have a contrast of 4.5 and more to everything that they can stand on, borders and lines one of
//        3 and more to the page. Sex is also shown by the corners of a box and by the silhouette, for grey
//        print.
struct DrawingTheme {
    std::string_view page;
    std::string_view text;
    std::string_view quietText;  // years, words of unknown parents, legend
    std::string_view line;
    std::string_view focus;  // the border of the focus's box
    std::string_view badge;  // the marks in a box's corners
    std::string_view badgeText;
    std::string_view unknownParent;  // the dashed border of an unknown parent
    BoxColours male;
    BoxColours female;
    BoxColours other;
    std::array<std::string_view, 8> ways;  // lines of the ways of a kinship; dashes set them apart as well

    const BoxColours& coloursOf(kin::Sex sex) const;
};

const DrawingTheme& lightTheme();
const DrawingTheme& darkTheme();
// Black, white and light greys: little ink, nothing shown by colour alone.
const DrawingTheme& printTheme();

// "light", "dark" or "print".
const DrawingTheme* themeOfName(std::string_view name);

}  // namespace olvane::draw
