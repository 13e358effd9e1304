// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/draw/SvgDrawing.h>

namespace olvane::draw {

// Upright paper, in millimetres.
struct Paper {
    double width = 210;
    double height = 297;
};

// "A4", "A3" or "letter".
std::optional<Paper> paperOfName(std::string_view name);

// Lays a picture out on paper: on one sheet where it fits, at no less than half its size, or else on as many
// as it takes, each with a strip that stands on its neighbour too and marks to glue them by. The paper lies
// upright or across, whichever needs fewer sheets.
//
// Units: the sheets are pictures in px of 1/96 inch, with their size in millimetres written in them.
// Holds: sheets come row by row, with their places stated, and without those that would be blank. A sheet holds
//        those boxes alone that it shows.
std::vector<SvgPicture> splitPages(const SvgPicture& picture, const Paper& paper, const std::string& title);

}  // namespace olvane::draw
