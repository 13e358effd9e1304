// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of children: by key where both have a place in the host's list, and the rules for the child of an
// unknown parent, which has none.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/adapters/ChildrenAdapter.h>

namespace {

ChildrenAdapter placed(int key, int hostOrder) {
    return ChildrenAdapter(key, "", "", hostOrder);
}

ChildrenAdapter unplaced(int key, const std::string& date, const std::string& idText) {
    return ChildrenAdapter(key, date, idText);
}

void expectBefore(const ChildrenAdapter& first, const ChildrenAdapter& second) {
    EXPECT_TRUE(first < second);
    EXPECT_FALSE(second < first);
}

void expectEquivalent(const ChildrenAdapter& first, const ChildrenAdapter& second) {
    EXPECT_FALSE(first < second);
    EXPECT_FALSE(second < first);
}

TEST(ChildRecord, takesItsFourValuesInOrder) {
    const ChildrenAdapter record(7, "1850", "42", 3);
    EXPECT_EQ(7, record.key);
    EXPECT_EQ("1850", record.date);
    EXPECT_EQ("42", record.idText);
    EXPECT_EQ("", record.sortText);
    EXPECT_EQ(3, record.hostOrder);
}

TEST(ChildRecord, withoutAPlaceHasTheHostOrderZero) {
    const ChildrenAdapter record(7, "", "42");
    EXPECT_EQ(0, record.hostOrder);
    EXPECT_EQ("", record.sortText);
}

TEST(ChildOrder, isByKeyNotByPlaceWhereBothHaveAPlace) {
    expectBefore(placed(2, 9), placed(5, 1));
    expectEquivalent(placed(2, 1), placed(2, 7));
}

TEST(ChildOrder, keyOutweighsDateAndIdWhereBothHaveAPlace) {
    expectBefore(ChildrenAdapter(2, "9", "9", 1), ChildrenAdapter(5, "1", "1", 2));
}

TEST(ChildOrder, onePlaceAloneDoesNotCount) {
    expectBefore(ChildrenAdapter(9, "1", "", 1), ChildrenAdapter(2, "2", "", 0));
    expectBefore(ChildrenAdapter(9, "1", "", 0), ChildrenAdapter(2, "2", "", 1));
    expectBefore(ChildrenAdapter(9, "1", "", -1), ChildrenAdapter(2, "2", "", 1));
}

TEST(ChildOrder, lesserDateComesFirstAndTheEmptyOneAheadOfAll) {
    ChildrenSet set;
    for (const char* date : {"1850", "", "1900", "1"}) set.insert(unplaced(1, date, "7"));
    std::vector<std::string> dates;
    for (const ChildrenAdapter& record : set) dates.push_back(record.date);
    EXPECT_EQ((std::vector<std::string>{"", "1", "1850", "1900"}), dates);
}

TEST(ChildOrder, lesserIdTextComesNext) {
    expectBefore(unplaced(9, "1", "10"), unplaced(2, "1", "9"));
    expectBefore(unplaced(9, "1", "1"), unplaced(2, "1", "10"));
}

TEST(ChildOrder, lesserKeyComesAtLast) {
    expectBefore(unplaced(2, "1", "9"), unplaced(9, "1", "9"));
    expectEquivalent(unplaced(2, "1", "9"), unplaced(2, "1", "9"));
}

TEST(ChildOrder, textsAreComparedAsBytes) {
    expectBefore(unplaced(1, "10", ""), unplaced(1, "9", ""));
    expectBefore(unplaced(1, "z", ""), unplaced(1, "\xC3\xA9", ""));
}

TEST(ChildOrder, unlikeSortTextsStandBeforeEachOtherBothWays) {
    ChildrenAdapter first = unplaced(1, "1", "1");
    ChildrenAdapter second = unplaced(2, "1", "2");
    first.sortText = "a";
    second.sortText = "b";
    EXPECT_TRUE(first < second);
    EXPECT_TRUE(second < first);
}

// The comparison ends at a zero byte: texts that differ behind it only are unlike, and yet neither is before.
TEST(ChildOrder, sortTextsThatDifferBehindAZeroByteStandBeforeEachOtherNeitherWay) {
    ChildrenAdapter first = unplaced(1, "1", "1");
    ChildrenAdapter second = unplaced(2, "1", "2");
    first.sortText = std::string(
        "a\0"
        "b",
        3);
    second.sortText = std::string(
        "a\0"
        "c",
        3);
    expectEquivalent(first, second);
}

TEST(ChildOrder, dateOutweighsUnlikeSortTextsAndSortTextsTheId) {
    ChildrenAdapter early = unplaced(1, "1", "2");
    ChildrenAdapter late = unplaced(1, "2", "1");
    early.sortText = "b";
    late.sortText = "a";
    expectBefore(early, late);
    late.date = "1";
    EXPECT_TRUE(late < early);
    EXPECT_TRUE(early < late);  // by the ids it would stand behind
}

TEST(ChildOrder, sameChildFromARealParentAndFromAnAddNodeIsEquivalentOnlyWithoutADate) {
    const ChildrenAdapter fromAddNode(0, "", "17");
    expectEquivalent(ChildrenAdapter(0, "", "17", 3), fromAddNode);
    expectBefore(fromAddNode, ChildrenAdapter(0, "1", "17", 3));
}

TEST(ChildrenSets, oneKeyAtTwoPlacesStandsOnceWithTheFirst) {
    ChildrenSet set;
    set.insert(placed(1, 1));
    EXPECT_FALSE(set.insert(placed(1, 2)).second);
    ASSERT_EQ(1u, set.size());
    EXPECT_EQ(1, set.begin()->hostOrder);
}

}  // namespace
