// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Chunks, and the blocks carved from them. A new chunk has half the size of all chunks so far, so that a small picture
// allocates little and a large one asks the system seldom; its length is capped, since the last one is never full.

#include <olvane/detail/Arena.h>

#include <algorithm>

#include <olvane/detail/PoolingInternal.h>

namespace olvane {

namespace {

constexpr std::size_t kFirstChunk = std::size_t{8} << 10;
constexpr std::size_t kLargestChunk = std::size_t{64} << 10;

}  // namespace

Arena::~Arena() {
    while (chunks_ != nullptr) {
        Link* const chunk = chunks_;
        chunks_ = chunk->next;
        ::operator delete(chunk);
    }
}

void* Arena::allocateSlow(std::size_t bytes) {
    if (kPoolingDisabled) return ::operator new(bytes);  // every time, since no chunk is ever added
    return carveFromNewChunk(granulesOf(bytes) * kGranule);
}

void Arena::freeSingle(void* block) noexcept {
    ::operator delete(block);
}

// A block that would fill a chunk nearly alone gets one of its own, and the rest of the newest chunk stays in use.
void* Arena::carveFromNewChunk(std::size_t size) {
    const std::size_t usual = std::clamp(reserved_ / 2, kFirstChunk, kLargestChunk) - kGranule;
    if (size > usual / 2) return addChunk(size);
    char* const block = addChunk(usual);
    place_ = block + size;
    left_ = usual - size;
    return block;
}

// The first granule of a chunk is the link to the one before it.
char* Arena::addChunk(std::size_t size) {
    void* const chunk = ::operator new(size + kGranule);
    chunks_ = new (chunk) Link{chunks_};
    reserved_ += size + kGranule;
    return static_cast<char*>(chunk) + kGranule;
}

}  // namespace olvane
