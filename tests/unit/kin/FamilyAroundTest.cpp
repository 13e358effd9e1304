// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family asked of a host: who is in reach, and that nobody else is asked about.

#include <olvane/kin/FamilyAround.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>
#include <map>
#include <set>
#include <stdexcept>
#include <string>

namespace {

using olvane::Family;
using olvane::FamilyError;
using olvane::ReachAround;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

// 11 and 12 have 1 and 5; 1 and 2 have 3; 5 and 6 have 7; 3 and 8 have 9; 15 is the father of 11.
class Host final : public OlvaneViewerManagerWrapProtocol {
public:
    std::map<std::int64_t, std::pair<std::int64_t, std::int64_t>> parents{
        {1, {11, 12}}, {5, {11, 12}}, {3, {1, 2}}, {7, {5, 6}}, {9, {8, 3}}, {11, {15, kPersonNotFound}}};
    std::map<std::int64_t, std::int64_t> wives{{11, 12}, {1, 2}, {5, 6}, {8, 3}};
    std::set<std::int64_t> asked;

    std::int64_t fatherForPersonWithID(std::int64_t id) override {
        asked.insert(id);
        return parents.count(id) == 0 ? kPersonNotFound : parents[id].first;
    }
    std::int64_t motherForPersonWithID(std::int64_t id) override {
        return parents.count(id) == 0 ? kPersonNotFound : parents[id].second;
    }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t id) override {
        asked.insert(id);
        std::vector<std::int64_t> spouses;
        for (const auto& [he, she] : wives) {
            if (he == id) spouses = {she, she};
            if (she == id) spouses.push_back(he);
        }
        return spouses;
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t id) override {
        asked.insert(id);
        std::vector<std::int64_t> children;
        for (const auto& [child, two] : parents) {
            if (two.first == id || two.second == id) children.push_back(child);
        }
        return children;
    }
    bool isPreferredSpouse(std::int64_t, std::int64_t) override { return true; }
    bool isPersonDead(std::int64_t id) override { return id > 10; }
    std::string dateForPersonWithID(std::int64_t id, bool isBirth) override {
        return isBirth ? std::to_string(1800 + id) : std::string();
    }
    std::int32_t sexOfPersonWithID(std::int64_t id) override { return id % 2 == 0 ? 1 : 0; }
};

ReachAround reach(int up, int down, int downBeside, bool spouses = false) {
    ReachAround made;
    made.up = up;
    made.down = down;
    made.downBeside = downBeside;
    made.spouses = spouses;
    return made;
}

TEST(FamilyAround, ancestorsAloneAreAskedAboutUpToTheirGeneration) {
    Host host;
    const Family family = olvane::familyAround(host, 3, reach(2, 0, 0));
    EXPECT_THAT(family.personIds(), ElementsAre(3, 1, 2, 11, 12));
    EXPECT_EQ(family.father(1), 11U);
    EXPECT_EQ(family.father(11), 0U);  // 15 is beyond the reach
    EXPECT_EQ(host.asked.count(15), 0U);
    EXPECT_EQ(host.asked.count(5), 0U);
}

TEST(FamilyAround, descendantsAreAskedAboutDownToTheirGeneration) {
    Host host;
    const Family family = olvane::familyAround(host, 11, reach(0, 2, 0));
    EXPECT_THAT(family.personIds(), UnorderedElementsAre(11, 1, 5, 3, 7));
    EXPECT_THAT(family.children(11), ElementsAre(1, 5));
    EXPECT_THAT(family.children(3), IsEmpty());
}

TEST(FamilyAround, descendantsOfAncestorsAreCousins) {
    Host host;
    const Family family = olvane::familyAround(host, 3, reach(2, 1, 2));
    EXPECT_THAT(family.personIds(), UnorderedElementsAre(3, 1, 2, 9, 11, 12, 5, 7));
}

TEST(FamilyAround, spousesComeWithThoseWhoAreReached) {
    Host host;
    const Family family = olvane::familyAround(host, 5, reach(0, 1, 0, true));
    EXPECT_THAT(family.personIds(), UnorderedElementsAre(5, 7, 6));
    EXPECT_THAT(family.spouses(5), ElementsAre(6));  // listed twice by the host
    EXPECT_EQ(family.preferredSpouse(5), 6U);
    EXPECT_EQ(family.mother(7), 6U);
    EXPECT_EQ(family.birth(7), "1807");
}

TEST(FamilyAround, aCircleOfParentsEnds) {
    Host host;
    host.parents = {{1, {2, 1}}, {2, {1, 2}}};
    const Family family = olvane::familyAround(host, 1, reach(1000, 1000, 1000, true));
    EXPECT_THAT(family.personIds(), UnorderedElementsAre(1, 2));
}

TEST(FamilyAround, answersThatAreNoIdsAreRefusedByThePersonWhoWasAskedAbout) {
    Host host;
    host.parents[3] = {1, (std::int64_t{1} << 32) + 4};
    try {
        olvane::familyAround(host, 3, reach(1, 0, 0));
        FAIL() << "nothing was refused";
    } catch (const FamilyError& error) {
        EXPECT_STREQ(error.what(),
                     "person 3, field mother: 4294967300 is not a whole number of 1 to 2147483647");
    }
    EXPECT_THROW(olvane::familyAround(host, 0, reach(1, 0, 0)), FamilyError);
}

TEST(FamilyAround, endsWhereTooManyAreInReach) {
    Host host;
    ReachAround few = reach(3, 0, 0);
    few.mostPersons = 3;
    EXPECT_THROW(olvane::familyAround(host, 3, few), std::length_error);
}

}  // namespace
