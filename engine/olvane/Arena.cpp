// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Blocks and the pieces cut from them. Blocks grow with half of what has been taken so far, so that a small
// picture takes little and a large one asks the system seldom; their length is capped, since the last one is
// never full.

#include <olvane/Arena.h>

#include <algorithm>

// Under the address sanitizer every piece is an allocation of its own, or a stray pointer into another piece
// of the same block would go unseen.
#if defined(__SANITIZE_ADDRESS__)
#define OLVANE_EACH_PIECE_ALONE 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define OLVANE_EACH_PIECE_ALONE 1
#endif
#endif
#ifndef OLVANE_EACH_PIECE_ALONE
#define OLVANE_EACH_PIECE_ALONE 0
#endif

namespace olvane {

namespace {

constexpr bool kEachPieceAlone = OLVANE_EACH_PIECE_ALONE != 0;
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

void Arena::giveBack(void* piece, std::size_t bytes) noexcept {
    if (kEachPieceAlone) {
        ::operator delete(piece);
        return;
    }
    const std::size_t granules = granulesOf(bytes);
    if (granules < kReusedSizes) returned_[granules] = new (piece) Link{returned_[granules]};
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
