// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include <olvane/kin/NearRelatives.h>

#include "KinFamily.h"

namespace olvane::kin {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

bool everybodyIsNamed(Place /*person*/) {
    return true;
}

TEST(Siblings, areTheFathersChildrenThenThoseOfTheMotherAloneEachOnce) {
    const KinFamily family{"Adam + Eva: Seth.m Sara.f", "Adam + Lea: Ruth.f", "Noah + Eva: Boas.m"};
    EXPECT_THAT(siblingsOf(family.graph(), family["Seth"]),
                ElementsAre(family["Sara"], family["Ruth"], family["Boas"]));
    EXPECT_THAT(siblingsOf(family.graph(), family["Boas"]), ElementsAre(family["Seth"], family["Sara"]));
    EXPECT_THAT(siblingsOf(family.graph(), family["Adam"]), IsEmpty());
}

TEST(Siblings, areThoseOfTheFirstParentsAlone) {
    const KinFamily family{"Adam + Eva: Seth.m", "Noah + Lea: Seth(adopted) Ruth.f"};
    EXPECT_THAT(siblingsOf(family.graph(), family["Seth"]), IsEmpty());
    EXPECT_THAT(siblingsOf(family.graph(), family["Ruth"]), ElementsAre(family["Seth"]));
}

// Seth has two parents (6) and a grandparent (2), himself among his father's children (1), a spouse (1), a child (1) and no
// grandchild: 11. His child has two parents (6), two grandparents (4) and itself (1): 11 as well, and comes later.
TEST(BestFocus, hasTheMostRelativesNearAndIsTheFirstOfSeveral) {
    const KinFamily family{"Kain + ?: Adam.m", "Adam + Eva: Seth.m", "Seth + Lea: Enos.m"};
    EXPECT_EQ(bestFocus(family.graph(), everybodyIsNamed), family["Seth"]);
}

TEST(BestFocus, isNobodyWithoutANameWhereOthersHaveOne) {
    const KinFamily family{"Kain + ?: Adam.m", "Adam + Eva: Seth.m", "Seth + Lea: Enos.m"};
    const auto isNamed = [&](Place person) { return person != family["Seth"]; };
    EXPECT_EQ(bestFocus(family.graph(), isNamed), family["Enos"]);
}

TEST(BestFocus, isNobodyWhereThereIsNobody) {
    EXPECT_EQ(bestFocus(KinGraphBuilder().build(), everybodyIsNamed), kNobody);
}

}  // namespace
}  // namespace olvane::kin
