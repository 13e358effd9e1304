// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace olvane::picture {

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

// Texts are UTF-8. The functions below take any bytes, and count a byte that begins no character as U+FFFD; results
// are the same on every machine. Breaking takes memory of up to 32 times the text: cut a text of unknown length first.

// Valid UTF-8 that XML allows: every byte or character that is neither becomes U+FFFD, ends of lines become spaces.
std::string cleanText(std::string_view text);

// A text of at most kMostTextBytes bytes and an ellipsis: a longer one is cut between two grapheme clusters, or
// between two characters where a single cluster is longer. Nobody reads more of a name.
inline constexpr std::size_t kMostTextBytes = 1000;
std::string cutText(std::string_view text);

// Width in px of a clean text, no less than what the font's renderers draw.
double textWidth(std::string_view text, const Font& font);

// The characters as a reader counts them, a letter with its combining marks being one: extended grapheme clusters of
// UAX 29, as views into the text, one after the other, without a gap.
std::vector<std::string_view> graphemeClusters(std::string_view text);

// The first of them alone; empty for an empty text.
std::string_view firstCluster(std::string_view text);

// The places where a line may end, by UAX 14, as offsets in bytes of what then begins the next line; ascending,
// without the end of the text.
std::vector<std::size_t> lineBreaks(std::string_view text);

// The first letter with a direction is of a script that runs from right to left.
bool runsRightToLeft(std::string_view text);

}  // namespace olvane::picture
