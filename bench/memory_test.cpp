// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Bounds on the memory of a layout with its result text: bytes at the peak and allocations, for each displayed
// person. Both count the same on every machine with one standard library, so a bound that is passed was passed
// by a change. Small families share what every layout needs at least, so allocations are held from a thousand
// persons on.

#include <gtest/gtest.h>

#include <new>
#include <string>

#include "CountedMemory.h"
#include "MadeLayout.h"

namespace {

constexpr double kMostBytes = 2048;

// A tenth above what a layout of a thousand persons needs.
constexpr double kMostAllocationsOfDescendants = 2.6;
constexpr double kMostAllocationsOfKin = 2.8;
constexpr double kMostAllocationsOfAncestors = 1.8;

struct MemoryForEachPerson {
    double bytes;
    double allocations;
};

MemoryForEachPerson memoryOf(const bench::LayoutName& name) {
    const bench::MadeLayout layout(name.shape, name.size);
    bench::startCounting();
    const std::string text = layout.text();
    const bench::MemoryCount count = bench::memoryCount();
    const auto shown = static_cast<double>(bench::shownPersons(text));
    return {static_cast<double>(count.peakBytes) / shown, static_cast<double>(count.allocations) / shown};
}

TEST(CountedMemory, countsWhatIsHeldAndNotWhatWasReturned) {
    bench::startCounting();
    ::operator delete(::operator new(1000));  // by name, since compilers may leave a new expression out
    void* const block = ::operator new(5000);
    const bench::MemoryCount count = bench::memoryCount();
    ::operator delete(block);
    EXPECT_EQ(count.allocations, 2u);
    EXPECT_GE(count.peakBytes, 5000u);
    EXPECT_LT(count.peakBytes, 6000u);
}

TEST(LayoutMemory, thirtyPersonsTakeNoMoreThanTwoKibibytesEach) {
    EXPECT_LE(memoryOf({"desc", 30}).bytes, kMostBytes);
    EXPECT_LE(memoryOf({"ego", 30}).bytes, kMostBytes);
    EXPECT_LE(memoryOf({"ped", 4}).bytes, kMostBytes);
}

TEST(LayoutMemory, aHundredPersonsTakeNoMoreThanTwoKibibytesEach) {
    EXPECT_LE(memoryOf({"desc", 100}).bytes, kMostBytes);
    EXPECT_LE(memoryOf({"ego", 100}).bytes, kMostBytes);
    EXPECT_LE(memoryOf({"ped", 6}).bytes, kMostBytes);
}

TEST(LayoutMemory, aThousandPersonsTakeNoMoreThanTwoKibibytesEach) {
    EXPECT_LE(memoryOf({"desc", 1003}).bytes, kMostBytes);
    EXPECT_LE(memoryOf({"ego", 1000}).bytes, kMostBytes);
    EXPECT_LE(memoryOf({"ped", 9}).bytes, kMostBytes);
}

TEST(LayoutMemory, tenThousandPersonsTakeNoMoreThanTwoKibibytesEach) {
    EXPECT_LE(memoryOf({"desc", 9998}).bytes, kMostBytes);
    EXPECT_LE(memoryOf({"ego", 10000}).bytes, kMostBytes);
    EXPECT_LE(memoryOf({"ped", 12}).bytes, kMostBytes);
}

TEST(LayoutAllocations, stayFewForEachPerson) {
    EXPECT_LE(memoryOf({"desc", 1003}).allocations, kMostAllocationsOfDescendants);
    EXPECT_LE(memoryOf({"ego", 1000}).allocations, kMostAllocationsOfKin);
    EXPECT_LE(memoryOf({"ped", 9}).allocations, kMostAllocationsOfAncestors);
}

TEST(LayoutAllocations, growNoFasterThanTheFamily) {
    EXPECT_LE(memoryOf({"desc", 9998}).allocations, kMostAllocationsOfDescendants);
    EXPECT_LE(memoryOf({"ego", 10000}).allocations, kMostAllocationsOfKin);
    EXPECT_LE(memoryOf({"ped", 12}).allocations, kMostAllocationsOfAncestors);
}

}  // namespace
