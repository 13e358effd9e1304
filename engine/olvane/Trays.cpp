// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Trays and what is counted on them. A tray that is being filled counts as if no end of pieces were still to
// come, so that it stands while those on it come and go, and putting one there needs no look at the count. When
// it is full, those that did not come are taken off at once.

#include <olvane/Trays.h>

#include <limits>
#include <new>

#include <olvane/EachPieceAloneInternal.h>

namespace olvane {

namespace {

constexpr std::size_t kTraySize = std::size_t{1} << 10;
constexpr std::uint32_t kYetToCome = std::numeric_limits<std::uint32_t>::max();

}  // namespace

void* Trays::takeAnew(std::size_t size) {
    const std::size_t room = kTraySize - sizeof(Tray);
    if (kEachPieceAlone || size > room) return takeAlone(size - sizeof(Label));
    Tray* const fresh = new (::operator new(kTraySize)) Tray{kYetToCome};
    letGoOfTray();
    tray_ = fresh;
    place_ = reinterpret_cast<char*>(fresh + 1);
    left_ = room;
    return cut(size);
}

void* Trays::takeAlone(std::size_t bytes) {
    return new (::operator new(sizeWithLabel(bytes))) Label{nullptr} + 1;
}

void Trays::freeAlone(void* piece) noexcept {
    ::operator delete(labelOf(piece));
}

void Trays::letGoOfTray() noexcept {
    if (tray_ == nullptr) return;
    takeFromCount(tray_, kYetToCome - cut_);
    tray_ = nullptr;
    left_ = 0;
    cut_ = 0;
}

void Trays::takeFromCount(Tray* tray, std::uint32_t pieces) noexcept {
    if (tray->outstanding.fetch_sub(pieces, std::memory_order_acq_rel) == pieces) ::operator delete(tray);
}

}  // namespace olvane
