// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The admitted keys as an ordered map, whenever it is looked at.

#include <stdexcept>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/detail/AdmittedKeys.h>

namespace {

using SharedTreeViewer::AdmittedKeys;

std::vector<int> keysIn(const AdmittedKeys& admitted) {
    std::vector<int> keys;
    for (const auto& [key, value] : admitted) keys.push_back(key);
    return keys;
}

class AdmittedKeysOfAGraph : public testing::Test {
protected:
    olvane::Arena arena;
    AdmittedKeys admitted{&arena};
};

TEST_F(AdmittedKeysOfAGraph, areNoneAtFirst) {
    EXPECT_TRUE(admitted.empty());
    EXPECT_EQ(0u, admitted.size());
    EXPECT_EQ(0u, admitted.sizeAtMost());
    EXPECT_EQ(admitted.end(), admitted.find(0));
    EXPECT_THROW(admitted.at(0), std::out_of_range);
}

TEST_F(AdmittedKeysOfAGraph, standInTheOrderOfTheKeysAndOnce) {
    for (const int key : {7, 3, 9, 3, -1}) admitted.admit(key);
    EXPECT_FALSE(admitted.empty());
    EXPECT_LE(4u, admitted.sizeAtMost());
    EXPECT_EQ((std::vector<int>{-1, 3, 7, 9}), keysIn(admitted));
    EXPECT_EQ(4u, admitted.size());
    EXPECT_EQ(4u, admitted.sizeAtMost());
    EXPECT_TRUE(admitted.at(7));
    EXPECT_EQ(1u, admitted.count(9));
    EXPECT_EQ(0u, admitted.count(8));
    EXPECT_EQ(3, admitted.find(3)->first);
}

TEST_F(AdmittedKeysOfAGraph, comeInBetweenLooks) {
    admitted.admit(5);
    EXPECT_EQ(1u, admitted.count(5));
    admitted.admit(4);
    EXPECT_FALSE(admitted.empty());
    EXPECT_EQ((std::vector<int>{4, 5}), keysIn(admitted));
}

TEST_F(AdmittedKeysOfAGraph, leaveAnEntryThatIsThereAsItIs) {
    admitted[5] = false;
    admitted.admit(5);
    EXPECT_FALSE(admitted.at(5));
    EXPECT_FALSE(admitted[5]);
    admitted.map().erase(5);
    EXPECT_EQ(0u, admitted.count(5));
}

TEST_F(AdmittedKeysOfAGraph, giveWayToOthers) {
    admitted.admit(5);
    admitted = {{7, true}, {6, true}};
    EXPECT_EQ((std::vector<int>{6, 7}), keysIn(admitted));
    admitted.admit(8);
    admitted.clear();
    EXPECT_TRUE(admitted.empty());
    EXPECT_EQ(0u, admitted.sizeAtMost());
}

}  // namespace
