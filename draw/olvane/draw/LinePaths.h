// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/kin/Language.h>
#include <olvane/picture/Picture.h>

namespace olvane::draw {

enum class LineStyle : std::uint8_t { plain, divorced, unmarried, adopted, foster, step, sealing };
inline constexpr std::size_t kLineStyles = 7;

// The dashes of a style as a stroke-dasharray, in px; empty for the plain one.
std::string_view dashesOf(LineStyle style);

// What a style means, for a legend; empty for the plain one.
std::string_view meaningOf(LineStyle style, kin::Language language);

// Pieces of one style, as the data of an SVG path.
struct LinePath {
    LineStyle style = LineStyle::plain;
    std::string data;
};

// The lines of a family of the picture, a path for each style that some of them have, in the order of the styles. A line
// that crosses another family's jumps over it in an arc, where the picture says so. In points, for a screen that shows
// one px for each; files have the same lines with two px for each.
std::vector<LinePath> linePathsOf(const picture::Picture& picture, const picture::Family& family);

}  // namespace olvane::draw
