// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Replaces the global allocation functions. The forms for arrays, for sizes and without exceptions come down
// to these by the rules of the language.

#include <unit/boundary/AllocationCountdown.h>

#include <cstdlib>
#include <new>

namespace {

std::int64_t made = 0;
std::int64_t outstanding = 0;
std::int64_t untilFailure = 0;

}  // namespace

void* operator new(std::size_t size) {
    ++made;
    if (untilFailure > 0 && --untilFailure == 0) throw std::bad_alloc();
    void* const memory = std::malloc(size == 0 ? 1 : size);
    if (memory == nullptr) throw std::bad_alloc();
    ++outstanding;
    return memory;
}

void operator delete(void* memory) noexcept {
    if (memory == nullptr) return;
    --outstanding;
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    operator delete(memory);
}

void* operator new[](std::size_t size) {
    return operator new(size);
}

void operator delete[](void* memory) noexcept {
    operator delete(memory);
}

void operator delete[](void* memory, std::size_t) noexcept {
    operator delete(memory);
}

namespace unit {

std::int64_t allocationsMade() {
    return made;
}

std::int64_t allocationsOutstanding() {
    return outstanding;
}

AllocationFailure::AllocationFailure(std::int64_t n) {
    untilFailure = n;
}

AllocationFailure::~AllocationFailure() {
    untilFailure = 0;
}

}  // namespace unit
