// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The holder of the six callbacks.

#include <string>

#include <gtest/gtest.h>

#include <olvane/adapters/DataAdapter.h>

namespace {

// Each callback leaves its own mark.
struct Marks {
    std::string last;

    DataAdapter adapter() {
        return DataAdapter([this](int, SpouseSet&) { last = "spouses"; },
                           [this](int, int& father, int& mother) {
                               last = "parents";
                               father = 7;
                               mother = 9;
                           },
                           [this](int, ChildrenSet&) { last = "children"; },
                           [this](int) {
                               last = "male";
                               return true;
                           },
                           [this](int) {
                               last = "addNode";
                               return false;
                           },
                           [this](int) { last = "touch"; });
    }
};

TEST(DataAdapterFields, holdTheCallbacksInTheOrderOfTheConstructor) {
    Marks marks;
    const DataAdapter adapter = marks.adapter();
    SpouseSet spouses;
    ChildrenSet children;
    int father = -1;
    int mother = -1;
    adapter.getSpouses(0, spouses);
    EXPECT_EQ("spouses", marks.last);
    adapter.getParents(0, father, mother);
    EXPECT_EQ("parents", marks.last);
    EXPECT_EQ(7, father);
    EXPECT_EQ(9, mother);
    adapter.getChildren(0, children);
    EXPECT_EQ("children", marks.last);
    EXPECT_TRUE(adapter.isMale(0));
    EXPECT_EQ("male", marks.last);
    EXPECT_FALSE(adapter.isAddNode(0));
    EXPECT_EQ("addNode", marks.last);
    adapter.touchPerson(0);
    EXPECT_EQ("touch", marks.last);
}

TEST(DataAdapterFields, areCopiesOfTheCallbacks) {
    DataAdapter::KeyTest male = [](int) { return true; };
    const DataAdapter adapter({}, {}, {}, male, {}, {});
    male = [](int) { return false; };
    EXPECT_TRUE(adapter.isMale(0));
}

template <class Call>
std::string failureOf(Call call) {
    try {
        call();
    } catch (const boost::bad_function_call& failure) {
        return failure.what();
    }
    return std::string();
}

TEST(DataAdapterFields, leftEmptyFailByNameWhenCalled) {
    const DataAdapter adapter({}, {}, {}, {}, {}, {});
    const std::string kFailure = "call to empty boost::function";
    SpouseSet spouses;
    ChildrenSet children;
    int father = -1;
    int mother = -1;
    EXPECT_EQ(kFailure, failureOf([&] { adapter.getSpouses(0, spouses); }));
    EXPECT_EQ(kFailure, failureOf([&] { adapter.getParents(0, father, mother); }));
    EXPECT_EQ(kFailure, failureOf([&] { adapter.getChildren(0, children); }));
    EXPECT_EQ(kFailure, failureOf([&] { adapter.isMale(0); }));
    EXPECT_EQ(kFailure, failureOf([&] { adapter.isAddNode(0); }));
    EXPECT_EQ(kFailure, failureOf([&] { adapter.touchPerson(0); }));
}

}  // namespace
