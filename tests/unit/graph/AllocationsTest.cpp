// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Memory that runs out while a person is added, at each allocation in turn.

#include <cstdint>
#include <new>

#include <gtest/gtest.h>

#include <olvane/graph/TreeViewPerson.h>
#include <unit/boundary/AllocationCountdown.h>
#include <unit/graph/Visits.h>

namespace {

using unit::AllocationFailure;
using unit::allocationsMade;
using unit::allocationsOutstanding;
using unit::Keys;
using unit::keysOf;

// Four spouses with a child each: the next one makes the list grow.
TreeViewPerson withAFullList() {
    TreeViewPerson person(1);
    for (const int key : {2, 3, 4, 5}) person.addSpouse(key, false).addChildWithNoOtherSpouse(key + 10, true);
    person.spouses.shrink_to_fit();
    return person;
}

TEST(AddedPerson, whenMemoryRunsOutLeavesTheListAsItWas) {
    std::int64_t all = 0;
    {
        TreeViewPerson person = withAFullList();
        const std::int64_t before = allocationsMade();
        person.addSpouse(6, false);
        all = allocationsMade() - before;
    }
    ASSERT_LT(0, all);
    for (std::int64_t n = 1; n <= all; ++n) {
        TreeViewPerson person = withAFullList();
        const std::int64_t outstanding = allocationsOutstanding();
        {
            const AllocationFailure failure(n);
            EXPECT_THROW(person.addSpouse(6, false), std::bad_alloc) << n;
        }
        EXPECT_EQ(outstanding, allocationsOutstanding()) << n;
        ASSERT_EQ((Keys{2, 3, 4, 5}), keysOf(person.spouses)) << n;
        for (TreeViewPerson& spouse : person.spouses) {
            EXPECT_EQ(spouse.personId + 10, spouse.children[-1].at(0).personId) << n;
        }
    }
}

TEST(CouplesEdge, whenMemoryRunsOutIsOwnedByNobodyAndNothingLeaks) {
    std::int64_t all = 0;
    {
        TreeViewPerson man(1);
        TreeViewPerson woman(2);
        const std::int64_t before = allocationsMade();
        man.spouseEdge(&woman, TreeLine());
        all = allocationsMade() - before;
    }
    ASSERT_LT(0, all);
    const std::int64_t outstanding = allocationsOutstanding();
    for (std::int64_t n = 1; n <= all; ++n) {
        {
            TreeViewPerson man(1);
            TreeViewPerson woman(2);
            {
                const AllocationFailure failure(n);
                EXPECT_THROW(man.spouseEdge(&woman, TreeLine()), std::bad_alloc) << n;
            }
            for (const auto& [key, edge] : man.spouseEdges) EXPECT_NE(nullptr, edge) << n;
        }
        EXPECT_EQ(outstanding, allocationsOutstanding()) << n;
    }
}

}  // namespace
