// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The two questions that a node asks of the data source at most once: all its spouses, and all its children.

#include <stdexcept>

#include <gtest/gtest.h>

#include <olvane/graph/TreeViewPerson.h>
#include <unit/graph/Visits.h>

namespace {

using unit::failureOf;
using unit::kEmptyFunctionFailure;
using unit::Keys;
using unit::keysOf;

// Answers with two spouses, the later key first in the host's order; counts the questions.
struct SpousesOfTheHost {
    int asked = 0;
    int askedFor = -1;
    bool cameEmpty = false;

    TreeViewPerson::SpousesLoader loader() {
        return [this](int key, SpouseSet& set) {
            ++asked;
            askedFor = key;
            cameEmpty = set.empty();
            set.insert(SpouseAdapter(4, false, true, "", "44", 2));
            set.insert(SpouseAdapter(9, false, true, "", "99", 1));
        };
    }
};

struct ChildrenOfTheHost {
    int asked = 0;
    int askedFor = -1;

    TreeViewPerson::ChildrenLoader loader() {
        return [this](int key, ChildrenSet& set) {
            ++asked;
            askedFor = key;
            set.insert(ChildrenAdapter(9, "", "99", 1));
            set.insert(ChildrenAdapter(4, "", "44", 2));
        };
    }
};

TEST(HiddenSpouses, areLoadedInTheOrderOfTheirRecordsAsWomen) {
    TreeViewPerson person(7);
    SpousesOfTheHost host;
    EXPECT_EQ(0, person.getNonDisplayedSpouseCount());
    EXPECT_EQ((Keys{9, 4}), keysOf(person.getNonDisplayedSpouseIterator(host.loader())));
    EXPECT_EQ(2, person.getNonDisplayedSpouseCount());
    EXPECT_TRUE(person.nonDisplayedSpousesLoaded);
    EXPECT_FALSE(person.nonDisplayedSpouses[0].gender);
    EXPECT_FALSE(person.nonDisplayedSpouses[1].gender);
    EXPECT_EQ(7, host.askedFor);
    EXPECT_TRUE(host.cameEmpty);
}

TEST(HiddenSpouses, areLoadedBeforeTheWalkIsCalled) {
    TreeViewPerson person(7);
    SpousesOfTheHost host;
    const TreeViewPerson::Iterator walk = person.getNonDisplayedSpouseIterator(host.loader());
    EXPECT_EQ(1, host.asked);
    EXPECT_EQ(2, person.getNonDisplayedSpouseCount());
}

TEST(HiddenSpouses, areAskedForOnceWhateverTheSecondLoader) {
    TreeViewPerson person(7);
    SpousesOfTheHost host;
    SpousesOfTheHost other;
    person.getNonDisplayedSpouseIterator(host.loader());
    EXPECT_EQ((Keys{9, 4}), keysOf(person.getNonDisplayedSpouseIterator(other.loader())));
    EXPECT_EQ((Keys{9, 4}), keysOf(person.getNonDisplayedSpouseIterator(TreeViewPerson::SpousesLoader())));
    EXPECT_EQ(1, host.asked);
    EXPECT_EQ(0, other.asked);
    EXPECT_EQ(2, person.getNonDisplayedSpouseCount());
}

TEST(HiddenSpouses, leaveTheDisplayedOnesAlone) {
    TreeViewPerson person(7);
    person.addSpouse(9, true);
    SpousesOfTheHost host;
    person.getNonDisplayedSpouseIterator(host.loader());
    EXPECT_EQ((Keys{9}), keysOf(person.spouses));
    EXPECT_EQ((Keys{9, 4}), keysOf(person.nonDisplayedSpouses));
}

TEST(HiddenSpouses, loaderThatFailsIsNotAskedAgain) {
    TreeViewPerson person(7);
    const TreeViewPerson::SpousesLoader failing = [](int, SpouseSet&) { throw std::runtime_error("no"); };
    EXPECT_EQ("no", failureOf<std::runtime_error>([&] { person.getNonDisplayedSpouseIterator(failing); }));
    EXPECT_TRUE(person.nonDisplayedSpousesLoaded);
    EXPECT_EQ(Keys{}, keysOf(person.getNonDisplayedSpouseIterator(failing)));
}

TEST(HiddenSpouses, emptyLoaderFailsByNameAndMarksTheNodeAsLoaded) {
    TreeViewPerson person(7);
    EXPECT_EQ(kEmptyFunctionFailure, failureOf<boost::bad_function_call>([&] {
                  person.getNonDisplayedSpouseIterator(TreeViewPerson::SpousesLoader());
              }));
    EXPECT_TRUE(person.nonDisplayedSpousesLoaded);
}

TEST(HostsChildren, areKeptInTheNodeInTheOrderOfTheirRecords) {
    TreeViewPerson person(7);
    ChildrenOfTheHost host;
    ChildrenSet& children = person.getAllChildrenVector(host.loader());
    EXPECT_EQ(&person.allChildren, &children);
    ASSERT_EQ(2u, children.size());
    EXPECT_EQ(4, children.begin()->key);
    EXPECT_EQ(9, children.rbegin()->key);
    EXPECT_EQ(7, host.askedFor);
    EXPECT_TRUE(person.allChildrenLoaded);
}

TEST(HostsChildren, areAskedForOnceWhateverTheSecondLoader) {
    TreeViewPerson person(7);
    ChildrenOfTheHost host;
    ChildrenOfTheHost other;
    person.getAllChildrenVector(host.loader());
    EXPECT_EQ(2u, person.getAllChildrenVector(other.loader()).size());
    EXPECT_EQ(2u, person.getAllChildrenVector(TreeViewPerson::ChildrenLoader()).size());
    EXPECT_EQ(1, host.asked);
    EXPECT_EQ(0, other.asked);
}

TEST(HostsChildren, areAskedForOnceAlsoWhereThereAreNone) {
    TreeViewPerson person(7);
    int asked = 0;
    const TreeViewPerson::ChildrenLoader childless = [&](int, ChildrenSet&) { ++asked; };
    person.getAllChildrenVector(childless);
    EXPECT_TRUE(person.getAllChildrenVector(childless).empty());
    EXPECT_EQ(1, asked);
}

TEST(HostsChildren, addNobodyToTheDisplay) {
    TreeViewPerson person(7);
    ChildrenOfTheHost host;
    person.getAllChildrenVector(host.loader());
    EXPECT_EQ(0, person.getAllChildrenCount());
}

TEST(HostsChildren, loaderThatFailsIsNotAskedAgain) {
    TreeViewPerson person(7);
    const TreeViewPerson::ChildrenLoader failing = [](int, ChildrenSet& set) {
        set.insert(ChildrenAdapter(9, "", "99", 1));
        throw std::runtime_error("no");
    };
    EXPECT_EQ("no", failureOf<std::runtime_error>([&] { person.getAllChildrenVector(failing); }));
    EXPECT_TRUE(person.allChildrenLoaded);
    EXPECT_EQ(1u, person.getAllChildrenVector(failing).size());  // what it had put in place stays
}

TEST(HostsChildren, emptyLoaderFailsByNameAndMarksTheNodeAsLoaded) {
    TreeViewPerson person(7);
    EXPECT_EQ(kEmptyFunctionFailure, failureOf<boost::bad_function_call>([&] {
                  person.getAllChildrenVector(TreeViewPerson::ChildrenLoader());
              }));
    EXPECT_TRUE(person.getAllChildrenVector(TreeViewPerson::ChildrenLoader()).empty());
}

}  // namespace
