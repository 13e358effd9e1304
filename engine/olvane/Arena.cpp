// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Blocks and the pieces cut from them. Blocks grow with half of what has been taken so far, so that a small
// picture takes little and a large one asks the system seldom; their length is capped, since the last one is
// never full.

#include <olvane/Arena.h>

#include <algorithm>

#include <olvane/EachPieceAloneInternal.h>

namespace olvane {

namespace {

constexpr std::size_t kFirstBlock = std::size_t{8} << 10;
constexpr std::size_t kLargestBlock = std::size_t{64} << 10;

}  // namespace

Arena::~Arena() {
    while (blocks_ != nullptr) {
        Link* const block = blocks_;
        blocks_ = block->next;
        ::operator delete(block);
    }
}

void* Arena::takeAnew(std::size_t bytes) {
    if (kEachPieceAlone) return ::operator new(bytes);  // every time, since no block is ever added
    return cutFromNewBlock(granulesOf(bytes) * kGranule);
}

void Arena::freeAlone(void* piece) noexcept {
    ::operator delete(piece);
}

// A piece that would fill a block nearly alone gets one of its own, and the rest of the newest block stays in
// use.
void* Arena::cutFromNewBlock(std::size_t size) {
    const std::size_t usual = std::clamp(taken_ / 2, kFirstBlock, kLargestBlock) - kGranule;
    if (size > usual / 2) return addBlock(size);
    char* const piece = addBlock(usual);
    place_ = piece + size;
    left_ = usual - size;
    return piece;
}

// The first granule of a block is the link to the one before it.
char* Arena::addBlock(std::size_t size) {
    void* const block = ::operator new(size + kGranule);
    blocks_ = new (block) Link{blocks_};
    taken_ += size + kGranule;
    return static_cast<char*>(block) + kGranule;
}

}  // namespace olvane
