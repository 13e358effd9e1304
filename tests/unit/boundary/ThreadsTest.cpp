// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Layouts on several threads at once: each thread counts its own negative ids.

#include <atomic>
#include <memory>
#include <string>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <support/FamilyText.h>
#include <unit/boundary/Request.h>

namespace {

using support::CaseFile;
using support::CaseManager;
using support::family;

constexpr int kRounds = 100;

std::string layOut(const CaseFile& input) {
    return FamilyViewLayout("17", std::make_shared<CaseManager>(input));
}

// Both begin together; the answer counts the texts that differ from the expected one.
int differencesWhileBothRun(const CaseFile& one, const CaseFile& other) {
    const std::string expectedOfOne = layOut(one);
    const std::string expectedOfOther = layOut(other);
    std::atomic<int> ready{0};
    std::atomic<int> differences{0};
    const auto run = [&](const CaseFile& input, const std::string& expected) {
        ++ready;
        while (ready < 2) std::this_thread::yield();
        for (int i = 0; i < kRounds; ++i) differences += layOut(input) == expected ? 0 : 1;
    };
    std::thread first([&] { run(one, expectedOfOne); });
    std::thread second([&] { run(other, expectedOfOther); });
    first.join();
    second.join();
    return differences;
}

TEST(TwoThreads, giveTheSameTextsAsOne) {
    const CaseFile input = family("17+42: 5 6f; 3: 17 18; 42f: 8");
    ASSERT_NE("", layOut(input));
    EXPECT_EQ(0, differencesWhileBothRun(input, input));
}

TEST(TwoThreads, doNotMixTheNegativeIdsOfTheirFamilies) {
    EXPECT_EQ(0, differencesWhileBothRun(family("17"), family("17+42: 5 6f; 4f: 17 18; 1+2: 4; 6f: 9")));
}

TEST(TwoThreads, lookAtUnknownParentsOfOneLeavesTheIdsOfTheOtherAlone) {
    unit::Request request(family("17"));
    int father = -1;
    int mother = -1;
    std::thread([] {
        unit::Request elsewhere(family("17"));
        int unused = -1;
        elsewhere.callbacks.getParents(elsewhere.key(17), unused, unused);
    }).join();
    request.callbacks.getParents(request.key(17), father, mother);
    EXPECT_EQ("-1", request.idText(father));
    EXPECT_EQ("-2", request.idText(mother));
}

}  // namespace
