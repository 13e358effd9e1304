// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane/kin/Language.h>
#include <olvane/picture/Picture.h>

namespace olvane::js {

// What screens draw of a picture, in points, by the code that writes files: first the dashes and the meaning of
// each style of lines, a tab between the two and a semicolon between styles; then a line for each family, and one for each cell of a round picture. A family's has its paths with a semicolon between them, each with the digit of its style before it; a
// cell's has the number of its colour, a space and its outline.
std::string artOf(const picture::Picture& picture, kin::Language language);

}  // namespace olvane::js
