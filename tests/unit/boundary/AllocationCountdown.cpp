// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Replaces the global allocation functions. The forms without exceptions come down to these by the
// rules of the language.

#include <unit/boundary/AllocationCountdown.h>

#include <atomic>
#include <cstdlib>
#include <new>

namespace {

// Counts of several threads are sums; a failure comes to whichever thread is next.
std::atomic<std::int64_t> made = 0;
std::atomic<std::int64_t> outstanding = 0;
std::atomic<std::int64_t> untilFailure = 0;

}  // namespace

// The alignment is a power of two and at least that of a pointer, or 0 for the ordinary one.
static void* countedMemory(std::size_t size, std::size_t alignment) {
    ++made;
    if (untilFailure > 0 && --untilFailure == 0) throw std::bad_alloc();
    void* memory = nullptr;
    if (alignment == 0) {
        memory = std::malloc(size == 0 ? 1 : size);
    } else if (posix_memalign(&memory, alignment, size == 0 ? 1 : size) != 0) {
        memory = nullptr;
    }
    if (memory == nullptr) throw std::bad_alloc();
    ++outstanding;
    return memory;
}

static void release(void* memory) {
    if (memory == nullptr) return;
    --outstanding;
    std::free(memory);
}

static std::size_t usableAlignment(std::align_val_t alignment) {
    const auto asked = static_cast<std::size_t>(alignment);
    return asked < sizeof(void*) ? sizeof(void*) : asked;
}

void* operator new(std::size_t size) {
    return countedMemory(size, 0);
}

void* operator new[](std::size_t size) {
    return countedMemory(size, 0);
}

void* operator new(std::size_t size, std::align_val_t alignment) {
    return countedMemory(size, usableAlignment(alignment));
}

void* operator new[](std::size_t size, std::align_val_t alignment) {
    return countedMemory(size, usableAlignment(alignment));
}

// What a caller asks for who can do without it, such as a stable sort: never made to fail, since that would end no call.
void* operator new(std::size_t size, const std::nothrow_t&) noexcept {
    void* const memory = std::malloc(size == 0 ? 1 : size);
    if (memory != nullptr) ++outstanding;
    return memory;
}

void operator delete(void* memory, const std::nothrow_t&) noexcept {
    release(memory);
}

void operator delete(void* memory) noexcept {
    release(memory);
}

void operator delete[](void* memory) noexcept {
    release(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    release(memory);
}

void operator delete[](void* memory, std::size_t) noexcept {
    release(memory);
}

void operator delete(void* memory, std::align_val_t) noexcept {
    release(memory);
}

void operator delete[](void* memory, std::align_val_t) noexcept {
    release(memory);
}

void operator delete(void* memory, std::size_t, std::align_val_t) noexcept {
    release(memory);
}

void operator delete[](void* memory, std::size_t, std::align_val_t) noexcept {
    release(memory);
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
