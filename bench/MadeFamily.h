// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

namespace bench {

// Families made for timing, the same ones on every machine. Ids count from 1, and the focus is 1.
//
//   descendants(n)  the focus, a spouse, and C children, each with a spouse and five children: n = 2 + 7 C
//   persons, all
//                   of whom the family view shows (30, 100, 1003, 9998)
//   kin(n)          all that the family view can show: children's and siblings' families, parents,
//   grandparents and
//                   great-grandparents, aunts, uncles and cousins on both sides, a half sibling and a step
//                   child: n is 30 or 20 + 20 k (100, 1000, 10000)
//   ancestors(g)    a full ancestry of g generations above the focus: 2^(g+1) - 1 persons
class MadeFamily {
public:
    static MadeFamily descendants(int persons);
    static MadeFamily kin(int persons);
    static MadeFamily ancestors(int generations);

    struct Person {
        std::int32_t sex = 0;  // 0 male, 1 female
        std::int64_t father = 0;
        std::int64_t mother = 0;
        int year = 0;
        std::vector<std::int64_t> spouses;
        std::vector<std::int64_t> children;
    };

    const Person& person(std::int64_t id) const { return persons_.at(static_cast<std::size_t>(id - 1)); }
    std::size_t size() const { return persons_.size(); }

private:
    Person& at(std::int64_t id) { return persons_.at(static_cast<std::size_t>(id - 1)); }
    std::int64_t add(std::int32_t sex, std::int64_t father, std::int64_t mother, int year);
    void marry(std::int64_t a, std::int64_t b);
    std::int64_t addSpouse(std::int64_t id);
    std::int64_t addChild(std::int64_t a, std::int64_t b, int place, int year);
    void addUnit(std::int64_t a, std::int64_t b, int children, int grandchildren, int year);
    struct Couple {
        std::int64_t father;
        std::int64_t mother;
    };
    Couple addParents(std::int64_t child, int year);
    void addAncestors(std::int64_t child, int generations, int year);

    std::vector<Person> persons_;
};

// The family as a data source.
class MadeFamilySource : public OlvaneViewerManagerWrapProtocol {
public:
    explicit MadeFamilySource(MadeFamily family);

    std::int64_t fatherForPersonWithID(std::int64_t personId) override;
    std::int64_t motherForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override;
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override;
    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override;
    bool isPersonDead(std::int64_t personId) override;
    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override;
    std::int32_t sexOfPersonWithID(std::int64_t personId) override;

private:
    MadeFamily family_;
};

}  // namespace bench
