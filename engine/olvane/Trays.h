// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <atomic>
#include <cstddef>
#include <cstdint>
#include <new>

#include <olvane/Export.h>

namespace olvane {

// Memory for pieces that may outlive a picture, as an edge does that a host goes on holding by a shared pointer.
// Pieces lie side by side on trays, and a tray goes back to the system with the last piece on it.
//
// Units: bytes. A piece is aligned for every fundamental type.
// Holds: pieces may come back in any order, on any thread, and after the trays have gone.
// Fails: take throws std::bad_alloc and changes nothing.
class OLVANE_API Trays {
public:
    Trays() = default;
    Trays(const Trays&) = delete;
    Trays& operator=(const Trays&) = delete;
    ~Trays() { letGoOfTray(); }

    void* take(std::size_t bytes) {
        const std::size_t size = sizeWithLabel(bytes);
        if (size > left_) return takeAnew(size);
        return cut(size);
    }
    // A piece of its own on the heap, for those who have no trays. It goes back like the others.
    static void* takeAlone(std::size_t bytes);
    static void giveBack(void* piece) noexcept {
        Tray* const tray = labelOf(piece)->tray;
        if (tray == nullptr) return freeAlone(piece);
        takeFromCount(tray, 1);
    }

private:
    static constexpr std::size_t kGranule = alignof(std::max_align_t);

    // Counts the pieces that have not come back, and as long as the tray is filled, those yet to come.
    struct alignas(kGranule) Tray {
        std::atomic<std::uint32_t> outstanding;
    };
    // Stands before each piece.
    struct alignas(kGranule) Label {
        Tray* tray;  // null for a piece of its own
    };

    static std::size_t sizeWithLabel(std::size_t bytes) {
        return sizeof(Label) + (bytes + kGranule - 1) / kGranule * kGranule;
    }
    static Label* labelOf(void* piece) { return static_cast<Label*>(piece) - 1; }

    void* cut(std::size_t size) {
        Label* const label = new (place_) Label{tray_};
        place_ += size;
        left_ -= size;
        ++cut_;
        return label + 1;
    }
    void* takeAnew(std::size_t size);
    void letGoOfTray() noexcept;
    static void takeFromCount(Tray* tray, std::uint32_t pieces) noexcept;
    static void freeAlone(void* piece) noexcept;

    Tray* tray_ = nullptr;   // the one that is being filled
    char* place_ = nullptr;  // where its free rest begins
    std::size_t left_ = 0;   // length of that rest
    std::uint32_t cut_ = 0;  // pieces on it
};

// The allocator of what lies on trays. It is asked for single objects, and what it made may outlive the trays.
template <class T>
class TrayAllocator {
public:
    typedef T value_type;

    explicit TrayAllocator(Trays& trays) : trays_(&trays) {}
    template <class Other>
    TrayAllocator(const TrayAllocator<Other>& other) : trays_(other.trays()) {}

    T* allocate(std::size_t count) { return static_cast<T*>(trays_->take(count * sizeof(T))); }
    void deallocate(T* piece, std::size_t) noexcept { Trays::giveBack(piece); }

    Trays* trays() const { return trays_; }

    template <class Other>
    bool operator==(const TrayAllocator<Other>&) const {
        return true;  // any of them takes any piece back
    }

private:
    Trays* trays_;
};

}  // namespace olvane
