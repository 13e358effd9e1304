// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace olvane::draw {

// Which way generations run: down the page, or to the right with every line turned accordingly.
enum class LineDirection : std::uint8_t { downward, sideways };

// Width and height of every box, in points of the layout.
struct BoxSize {
    int width = 55;
    int height = 80;
};

}  // namespace olvane::draw
