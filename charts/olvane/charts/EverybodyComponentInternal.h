// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <span>
#include <vector>

#include <olvane/kin/KinGraph.h>

namespace olvane::charts {

// Lists of numbers by place, in one block of memory.
class NumberLists {
public:
    // Lists 0 to count - 1 from (list, value) pairs, each in the order in which forEachPair hands its pairs
    // over. forEachPair runs twice and must hand over the same pairs.
    template <class ForEachPair>
    void fill(std::size_t count, const ForEachPair& forEachPair) {
        start_.assign(count + 1, 0);
        forEachPair(
            [this](std::int32_t list, std::int32_t) { ++start_[static_cast<std::size_t>(list) + 1]; });
        for (std::size_t i = 0; i < count; ++i) start_[i + 1] += start_[i];
        values_.resize(start_[count]);
        std::vector<std::uint32_t> next(start_.begin(), start_.end() - 1);
        forEachPair([this, &next](std::int32_t list, std::int32_t value) {
            values_[next[static_cast<std::size_t>(list)]++] = value;
        });
    }

    std::span<const std::int32_t> operator[](std::int32_t list) const {
        const std::uint32_t first = start_[static_cast<std::size_t>(list)];
        return {values_.data() + first, start_[static_cast<std::size_t>(list) + 1] - first};
    }
    std::span<std::int32_t> of(std::int32_t list) {
        const std::uint32_t first = start_[static_cast<std::size_t>(list)];
        return {values_.data() + first, start_[static_cast<std::size_t>(list) + 1] - first};
    }
    std::int32_t count() const { return static_cast<std::int32_t>(start_.size()) - 1; }
    // How many values all lists before this one have.
    std::size_t countBefore(std::int32_t list) const { return start_[static_cast<std::size_t>(list)]; }

private:
    std::vector<std::uint32_t> start_ = {0};
    std::vector<std::int32_t> values_;
};

// A connected part of a family, with numbers of its own: persons 0 to n - 1 and unions 0 to m - 1, both in the
// order of the graph.
//
// Holds: a partner of a union is -1 where the slot is empty; somebody married to themself stands in slot 0
//        alone. A child that is a partner of its own union is left out of its children, since no line can
//        join a box to itself.
struct Component {
    std::vector<kin::Place> persons;
    std::vector<kin::UnionPlace> unions;
    std::vector<std::array<std::int32_t, 2>> partners;  // by union
    NumberLists children;                               // by union
    NumberLists asPartner;                              // by person
    NumberLists asChild;                                // by person

    std::int32_t personCount() const { return static_cast<std::int32_t>(persons.size()); }
    std::int32_t unionCount() const { return static_cast<std::int32_t>(unions.size()); }
};

// The connected parts of a family, the largest first; of equally large ones the one with the first person.
std::vector<Component> componentsOf(const kin::KinGraph& graph);

}  // namespace olvane::charts
