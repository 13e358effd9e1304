// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace olvane {

// What one straight piece of a family's lines is for.
//
//        [F]---+---[M]      marriage: from parent to parent
//              |            drop: from the parents to the bar
//        +-----+-----+      bar: along the children
//        |           |      stem: to one child
//
// In the order in which the pieces to one child are made. In a pedigree, which lies on its side, drops and stems run sideways and bars up and down.
enum class LineRole : std::uint8_t { marriage, drop, bar, stem };

}  // namespace olvane
