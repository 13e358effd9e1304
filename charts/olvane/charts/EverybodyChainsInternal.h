// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <span>
#include <vector>

#include <olvane/charts/EverybodyComponentInternal.h>

namespace olvane::charts {

// Persons welded side by side: each is the partner of the next. A person without a partner is a chain alone.
//
// Holds: every person is in one chain, and each couple that stands side by side does so in one chain. The
//        number of such couples is the most there can be where the couples make no ring; a ring is first
//        opened at one couple.
struct Chains {
    NumberLists persons;              // by chain, from left to right
    std::vector<std::int32_t> chain;  // by person
    std::vector<std::int32_t> slot;   // by person, the place in its chain

    std::int32_t count() const { return persons.count(); }
    std::int32_t length(std::int32_t c) const { return static_cast<std::int32_t>(persons[c].size()); }
    bool areNeighbours(std::int32_t a, std::int32_t b) const {
        const auto index = [](std::int32_t p) { return static_cast<std::size_t>(p); };
        if (chain[index(a)] != chain[index(b)]) return false;
        const std::int32_t apart = slot[index(a)] - slot[index(b)];
        return apart == 1 || apart == -1;
    }
};

Chains weldCouples(const Component& part);

}  // namespace olvane::charts
