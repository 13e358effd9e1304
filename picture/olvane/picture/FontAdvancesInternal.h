// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <span>

namespace olvane::picture {

// Pen advances of a run of characters, in hundredths of an em, rounded up; 0 for a character without a glyph.
struct FontBlock {
    std::int32_t first;
    std::int32_t last;
    const std::uint8_t* regular;
    const std::uint8_t* bold;
};

std::span<const FontBlock> fontBlocks();

}  // namespace olvane::picture
