// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace olvane::draw {

// Fonts that a picture asks for, in this order. The first is the one that was measured, and no other one for its
// scripts is wider; behind those come fonts for scripts that they lack.
inline constexpr std::string_view kFontFamilies =
    "'DejaVu Sans', Verdana, 'Helvetica Neue', Arial, 'Liberation Sans', 'Noto Sans', 'Noto Sans CJK SC', "
    "'PingFang SC', 'Microsoft YaHei', 'Noto Sans Arabic', 'Noto Sans Hebrew', 'Noto Sans Thai', "
    "'Noto Sans Devanagari', 'Noto Color Emoji', sans-serif";

// Size in px.
struct Font {
    double size = 12;
    bool bold = false;
};

// Valid UTF-8 that XML allows: every byte or character that is neither becomes U+FFFD, line ends become
// spaces.
std::string cleanText(std::string_view text);

// Width in px of a clean text, no less than what the font's renderers draw.
double textWidth(std::string_view text, const Font& font);

// The characters as a reader counts them, a letter with its combining marks being one: views into the text,
// one after the other, without a gap. The text is clean.
std::vector<std::string_view> readersCharacters(std::string_view text);

// The first letter with a direction is of a script that runs from right to left.
bool runsRightToLeft(std::string_view text);

}  // namespace olvane::draw
