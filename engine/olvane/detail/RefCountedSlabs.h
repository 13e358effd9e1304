// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <atomic>
#include <cstddef>
#include <cstdint>
#include <new>

#include <olvane/Export.h>

namespace olvane {

// Memory for objects that may outlive a picture, as an edge does that a host holds by a shared pointer. Blocks lie side
// by side on slabs; each slab counts its live blocks and is released with the last one.
//
// Units: bytes. A block is aligned for every fundamental type.
// Holds: blocks may be deallocated in any order, on any thread, and after the object that allocated them.
// Fails: allocate throws std::bad_alloc and changes nothing.
class OLVANE_API RefCountedSlabs {
public:
    RefCountedSlabs() = default;
    RefCountedSlabs(const RefCountedSlabs&) = delete;
    RefCountedSlabs& operator=(const RefCountedSlabs&) = delete;
    ~RefCountedSlabs() { releaseCurrentSlab(); }

    void* allocate(std::size_t bytes) {
        const std::size_t size = sizeWithHeader(bytes);
        if (size > left_) return allocateSlow(size);
        return carve(size);
    }
    // A block of its own on the heap, for callers without slabs. It is deallocated like any other.
    static void* allocateSingle(std::size_t bytes);
    static void deallocate(void* block) noexcept {
        Slab* const slab = headerOf(block)->slab;
        if (slab == nullptr) return freeSingle(block);
        subtractLive(slab, 1);
    }

private:
    static constexpr std::size_t kGranule = alignof(std::max_align_t);

    // live counts the blocks that are not deallocated; kOpenSlabBias is added while the slab is being filled.
    struct alignas(kGranule) Slab {
        std::atomic<std::uint32_t> live;
    };
    // Stands before each block.
    struct alignas(kGranule) BlockHeader {
        Slab* slab;  // null for a block of its own
    };

    static std::size_t sizeWithHeader(std::size_t bytes) {
        return sizeof(BlockHeader) + (bytes + kGranule - 1) / kGranule * kGranule;
    }
    static BlockHeader* headerOf(void* block) { return static_cast<BlockHeader*>(block) - 1; }

    void* carve(std::size_t size) {
        BlockHeader* const header = new (place_) BlockHeader{slab_};
        place_ += size;
        left_ -= size;
        ++carved_;
        return header + 1;
    }
    void* allocateSlow(std::size_t size);
    void releaseCurrentSlab() noexcept;
    static void subtractLive(Slab* slab, std::uint32_t blocks) noexcept;
    static void freeSingle(void* block) noexcept;

    Slab* slab_ = nullptr;      // the one that is being filled
    char* place_ = nullptr;     // where its free part begins
    std::size_t left_ = 0;      // length of that part
    std::uint32_t carved_ = 0;  // blocks on it
};

// The allocator of single objects on slabs, which may outlive the slabs object.
template <class T>
class SlabAllocator {
public:
    typedef T value_type;

    explicit SlabAllocator(RefCountedSlabs& slabs) : slabs_(&slabs) {}
    template <class Other>
    SlabAllocator(const SlabAllocator<Other>& other) : slabs_(other.slabs()) {}

    T* allocate(std::size_t count) { return static_cast<T*>(slabs_->allocate(count * sizeof(T))); }
    void deallocate(T* object, std::size_t) noexcept { RefCountedSlabs::deallocate(object); }

    RefCountedSlabs* slabs() const { return slabs_; }

    template <class Other>
    bool operator==(const SlabAllocator<Other>&) const {
        return true;  // any of them deallocates any block
    }

private:
    RefCountedSlabs* slabs_;
};

}  // namespace olvane
