// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace olvane::draw {

// Text for element content and for attributes in double quotes: cleaned, with everything that could be markup
// written as an entity.
std::string escaped(std::string_view text);

// A number of px with at most one decimal, the same on every machine: "12", "-0.5".
std::string px(double value);

}  // namespace olvane::draw
