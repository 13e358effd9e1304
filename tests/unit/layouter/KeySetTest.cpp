// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The set of keys, with keys as they are handed out and with any that a host may make up.

#include <limits>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/detail/KeySet.h>

namespace {

using SharedTreeViewer::KeySet;

// The last of each are far out of what is kept as marks.
const std::vector<int> kOddKeys = {0,
                                   1,
                                   1023,
                                   1024,
                                   1025,
                                   5000,
                                   1000000,
                                   std::numeric_limits<int>::max(),
                                   -1,
                                   -1024,
                                   std::numeric_limits<int>::min()};

TEST(KeySet, holdsNothingAtFirst) {
    const KeySet keys;
    for (const int key : kOddKeys) EXPECT_FALSE(keys.contains(key)) << key;
}

TEST(KeySet, holdsWhatWasPutInAndNothingElse) {
    for (const int put : kOddKeys) {
        KeySet keys;
        keys.insert(put);
        for (const int key : kOddKeys) EXPECT_EQ(key == put, keys.contains(key)) << put << " and " << key;
    }
}

TEST(KeySet, holdsKeysTogetherWhereverTheyLie) {
    KeySet keys;
    for (const int key : kOddKeys) keys.insert(key);
    for (const int key : kOddKeys) EXPECT_TRUE(keys.contains(key)) << key;
    EXPECT_FALSE(keys.contains(2));
    EXPECT_FALSE(keys.contains(-2));
    EXPECT_FALSE(keys.contains(1000001));
}

TEST(KeySet, keepsKeysInARowWhileItGrows) {
    constexpr int kCount = 20000;
    KeySet keys;
    for (int key = 0; key < kCount; key += 2) keys.insert(key);
    for (int key = 0; key < kCount; ++key) ASSERT_EQ(key % 2 == 0, keys.contains(key)) << key;
}

TEST(KeySet, stillHoldsAKeyThatWasFarOutWhenItCame) {
    KeySet keys;
    keys.insert(3000);
    for (int key = 0; key < 200; ++key) keys.insert(key);
    EXPECT_TRUE(keys.contains(3000));
    EXPECT_FALSE(keys.contains(2999));
}

TEST(KeySet, isEmptyOnceCleared) {
    KeySet keys;
    for (const int key : kOddKeys) keys.insert(key);
    keys.clear();
    for (const int key : kOddKeys) EXPECT_FALSE(keys.contains(key)) << key;
    keys.insert(7);
    EXPECT_TRUE(keys.contains(7));
}

}  // namespace
