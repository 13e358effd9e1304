// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <type_traits>
#include <utility>
#include <vector>

namespace olvane::kin {

// A stable sort for all lists of the libraries, so that no result depends on the compiler or its library: there is only one
// stable order. The rule is a strict weak order.
//
// In WebAssembly it is compiled once for all types and rules: std::sort is compiled again for each, and those copies were a
// ninth of what a page carries. That one is a merge sort from the bottom up (J. von Neumann, 1945) over runs of a dozen that
// are sorted by insertion; what is in order already is passed over. Elsewhere bytes count less than time.
//
// Takes: n log2 n comparisons, and memory for half of the items, for lists of more than a dozen.
// Fails: std::bad_alloc from detail::mergeSortOnce alone; then the list is as it was.
namespace detail {

// Whether one item goes before another, by the rule that the caller knows.
using IsBefore = bool (*)(const void* rule, const void* one, const void* other);

// Sorts `count` items of `size` bytes each, which may be copied as bytes.
void sortBytes(void* first, std::size_t count, std::size_t size, IsBefore isBefore, const void* rule);

// The places of `count` items of `size` bytes each, in the order that the rule gives them. The items stay.
std::vector<std::size_t> sortedPlaces(const void* first, std::size_t count, std::size_t size,
                                      IsBefore isBefore, const void* rule);

// Moves to each place the item that places names for it, along the cycles of that permutation. Leaves places in order.
template <class Item>
void moveToPlaces(Item* items, std::vector<std::size_t>& places) {
    for (std::size_t begin = 0; begin < places.size(); ++begin) {
        if (places[begin] == begin) continue;
        Item kept = std::move(items[begin]);
        std::size_t to = begin;
        for (std::size_t from = places[to]; from != begin; from = places[to]) {
            items[to] = std::move(items[from]);
            places[to] = to;
            to = from;
        }
        items[to] = std::move(kept);
        places[to] = to;
    }
}

// The sort that is compiled once.
template <class Item, class Rule>
void mergeSortOnce(Item* items, std::size_t count, const Rule& rule) {
    const IsBefore isBefore = [](const void* by, const void* one, const void* other) -> bool {
        return (*static_cast<const Rule*>(by))(*static_cast<const Item*>(one),
                                               *static_cast<const Item*>(other));
    };
    if constexpr (std::is_trivially_copyable_v<Item>) {
        sortBytes(items, count, sizeof(Item), isBefore, &rule);
    } else {
        std::vector<std::size_t> places = sortedPlaces(items, count, sizeof(Item), isBefore, &rule);
        moveToPlaces(items, places);
    }
}

// The one that is compiled for each type. Most lists are short.
template <class Item, class Rule>
void mergeSortTyped(Item* items, std::size_t count, const Rule& rule) {
    constexpr std::size_t kFew = 16;
    if (count > kFew) return std::stable_sort(items, items + count, std::cref(rule));
    for (std::size_t i = 1; i < count; ++i) {
        if (!rule(items[i], items[i - 1])) continue;
        Item item = std::move(items[i]);
        std::size_t to = i;
        do {
            items[to] = std::move(items[to - 1]);
            --to;
        } while (to > 0 && rule(item, items[to - 1]));
        items[to] = std::move(item);
    }
}

}  // namespace detail

// Sorts what lies from first up to last, which lies in one piece, such as a vector's elements.
template <class Iterator, class Rule = std::less<>>
void mergeSort(Iterator first, Iterator last, const Rule& rule = Rule()) {
    if (last - first < 2) return;
#ifdef __EMSCRIPTEN__
    detail::mergeSortOnce(&*first, static_cast<std::size_t>(last - first), rule);
#else
    detail::mergeSortTyped(&*first, static_cast<std::size_t>(last - first), rule);
#endif
}

}  // namespace olvane::kin
