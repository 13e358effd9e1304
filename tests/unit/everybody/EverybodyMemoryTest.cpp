// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Memory that fails at any place of a chart of everybody: the caller hears of it, nothing is lost, and the next
// chart is the same as ever.

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdint>
#include <new>
#include <vector>

#include <olvane/charts/Everybody.h>

#include <RandomKin.h>
#include <unit/boundary/AllocationCountdown.h>

namespace {

using olvane::charts::everybodyChart;
using olvane::charts::EverybodyOptions;
using olvane::picture::Picture;

bool isSame(const Picture& one, const Picture& other) {
    if (one.boxes.size() != other.boxes.size() || one.lines.size() != other.lines.size()) return false;
    for (std::size_t i = 0; i < one.boxes.size(); ++i) {
        if (one.boxes[i].x != other.boxes[i].x || one.boxes[i].y != other.boxes[i].y) return false;
    }
    for (std::size_t i = 0; i < one.lines.size(); ++i) {
        if (one.lines[i].x1 != other.lines[i].x1 || one.lines[i].y1 != other.lines[i].y1) return false;
    }
    return true;
}

// Every allocation fails once, those of long charts in steps.
void failEverywhere(const olvane::kin::KinGraph& graph, const EverybodyOptions& options) {
    const std::int64_t before = unit::allocationsMade();
    const Picture expected = everybodyChart(graph, options);
    const std::int64_t needed = unit::allocationsMade() - before;
    ASSERT_GT(needed, 50);
    const std::int64_t step = 1 + needed / 400;
    int failures = 0;
    for (std::int64_t n = 1; n <= needed; n += step) {
        const std::int64_t outstanding = unit::allocationsOutstanding();
        try {
            const unit::AllocationFailure failure(n);
            (void)everybodyChart(graph, options);
        } catch (const std::bad_alloc&) {
            ++failures;
        }
        ASSERT_EQ(unit::allocationsOutstanding(), outstanding) << "allocation " << n << " of " << needed;
    }
    EXPECT_GT(failures, 40);
    EXPECT_TRUE(isSame(everybodyChart(graph, options), expected));
}

TEST(EverybodyMemory, failureOfAnyAllocationIsReportedAndLosesNothing) {
    const auto graph = olvane::test::soundKin(5, 40);
    for (const int marks : {0, 2, -1}) {
        EverybodyOptions options;
        options.onePart = false;
        options.marks = marks;
        failEverywhere(graph, options);
    }
}

TEST(EverybodyMemory, failureOfAnyAllocationWithPlacesKeptOrForPaper) {
    const auto graph = olvane::test::soundKin(5, 40);
    EverybodyOptions options;
    options.onePart = false;
    const Picture earlier = everybodyChart(olvane::test::soundKin(5, 39), options);
    options.earlier = &earlier;
    failEverywhere(graph, options);
    options.earlier = nullptr;
    options.aspect = 1.4;
    options.compact = true;
    failEverywhere(graph, options);
}

}  // namespace
