// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace unit {

// The global operator new of a test program that links AllocationCountdown.cpp: it counts, and fails on
// demand. For one thread.

// Allocations so far, failed ones included, and those of them that have not been released.
std::int64_t allocationsMade();
std::int64_t allocationsOutstanding();

// The n-th allocation from now, counted from 1, throws std::bad_alloc while this object lives; those behind
// it succeed again. With 0 none fails.
class AllocationFailure {
public:
    explicit AllocationFailure(std::int64_t n);
    ~AllocationFailure();
    AllocationFailure(const AllocationFailure&) = delete;
    AllocationFailure& operator=(const AllocationFailure&) = delete;
};

}  // namespace unit
