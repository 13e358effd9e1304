// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/ParallelWork.h>

#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <stdexcept>
#include <thread>
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
        // However late the thread that throws is, the others are not through by then.
        if (i > 10) std::this_thread::sleep_for(std::chrono::milliseconds(1));
        ++done;
    };
    EXPECT_THROW(inParallel(1000000, work), std::runtime_error);
    EXPECT_LT(done, 999999U);
}

}  // namespace
}  // namespace olvane::cli
