// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/picture/TextMetrics.h>

namespace olvane::picture {

// Texts are clean, as cleanText makes them. Where a text is broken into lines, runs of spaces count as one.

// Lines of a text that was fitted into a width.
struct FittedText {
    std::vector<std::string> lines;
    bool shortened = false;   // the last line ends in an ellipsis, since not all went in
    bool wordBroken = false;  // a word was too long for a line of its own
};

// Breaks a text into at most maxLines lines of at most maxWidth px each, where lineBreaks allows. What is too long
// for a line is broken between two grapheme clusters; what does not go in is replaced by an ellipsis.
FittedText fitText(std::string_view text, const Font& font, double maxWidth, std::size_t maxLines);

// One line, with its spaces as they are, and with an ellipsis where it was too long; empty if not even that has room.
std::string fitLine(std::string_view text, const Font& font, double maxWidth);

// The room for a name, in px: lines of a size need that size and the gap. There is always room for one line, and for
// no more than mostLines.
struct NameRoom {
    double width = 0;
    double height = 0;
    double gap = 3;
    std::size_t mostLines = 4;
    // Four sizes are tried, from the largest down to the smallest.
    double largest = 13;
    double smallest = 10;
};

// What a name lost so that it went in: nothing, given names after the first but for their initials, or letters.
enum class NameLoss : std::uint8_t { nothing, givenNames, letters };

struct FittedName {
    std::vector<std::string> lines;
    double size = 0;  // px, of every line
    NameLoss loss = NameLoss::nothing;
};

// Fits a name in bold letters of the largest of a few sizes in which no word is broken, with the surname on a line of
// its own where there is room. Before anything is cut, given names after the first become initials in scripts that
// have capitals.
//
// Holds: no line is wider than the room, and there are no more than go in. surnameFirst is how the name is read.
FittedName fitName(std::string_view given, std::string_view surname, bool surnameFirst, const NameRoom& room);

}  // namespace olvane::picture
