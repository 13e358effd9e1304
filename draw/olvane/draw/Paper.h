// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <optional>
#include <span>
#include <string_view>

namespace olvane::draw {

// A sheet of paper, in millimetres. Paper with a name may lie upright or across; a size in numbers is used as it is.
struct Paper {
    double width = 210;
    double height = 297;
    bool mayTurn = true;

    Paper turned() const { return {height, width, mayTurn}; }
};

// The papers that have a name: "A4", "A3", "A2", "A1", "A0", "letter".
std::span<const std::string_view> paperNames();

// One of paperNames(), or a width and a height in millimetres, such as "914x1500"; at least 50 and at most 20,000
// each. Nothing for any other text.
std::optional<Paper> paperOf(std::string_view text);

}  // namespace olvane::draw
