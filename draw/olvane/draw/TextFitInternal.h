// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/draw/TextMeasureInternal.h>

namespace olvane::draw {

// Lines of a text that was fitted into a width.
struct FittedText {
    std::vector<std::string> lines;
    bool shortened = false;   // the last line ends in an ellipsis, since not all went in
    bool wordBroken = false;  // a word was too long for a line of its own
};

// Breaks a clean text at spaces and behind hyphens into at most maxLines lines of at most maxWidth px each. A
// word too long for a line is broken between two reader's characters; what does not fit is marked by an
// ellipsis.
FittedText fitText(std::string_view text, const Font& font, double maxWidth, std::size_t maxLines);

// One line with an ellipsis where it was too long; empty if not even that has room.
std::string fitLine(std::string_view text, const Font& font, double maxWidth);

}  // namespace olvane::draw
