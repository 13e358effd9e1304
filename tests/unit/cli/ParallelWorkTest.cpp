// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/ParallelWork.h>

#include <gtest/gtest.h>

#include <atomic>
#include <stdexcept>
#include <vector>

namespace olvane::cli {
namespace {

TEST(ParallelWork, isDoneOnceForEachNumber) {
    std::vector<std::atomic<int>> done(1000);
    inParallel(done.size(), [&done](std::size_t i) { ++done[i]; });
    for (const std::atomic<int>& times : done) EXPECT_EQ(times, 1);
    inParallel(0, [](std::size_t) { FAIL() << "there is nothing to do"; });
}

TEST(ParallelWork, passesAnExceptionOnAndLeavesTheRest) {
    std::atomic<std::size_t> done = 0;
    const auto work = [&done](std::size_t i) {
        if (i == 10) throw std::runtime_error("ten");
        ++done;
    };
    EXPECT_THROW(inParallel(1000000, work), std::runtime_error);
    EXPECT_LT(done, 999999U);
}

}  // namespace
}  // namespace olvane::cli
