// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <map>
#include <string>
#include <vector>

#include <olvane/kin/Family.h>

namespace support {

// A family as plain maps, edited by the rules that the table states. Everything handed over must be right.
class PlainFamily {
public:
    struct Person {
        std::int64_t father = 0;
        std::int64_t mother = 0;
        olvane::kin::Sex sex = olvane::kin::Sex::unknown;
        bool dead = false;
        std::string birth;
        std::string deathWritten;
        std::vector<std::int64_t> spouses;
        std::int64_t preferred = 0;
        std::vector<std::int64_t> children;
        std::vector<std::string> names;
        std::map<std::string, std::string> fields;
    };
    struct Couple {
        std::array<std::int64_t, 2> partners{};
        olvane::kin::UnionState state = olvane::kin::UnionState::unknown;
        std::vector<olvane::FamilyChild> children;
    };

    std::map<std::int64_t, Person> persons;
    std::map<std::int64_t, Couple> families;

    // A new person, or in place of the one of that id.
    void putPerson(const olvane::PersonRow& row);
    void removePerson(std::int64_t id);
    void putFamily(const olvane::FamilyRow& row, const std::vector<olvane::FamilyChild>& children);
    void removeFamily(std::int64_t number);

private:
    void addSpouse(std::int64_t person, std::int64_t spouse);
    void separate(std::int64_t number);
};

// The first difference between a table and the plain family, in words; empty where they are the same.
std::string differenceOf(const olvane::Family& table, const PlainFamily& plain);

}  // namespace support
