// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/shared/MergeSort.h>

#include <algorithm>
#include <array>
#include <cstring>
#include <numeric>

namespace olvane::kin::detail {

namespace {

constexpr std::size_t kRunItems = 12;      // sorted by insertion
constexpr std::size_t kBytesAtHand = 512;  // for short lists, so that they allocate nothing

class BytesSort {
public:
    BytesSort(void* first, std::size_t count, std::size_t size, IsBefore isBefore, const void* rule)
        : items_(static_cast<std::byte*>(first)),
          count_(count),
          size_(size),
          isBefore_(isBefore),
          rule_(rule) {}

    void run() {
        reserveBuffer();
        for (std::size_t begin = 0; begin < count_; begin += kRunItems)
            sortRun(begin, std::min(begin + kRunItems, count_));
        for (std::size_t width = kRunItems; width < count_; width *= 2) {
            for (std::size_t begin = 0; begin + width < count_; begin += 2 * width) {
                merge(begin, begin + width, std::min(begin + 2 * width, count_));
            }
        }
    }

private:
    // One item where runs are sorted alone, else the longest left part of two that are merged.
    void reserveBuffer() {
        std::size_t most = 1;
        for (std::size_t width = kRunItems; width < count_; width *= 2) most = width;
        if (most * size_ <= atHand_.size()) {
            buffer_ = atHand_.data();
            return;
        }
        allocated_.resize(most * size_);
        buffer_ = allocated_.data();
    }

    void sortRun(std::size_t begin, std::size_t end) {
        for (std::size_t i = begin + 1; i < end; ++i) {
            std::byte* const item = at(i);
            if (!goesBefore(item, item - size_)) continue;
            copy(buffer_, item);
            std::byte* to = item - size_;
            while (to != at(begin) && goesBefore(buffer_, to - size_)) to -= size_;
            std::memmove(to + size_, to, static_cast<std::size_t>(item - to));
            copy(to, buffer_);
        }
    }

    // Where two items are equal, that of the left part goes first.
    void merge(std::size_t begin, std::size_t middle, std::size_t end) {
        const std::byte* right = at(middle);
        if (!goesBefore(right, right - size_)) return;
        std::byte* to = at(begin);
        const auto leftBytes = static_cast<std::size_t>(right - to);
        std::memcpy(buffer_, to, leftBytes);
        const std::byte* left = buffer_;
        const std::byte* const leftEnd = buffer_ + leftBytes;
        const std::byte* const rightEnd = items_ + end * size_;
        while (left != leftEnd && right != rightEnd) {
            const std::byte*& next = goesBefore(right, left) ? right : left;
            copy(to, next);
            to += size_;
            next += size_;
        }
        std::memcpy(to, left, static_cast<std::size_t>(leftEnd - left));
    }

    [[nodiscard]] std::byte* at(std::size_t place) const { return items_ + place * size_; }
    [[nodiscard]] bool goesBefore(const std::byte* one, const std::byte* other) const {
        return isBefore_(rule_, one, other);
    }

    // The two usual sizes are copied by one instruction.
    void copy(std::byte* to, const std::byte* from) const {
        if (size_ == 4) {
            std::memcpy(to, from, 4);
        } else if (size_ == 8) {
            std::memcpy(to, from, 8);
        } else {
            std::memcpy(to, from, size_);
        }
    }

    std::byte* items_;
    std::size_t count_;
    std::size_t size_;  // bytes of an item
    IsBefore isBefore_;
    const void* rule_;
    std::byte* buffer_ = nullptr;
    alignas(std::max_align_t) std::array<std::byte, kBytesAtHand> atHand_;
    std::vector<std::byte> allocated_;
};

// Items that are not bytes: their places are sorted, by the items there.
struct Placed {
    const std::byte* items;
    std::size_t size;
    IsBefore isBefore;
    const void* rule;
};

bool isPlaceBefore(const void* placed, const void* one, const void* other) {
    const auto& [items, size, isBefore, rule] = *static_cast<const Placed*>(placed);
    const std::size_t a = *static_cast<const std::size_t*>(one);
    const std::size_t b = *static_cast<const std::size_t*>(other);
    return isBefore(rule, items + a * size, items + b * size);
}

}  // namespace

void sortBytes(void* first, std::size_t count, std::size_t size, IsBefore isBefore, const void* rule) {
    if (count > 1) BytesSort(first, count, size, isBefore, rule).run();
}

std::vector<std::size_t> sortedPlaces(const void* first, std::size_t count, std::size_t size,
                                      IsBefore isBefore, const void* rule) {
    std::vector<std::size_t> places(count);
    std::iota(places.begin(), places.end(), std::size_t{0});
    const Placed placed{static_cast<const std::byte*>(first), size, isBefore, rule};
    sortBytes(places.data(), count, sizeof(std::size_t), isPlaceBefore, &placed);
    return places;
}

}  // namespace olvane::kin::detail
