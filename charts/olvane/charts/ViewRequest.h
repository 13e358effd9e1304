// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace olvane::charts {

enum class View : std::uint8_t {
    family,
    pedigree,
    near,
    ancestors,
    descendants,
    hourglass,
    relatives,
    fan,
    kinship,
    everybody
};

// Where the generations after the first one stand: descendants below, above, to the left or to the right.
enum class Direction : std::uint8_t { down, up, left, right };

// The size of a box and the least gaps around it, in points. across is along a generation, along is from one
// generation to the next.
struct ChartSizes {
    float boxWidth = 55;
    float boxHeight = 80;
    float gapX = 25;
    float gapY = 30;
};

}  // namespace olvane::charts
