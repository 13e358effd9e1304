// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of spouses: the host's order where both have a place in it, and the rules for records without
// one.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/adapters/SpouseAdapter.h>

namespace {

constexpr int kNoPlace = 0;

SpouseAdapter placed(int key, int hostOrder) {
    return SpouseAdapter(key, false, false, "", "", hostOrder);
}

SpouseAdapter unplaced(bool preferred, bool alive, const std::string& date, const std::string& idText) {
    return SpouseAdapter(1, preferred, alive, date, idText, kNoPlace);
}

void expectBefore(const SpouseAdapter& first, const SpouseAdapter& second) {
    EXPECT_TRUE(first < second);
    EXPECT_FALSE(second < first);
}

void expectEquivalent(const SpouseAdapter& first, const SpouseAdapter& second) {
    EXPECT_FALSE(first < second);
    EXPECT_FALSE(second < first);
}

std::vector<std::string> datesInOrder(const SpouseSet& set) {
    std::vector<std::string> dates;
    for (const SpouseAdapter& record : set) dates.push_back(record.date);
    return dates;
}

TEST(SpouseRecord, takesItsSixValuesInOrder) {
    const SpouseAdapter record(7, true, false, "1850", "42", 3);
    EXPECT_EQ(7, record.key);
    EXPECT_TRUE(record.preferred);
    EXPECT_FALSE(record.alive);
    EXPECT_EQ("1850", record.date);
    EXPECT_EQ("42", record.idText);
    EXPECT_EQ(3, record.hostOrder);
}

TEST(SpouseOrder, isTheHostsWhereBothHaveAPlace) {
    expectBefore(placed(9, 1), placed(2, 2));
    expectBefore(placed(1, 2), placed(1, 10));
    expectEquivalent(placed(1, 4), placed(2, 4));
}

TEST(SpouseOrder, placeOutweighsPreferenceLifeAndDate) {
    expectBefore(SpouseAdapter(1, false, false, "1", "1", 1), SpouseAdapter(2, true, true, "9", "9", 2));
}

TEST(SpouseOrder, onePlaceAloneDoesNotCount) {
    expectBefore(SpouseAdapter(1, true, false, "", "", kNoPlace), SpouseAdapter(2, false, false, "", "", 1));
    expectBefore(SpouseAdapter(1, true, false, "", "", 5), SpouseAdapter(2, false, false, "", "", kNoPlace));
    expectBefore(SpouseAdapter(1, true, false, "", "", 5), SpouseAdapter(2, false, false, "", "", -1));
}

TEST(SpouseOrder, preferredOneComesFirstWithoutAPlace) {
    expectBefore(unplaced(true, false, "1", "1"), unplaced(false, true, "9", "9"));
}

TEST(SpouseOrder, livingOneComesNext) {
    expectBefore(unplaced(true, true, "1", "1"), unplaced(true, false, "9", "9"));
    expectBefore(unplaced(false, true, "1", "1"), unplaced(false, false, "9", "9"));
}

TEST(SpouseOrder, greaterDateComesFirst) {
    expectBefore(unplaced(false, false, "9", "1"), unplaced(false, false, "1", "9"));
}

TEST(SpouseOrder, recordsWithoutAPlaceRunFromTheGreatestDateToTheLeast) {
    SpouseSet set;
    for (const char* date : {"1850", "", "1900", "1"}) set.insert(unplaced(false, true, date, "7"));
    EXPECT_EQ((std::vector<std::string>{"1900", "1850", "1", ""}), datesInOrder(set));
}

TEST(SpouseOrder, greaterIdTextComesFirstAtLast) {
    expectBefore(unplaced(false, false, "1", "9"), unplaced(false, false, "1", "10"));
    expectEquivalent(unplaced(false, false, "1", "9"), unplaced(false, false, "1", "9"));
}

TEST(SpouseOrder, textsAreComparedAsBytesAPrefixBeingTheLesser) {
    expectBefore(unplaced(false, false, "9", ""), unplaced(false, false, "10", ""));
    expectBefore(unplaced(false, false, "185", ""), unplaced(false, false, "18", ""));
    expectBefore(unplaced(false, false, "\xC3\xA9", ""), unplaced(false, false, "z", ""));
    expectBefore(unplaced(false, false, "a", ""), unplaced(false, false, "Z", ""));
}

TEST(SpouseOrder, keyDoesNotCount) {
    expectEquivalent(SpouseAdapter(1, false, false, "1", "9", kNoPlace),
                     SpouseAdapter(2, false, false, "1", "9", kNoPlace));
}

TEST(SpouseSets, recordEquivalentToOneThatIsThereIsNotInserted) {
    SpouseSet set;
    set.insert(placed(1, 1));
    EXPECT_FALSE(set.insert(placed(2, 1)).second);
    ASSERT_EQ(1u, set.size());
    EXPECT_EQ(1, set.begin()->key);
}

TEST(SpouseSets, oneKeyAtTwoPlacesStandsTwice) {
    SpouseSet set;
    set.insert(placed(1, 1));
    EXPECT_TRUE(set.insert(placed(1, 2)).second);
    EXPECT_EQ(2u, set.size());
}

}  // namespace
