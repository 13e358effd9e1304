// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include "MadeFamily.h"

namespace bench {

// A made family as columns, for the tables of every language.
struct MadeColumns {
    std::vector<std::int64_t> ids, fathers, mothers, sexes;
    std::vector<std::int64_t> married, spouses, parents, children;

    explicit MadeColumns(const MadeFamily& family) {
        for (std::size_t i = 0; i < family.size(); ++i) {
            const auto id = static_cast<std::int64_t>(i + 1);
            const MadeFamily::Person& person = family.person(id);
            ids.push_back(id);
            fathers.push_back(person.father);
            mothers.push_back(person.mother);
            sexes.push_back(person.sex);
            for (const std::int64_t spouse : person.spouses) {
                married.push_back(id);
                spouses.push_back(spouse);
            }
            for (const std::int64_t child : person.children) {
                parents.push_back(id);
                children.push_back(child);
            }
        }
    }
};

}  // namespace bench
