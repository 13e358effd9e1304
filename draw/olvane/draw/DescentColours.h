// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <vector>

#include <olvane/picture/Picture.h>

namespace olvane::draw {

// The colours that the lines of descent of a round picture have by turns, by number.
class DescentColours {
public:
    static constexpr int kColours = 12;

    explicit DescentColours(const picture::Picture& fan);

    // The boxes at which lines of descent begin, in the order of the boxes.
    const std::vector<picture::Index>& lines() const { return lines_; }

    // 0 to kColours - 1; -1 for a box that belongs to no line.
    int of(std::size_t box) const;

private:
    const picture::Picture& fan_;
    std::vector<picture::Index> lines_;
};

}  // namespace olvane::draw
