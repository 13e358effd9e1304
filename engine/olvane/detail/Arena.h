// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <memory>
#include <new>
#include <type_traits>

#include <olvane/Export.h>
#include <olvane/detail/RefCountedSlabs.h>

namespace olvane {

// Memory for the many small blocks of one picture. It comes from the system in chunks that are released together, with the
// arena; a block that is deallocated before that goes to the free list of its size.
//
// Units: bytes. A block is aligned for every fundamental type.
// Holds: the arena outlives whatever lies in it; no block is longer than PTRDIFF_MAX, as containers see to.
// Fails: allocate throws std::bad_alloc and changes nothing.
class OLVANE_API Arena {
public:
    Arena() = default;
    Arena(const Arena&) = delete;
    Arena& operator=(const Arena&) = delete;
    ~Arena();

    void* allocate(std::size_t bytes) {
        const std::size_t granules = granulesOf(bytes);
        if (granules < kReusedSizes && freeLists_[granules] != nullptr) {
            Link* const block = freeLists_[granules];
            freeLists_[granules] = block->next;
            return block;
        }
        const std::size_t size = granules * kGranule;
        if (size > left_) return allocateSlow(bytes);
        char* const block = place_;
        place_ += size;
        left_ -= size;
        return block;
    }
    // The size must be the one that was asked for.
    void deallocate(void* block, std::size_t bytes) noexcept {
        if (chunks_ == nullptr) return freeSingle(block);
        const std::size_t granules = granulesOf(bytes);
        if (granules < kReusedSizes) freeLists_[granules] = new (block) Link{freeLists_[granules]};
    }

    // For objects that belong to the picture and may outlive it.
    RefCountedSlabs& slabs() { return slabs_; }

private:
    struct Link {
        Link* next;
    };
    static constexpr std::size_t kGranule = 16;
    static constexpr std::size_t kReusedSizes = 64;  // in granules; larger blocks wait for the end

    static std::size_t granulesOf(std::size_t bytes) {
        return bytes == 0 ? 1 : (bytes + kGranule - 1) / kGranule;
    }
    static void freeSingle(void* block) noexcept;  // where pooling is disabled
    void* allocateSlow(std::size_t bytes);         // where no free list and no rest of a chunk serves
    void* carveFromNewChunk(std::size_t size);
    char* addChunk(std::size_t size);

    Link* freeLists_[kReusedSizes] = {};  // by size in granules
    char* place_ = nullptr;               // where the free rest of the newest chunk begins
    std::size_t left_ = 0;                // length of that rest
    std::size_t reserved_ = 0;            // of all chunks
    Link* chunks_ = nullptr;
    RefCountedSlabs slabs_;
};

// The allocator of containers in an arena; without one it is the heap.
//
// A copy of a container lies on the heap and stands alone. A container that is moved stays where it is, so it
// must not outlive the arena.
template <class T>
class ArenaAllocator {
public:
    typedef T value_type;
    typedef std::true_type propagate_on_container_move_assignment;
    typedef std::true_type propagate_on_container_swap;

    ArenaAllocator() = default;
    ArenaAllocator(Arena* arena) : arena_(arena) {}
    template <class Other>
    ArenaAllocator(const ArenaAllocator<Other>& other) : arena_(other.arena()) {}

    T* allocate(std::size_t count) {
        if (arena_ == nullptr) return static_cast<T*>(::operator new(bytesOf(count)));
        return static_cast<T*>(arena_->allocate(bytesOf(count)));
    }
    void deallocate(T* block, std::size_t count) noexcept {
        if (arena_ == nullptr) {
            ::operator delete(block);
        } else {
            arena_->deallocate(block, bytesOf(count));
        }
    }
    // The elements of a container are of its very type, so their destructor is called without a look at theirs.
    template <class Object>
    void destroy(Object* object) noexcept {
        if constexpr (std::is_class_v<Object>) {
            object->Object::~Object();
        } else {
            std::destroy_at(object);
        }
    }
    ArenaAllocator select_on_container_copy_construction() const { return ArenaAllocator(); }

    Arena* arena() const { return arena_; }

    template <class Other>
    bool operator==(const ArenaAllocator<Other>& other) const {
        return arena_ == other.arena();
    }

private:
    // Lists of pointers lie in arenas too. NOLINTNEXTLINE(bugprone-sizeof-expression)
    static constexpr std::size_t bytesOf(std::size_t count) { return count * sizeof(T); }

    Arena* arena_ = nullptr;
};

}  // namespace olvane
