// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <memory>
#include <new>
#include <type_traits>

#include <olvane/Export.h>
#include <olvane/Trays.h>

namespace olvane {

// Memory for the many small pieces of one picture. It comes from the system in blocks that go back all at
// once, when the arena does; pieces returned before that are handed out again, by size.
//
// Units: bytes. A piece is aligned for every fundamental type.
// Holds: the arena outlives whatever lies in it; no piece is longer than PTRDIFF_MAX, as containers see to.
// Fails: take throws std::bad_alloc and changes nothing.
class OLVANE_API Arena {
public:
    Arena() = default;
    Arena(const Arena&) = delete;
    Arena& operator=(const Arena&) = delete;
    ~Arena();

    void* take(std::size_t bytes) {
        const std::size_t granules = granulesOf(bytes);
        if (granules < kReusedSizes && returned_[granules] != nullptr) {
            Link* const piece = returned_[granules];
            returned_[granules] = piece->next;
            return piece;
        }
        const std::size_t size = granules * kGranule;
        if (size > left_) return takeAnew(bytes);
        char* const piece = place_;
        place_ += size;
        left_ -= size;
        return piece;
    }
    // The size must be the one that was asked for.
    void giveBack(void* piece, std::size_t bytes) noexcept {
        if (blocks_ == nullptr) return freeAlone(piece);
        const std::size_t granules = granulesOf(bytes);
        if (granules < kReusedSizes) returned_[granules] = new (piece) Link{returned_[granules]};
    }

    // For what belongs to the picture and may outlive it.
    Trays& trays() { return trays_; }

private:
    struct Link {
        Link* next;
    };
    static constexpr std::size_t kGranule = 16;
    static constexpr std::size_t kReusedSizes = 64;  // in granules; larger pieces wait for the end

    static std::size_t granulesOf(std::size_t bytes) {
        return bytes == 0 ? 1 : (bytes + kGranule - 1) / kGranule;
    }
    static void freeAlone(void* piece) noexcept;  // where each piece is an allocation of its own
    void* takeAnew(std::size_t bytes);  // where nothing that was returned and no rest of a block serves
    void* cutFromNewBlock(std::size_t size);
    char* addBlock(std::size_t size);

    Link* returned_[kReusedSizes] = {};  // by size in granules
    char* place_ = nullptr;              // where the free rest of the newest block begins
    std::size_t left_ = 0;               // length of that rest
    std::size_t taken_ = 0;              // of all blocks
    Link* blocks_ = nullptr;
    Trays trays_;
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
        return static_cast<T*>(arena_->take(bytesOf(count)));
    }
    void deallocate(T* piece, std::size_t count) noexcept {
        if (arena_ == nullptr) {
            ::operator delete(piece);
        } else {
            arena_->giveBack(piece, bytesOf(count));
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
