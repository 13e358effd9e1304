// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstddef>
#include <vector>

namespace olvane::gedcom {

// Adds to a list that is read from a text of which this share is behind. A full list grows to what the whole
// text will take if it goes on so, and at least to twice its size: a big list moves once instead of many
// times.
template <typename Item>
void appendWithGrowthEstimate(std::vector<Item>& list, const Item& item, double share) {
    constexpr double kEnoughToJudge = 1.0 / 64;
    constexpr double kMargin = 1.05;
    if (list.size() == list.capacity() && share > kEnoughToJudge) {
        const auto estimate = static_cast<std::size_t>(static_cast<double>(list.size()) / share * kMargin);
        list.reserve(std::max(estimate, list.size() * 2));
    }
    list.push_back(item);
}

}  // namespace olvane::gedcom
