// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include "MadePopulation.h"

#include <algorithm>
#include <cstdint>
#include <vector>

namespace bench {

namespace {

using olvane::kin::Place;

class Population {
public:
    explicit Population(int persons) : most_(persons), generationSize_(std::max(10, persons / 25)) {
        builder_.reserve(static_cast<std::size_t>(persons), static_cast<std::size_t>(persons) / 2);
    }

    olvane::kin::KinGraph make() {
        std::vector<Place> generation;
        for (int i = 0; i < generationSize_ && left() > 0; ++i) generation.push_back(add());
        while (left() > 0) {
            std::vector<Place> next;
            pairOff(generation, next);
            if (next.empty()) next.push_back(add());
            generation = std::move(next);
        }
        return builder_.build();
    }

private:
    // A linear congruential generator with the multiplier of Knuth's MMIX; its upper bits.
    int below(int count) {
        state_ = state_ * 6364136223846793005U + 1442695040888963407U;
        return static_cast<int>((state_ >> 33U) % static_cast<std::uint64_t>(count));
    }
    int left() const { return most_ - count_; }
    Place add() {
        ++count_;
        return builder_.addPerson(count_, below(2) == 0 ? olvane::kin::Sex::male : olvane::kin::Sex::female);
    }

    // Everybody who is not yet married takes somebody up to twelve places further along the street.
    void pairOff(const std::vector<Place>& generation, std::vector<Place>& next) {
        const double wanted = static_cast<double>(generationSize_);
        std::vector<std::uint8_t> married(generation.size(), 0);
        for (std::size_t i = 0; i < generation.size() && left() > 0; ++i) {
            if (married[i] != 0 || below(8) == 0) continue;
            const int times = below(10) == 0 ? 2 : 1;
            for (int t = 0; t < times && left() > 0; ++t) marry(generation, married, i, wanted, next);
        }
    }

    void marry(const std::vector<Place>& generation, std::vector<std::uint8_t>& married, std::size_t i,
               double wanted, std::vector<Place>& next) {
        const std::size_t other = i + 1 + static_cast<std::size_t>(below(12));
        Place partner = olvane::kin::kNobody;
        if (below(4) != 0 && other < generation.size() && married[other] == 0) {
            partner = generation[other];
            married[other] = 1;
        } else {
            partner = add();
        }
        married[i] = 1;
        const auto u = builder_.addUnion(generation[i], partner, olvane::kin::UnionState::married);
        const bool tooMany = static_cast<double>(next.size()) > wanted;
        for (int children = tooMany ? 0 : below(5) + 1; children > 0 && left() > 0; --children) {
            const Place child = add();
            builder_.addChild(u, child, olvane::kin::ChildKind::birth);
            next.push_back(child);
        }
    }

    int most_;
    int generationSize_;
    int count_ = 0;
    std::uint64_t state_ = 1;
    olvane::kin::KinGraphBuilder builder_;
};

}  // namespace

olvane::kin::KinGraph madePopulation(int persons) {
    return Population(persons).make();
}

}  // namespace bench
