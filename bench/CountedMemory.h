// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>

namespace bench {

// What the operators new and delete of a program did since the last call of startCounting. A program that is
// linked with CountedMemory.cpp has them replaced by counting ones.
//
// Units: bytes as malloc takes them for a block, its own eight included: more than what was asked for.
// Holds: one thread at a time; nothing else in the program may allocate meanwhile.
struct MemoryCount {
    std::size_t allocations = 0;
    std::size_t peakBytes = 0;  // above what was held when counting started
};

void startCounting();
MemoryCount memoryCount();

}  // namespace bench
