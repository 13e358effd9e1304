// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <RandomKin.h>

#include <algorithm>
#include <random>
#include <vector>

namespace olvane::test {

namespace {

class Dice {
public:
    explicit Dice(std::uint64_t seed) : random_(seed) {}
    // 0 to count - 1.
    int below(int count) { return static_cast<int>(random_() % static_cast<std::uint64_t>(count)); }
    bool oneIn(int count) { return below(count) == 0; }
    kin::Sex sex() { return static_cast<kin::Sex>(below(20) == 0 ? 2 : below(2)); }

private:
    std::mt19937_64 random_;
};

class SoundFamily {
public:
    SoundFamily(std::uint64_t seed, int persons) : dice_(seed), most_(persons) {}

    // Each generation pairs off, and every pair has children as long as there are persons left.
    kin::KinGraph make() {
        std::vector<kin::Place> generation = {add(), add()};
        while (left() > 0) {
            std::vector<kin::Place> next;
            for (const kin::Place person : generation) {
                if (left() > 0) marry(person, generation, next);
            }
            if (next.empty()) next = {add()};
            generation = next;
        }
        return builder_.build();
    }

private:
    int left() const { return most_ - count_; }
    kin::Place add() {
        ++count_;
        return builder_.addPerson(count_, dice_.sex());
    }

    void marry(kin::Place person, const std::vector<kin::Place>& generation, std::vector<kin::Place>& next) {
        const int unions = dice_.oneIn(6) ? 2 : dice_.oneIn(25) ? 4 : 1;
        for (int i = 0; i < unions && left() > 0; ++i) {
            kin::Place partner = kin::kNobody;
            if (dice_.oneIn(5))
                partner =
                    generation[static_cast<std::size_t>(dice_.below(static_cast<int>(generation.size())))];
            if (partner == person) partner = kin::kNobody;
            if (partner == kin::kNobody && !dice_.oneIn(8)) partner = add();
            const kin::UnionPlace u = builder_.addUnion(person, partner, kin::UnionState::married);
            for (int children = dice_.below(5); children > 0 && left() > 0; --children) {
                const kin::Place child = add();
                builder_.addChild(u, child, kin::ChildKind::birth);
                next.push_back(child);
            }
        }
    }

    Dice dice_;
    int most_;
    int count_ = 0;
    kin::KinGraphBuilder builder_;
};

}  // namespace

kin::KinGraph soundKin(std::uint64_t seed, int persons) {
    return SoundFamily(seed, persons).make();
}

kin::KinGraph hostileKin(std::uint64_t seed, int persons, int unions) {
    Dice dice(seed);
    kin::KinGraphBuilder builder;
    for (int i = 0; i < persons; ++i) builder.addPerson(1000 - 3 * i, dice.sex());
    for (int i = 0; i < unions; ++i) {
        kin::Place one = dice.below(persons);
        kin::Place other = dice.oneIn(4) ? kin::kNobody : dice.below(persons);
        if (dice.oneIn(2)) std::swap(one, other);
        const kin::UnionPlace u = builder.addUnion(one, other, static_cast<kin::UnionState>(dice.below(4)));
        for (int children = dice.below(4); children > 0; --children) {
            builder.addChild(u, dice.below(persons), static_cast<kin::ChildKind>(dice.below(6)));
        }
    }
    return builder.build();
}

kin::KinGraph denseKin(std::uint64_t seed) {
    Dice dice(seed);
    kin::KinGraphBuilder builder;
    const int persons = 2 + dice.below(24);
    for (int i = 0; i < persons; ++i) builder.addPerson(i + 1, dice.sex());
    const int unions = 1 + dice.below(40);
    const int few = std::min(persons, 1 + dice.below(4));
    for (int i = 0; i < unions; ++i) {
        const kin::Place one = dice.oneIn(3) ? dice.below(persons) : dice.below(few);
        const kin::Place other = dice.oneIn(4)   ? kin::kNobody
                                 : dice.oneIn(2) ? dice.below(few)
                                                 : dice.below(persons);
        const kin::UnionPlace u = builder.addUnion(one, other, kin::UnionState::married);
        for (int children = dice.below(4); children > 0; --children) {
            const kin::Place child = dice.oneIn(3) ? dice.below(persons) : persons - 1 - dice.below(few);
            builder.addChild(u, child, kin::ChildKind::birth);
        }
    }
    return builder.build();
}

}  // namespace olvane::test
