// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include <olvane/kin/KinGraph.h>

// Families without rhyme or reason: several spouses, lone parents, second parents, loops, own ancestors, people
// married to themselves. `choose(n)` gives a number from 0 to n - 1, from bytes or from a generator.
struct AnyKin {
    struct Union {
        olvane::kin::Place partners[2];
        std::vector<olvane::kin::Place> children;
    };
    int persons = 0;
    std::vector<Union> unions;

    template <class Choose>
    static AnyKin make(int persons, int unions, bool orderly, const Choose& choose) {
        AnyKin made;
        made.persons = persons;
        for (int u = 0; u < unions; ++u) {
            Union one{{choose(persons), choose(persons)}, {}};
            if (choose(8) == 0) one.partners[choose(2)] = olvane::kin::kNobody;
            const int children = choose(5);
            for (int i = 0; i < children; ++i) {
                int child = choose(persons);
                // Orderly families have their parents among earlier persons, and so no loops.
                const int parents = one.partners[0] > one.partners[1] ? one.partners[0] : one.partners[1];
                if (orderly && child <= parents) child = parents + 1 + choose(6);
                if (child < persons) one.children.push_back(child);
            }
            made.unions.push_back(one);
        }
        return made;
    }

    // Ids are places + 1. `order` lists the persons as they are added, and may be empty for their own order.
    olvane::kin::KinGraph graph(const std::vector<int>& order = {}) const {
        using namespace olvane::kin;
        KinGraphBuilder builder;
        std::vector<Place> placeOf(static_cast<std::size_t>(persons));
        for (int i = 0; i < persons; ++i) {
            const int person = order.empty() ? i : order[static_cast<std::size_t>(i)];
            placeOf[static_cast<std::size_t>(person)] =
                builder.addPerson(person + 1, static_cast<Sex>(person % 3));
        }
        const auto at = [&placeOf](Place person) {
            return person == kNobody ? kNobody : placeOf[static_cast<std::size_t>(person)];
        };
        for (const Union& one : unions) {
            const UnionPlace u =
                builder.addUnion(at(one.partners[0]), at(one.partners[1]), UnionState::married);
            for (const Place child : one.children) builder.addChild(u, at(child), ChildKind::birth);
        }
        return builder.build();
    }
};
