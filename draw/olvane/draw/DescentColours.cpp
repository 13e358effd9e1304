// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/draw/DescentColours.h>

#include <algorithm>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::draw {

namespace {

// Enough colours take turns that the last line of descent, which may lie beside the first, has another one.
std::size_t coloursInTurn(std::size_t lines) {
    const std::size_t most = DescentColours::kColours;
    return lines > 1 && lines % most == 1 ? most - 1 : most;
}

}  // namespace

DescentColours::DescentColours(const picture::Picture& fan) : fan_(fan) {
    for (const picture::Arc& arc : fan.arcs) {
        if (arc.line != picture::kNone) lines_.push_back(arc.line);
    }
    kin::mergeSort(lines_.begin(), lines_.end());
    lines_.erase(std::unique(lines_.begin(), lines_.end()), lines_.end());
}

int DescentColours::of(std::size_t box) const {
    const picture::Index own = fan_.arcs[box].line;
    const picture::Index line = own == picture::kNone ? static_cast<picture::Index>(box) : own;
    const auto found = std::lower_bound(lines_.begin(), lines_.end(), line);
    if (found == lines_.end() || *found != line) return -1;
    const auto place = static_cast<std::size_t>(found - lines_.begin());
    return static_cast<int>(place % coloursInTurn(lines_.size()));
}

}  // namespace olvane::draw
