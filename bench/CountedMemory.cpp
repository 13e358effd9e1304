// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The counting operators. A block's size is asked of malloc itself, at both ends of its life, so nothing is
// stored beside it and the blocks lie as they would without the count. What malloc itself keeps before each block is
// counted, too.

#include "CountedMemory.h"

#include <malloc.h>

#include <cstdint>
#include <cstdlib>
#include <new>

namespace {

constexpr std::size_t kBeforeEachBlock = sizeof(std::size_t);  // of glibc

std::size_t ALLOCATIONS = 0;
std::int64_t HELD_BYTES = 0;  // below 0 where blocks go that came before the count
std::int64_t PEAK_BYTES = 0;

std::int64_t bytesOf(void* block) {
    return static_cast<std::int64_t>(malloc_usable_size(block) + kBeforeEachBlock);
}

void* counted(void* block) {
    if (block == nullptr) throw std::bad_alloc();
    ++ALLOCATIONS;
    HELD_BYTES += bytesOf(block);
    if (HELD_BYTES > PEAK_BYTES) PEAK_BYTES = HELD_BYTES;
    return block;
}

void release(void* block) {
    if (block == nullptr) return;
    HELD_BYTES -= bytesOf(block);
    std::free(block);
}

std::size_t roundedUp(std::size_t size, std::size_t alignment) {
    return (size + alignment - 1) / alignment * alignment;
}

}  // namespace

void* operator new(std::size_t size) {
    return counted(std::malloc(size == 0 ? 1 : size));
}

void* operator new(std::size_t size, std::align_val_t alignment) {
    const auto bytes = static_cast<std::size_t>(alignment);
    return counted(std::aligned_alloc(bytes, roundedUp(size == 0 ? 1 : size, bytes)));
}

void operator delete(void* block) noexcept {
    release(block);
}

void operator delete(void* block, std::size_t) noexcept {
    release(block);
}

void operator delete(void* block, std::align_val_t) noexcept {
    release(block);
}

void operator delete(void* block, std::size_t, std::align_val_t) noexcept {
    release(block);
}

namespace bench {

void startCounting() {
    ALLOCATIONS = 0;
    HELD_BYTES = 0;
    PEAK_BYTES = 0;
}

MemoryCount memoryCount() {
    return MemoryCount{ALLOCATIONS, static_cast<std::size_t>(PEAK_BYTES)};
}

}  // namespace bench
