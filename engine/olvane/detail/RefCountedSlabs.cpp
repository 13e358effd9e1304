// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A slab that is being filled carries a bias in its count, so that it stays while its blocks come and go, and a block is
// carved without touching the count. When the slab is full, the bias is subtracted but for the blocks on it.

#include <olvane/detail/RefCountedSlabs.h>

#include <limits>
#include <new>

#include <olvane/detail/PoolingInternal.h>

namespace olvane {

namespace {

constexpr std::size_t kSlabSize = std::size_t{1} << 10;
constexpr std::uint32_t kOpenSlabBias = std::numeric_limits<std::uint32_t>::max();

}  // namespace

void* RefCountedSlabs::allocateSlow(std::size_t size) {
    const std::size_t usable = kSlabSize - sizeof(Slab);
    if (kPoolingDisabled || size > usable) return allocateSingle(size - sizeof(BlockHeader));
    Slab* const fresh = new (::operator new(kSlabSize)) Slab{kOpenSlabBias};
    releaseCurrentSlab();
    slab_ = fresh;
    place_ = reinterpret_cast<char*>(fresh + 1);
    left_ = usable;
    return carve(size);
}

void* RefCountedSlabs::allocateSingle(std::size_t bytes) {
    return new (::operator new(sizeWithHeader(bytes))) BlockHeader{nullptr} + 1;
}

void RefCountedSlabs::freeSingle(void* block) noexcept {
    ::operator delete(headerOf(block));
}

void RefCountedSlabs::releaseCurrentSlab() noexcept {
    if (slab_ == nullptr) return;
    subtractLive(slab_, kOpenSlabBias - carved_);
    slab_ = nullptr;
    left_ = 0;
    carved_ = 0;
}

void RefCountedSlabs::subtractLive(Slab* slab, std::uint32_t blocks) noexcept {
    if (slab->live.fetch_sub(blocks, std::memory_order_acq_rel) == blocks) ::operator delete(slab);
}

}  // namespace olvane
