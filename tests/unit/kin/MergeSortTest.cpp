// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/kin/shared/MergeSort.h>

#include <algorithm>
#include <array>
#include <cstdint>
#include <functional>
#include <memory>
#include <random>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace {

using olvane::kin::mergeSort;

// The sort of WebAssembly, on this machine.
template <class List, class Rule = std::less<>>
void sortOnce(List& list, const Rule& rule = Rule()) {
    olvane::kin::detail::mergeSortOnce(list.data(), list.size(), rule);
}

// An item of a size, and where it stood.
template <std::size_t Size>
struct Numbered {
    std::uint8_t key;
    std::array<std::uint8_t, Size> between;
    std::uint16_t number;
    bool operator==(const Numbered&) const = default;
};

constexpr auto byKey = [](const auto& one, const auto& other) { return one.key < other.key; };

// Lists of every length up to two merges of merges, with few and with many keys.
template <class Visit>
void forEveryList(Visit visit) {
    std::mt19937 random(7);
    for (std::size_t count = 0; count <= 130; ++count) {
        for (const unsigned keys : {1U, 3U, 250U}) {
            std::vector<std::uint8_t> list(count);
            for (std::uint8_t& key : list) key = static_cast<std::uint8_t>(random() % keys);
            visit(list);
        }
    }
}

template <std::size_t Size>
void expectStable() {
    forEveryList([](const std::vector<std::uint8_t>& keys) {
        std::vector<Numbered<Size>> list;
        list.reserve(keys.size());
        for (const std::uint8_t key : keys)
            list.push_back({key, {}, static_cast<std::uint16_t>(list.size())});
        std::vector<Numbered<Size>> expected = list;
        std::stable_sort(expected.begin(), expected.end(), byKey);
        std::vector<Numbered<Size>> once = list;
        sortOnce(once, byKey);
        mergeSort(list.begin(), list.end(), byKey);
        ASSERT_EQ(once, expected) << keys.size() << " items of " << sizeof(Numbered<Size>) << " bytes";
        ASSERT_EQ(list, expected) << keys.size() << " items of " << sizeof(Numbered<Size>) << " bytes";
    });
}

TEST(MergeSort, keepsTheOrderOfEqualItemsOfAnySize) {
    expectStable<1>();
    expectStable<5>();
    expectStable<9>();
    expectStable<60>();
    expectStable<600>();
}

TEST(MergeSort, sortsTextsAsTheStandardLibraryDoes) {
    forEveryList([](const std::vector<std::uint8_t>& keys) {
        std::vector<std::string> list;
        list.reserve(keys.size());
        for (const std::uint8_t key : keys) list.push_back(std::string(key % 40U, 'a') + std::to_string(key));
        std::vector<std::string> expected = list;
        std::sort(expected.begin(), expected.end());
        std::vector<std::string> once = list;
        sortOnce(once);
        mergeSort(list.begin(), list.end());
        ASSERT_EQ(once, expected);
        ASSERT_EQ(list, expected);
    });
}

TEST(MergeSort, movesWhatCannotBeCopied) {
    forEveryList([](const std::vector<std::uint8_t>& keys) {
        std::vector<std::unique_ptr<int>> list;
        list.reserve(keys.size());
        for (const std::uint8_t key : keys) list.push_back(std::make_unique<int>(key));
        sortOnce(list, [](const auto& one, const auto& other) { return *one > *other; });
        for (std::size_t i = 1; i < list.size(); ++i) ASSERT_GE(*list[i - 1], *list[i]);
        mergeSort(list.begin(), list.end(), [](const auto& one, const auto& other) { return *one < *other; });
        for (std::size_t i = 1; i < list.size(); ++i) ASSERT_LE(*list[i - 1], *list[i]);
    });
}

TEST(MergeSort, sortsALongListInEachOrder) {
    std::vector<std::uint32_t> list(100000);
    std::mt19937 random(11);
    for (std::uint32_t& number : list) number = static_cast<std::uint32_t>(random());
    std::vector<std::uint32_t> expected = list;
    std::sort(expected.begin(), expected.end());
    sortOnce(list);
    EXPECT_EQ(list, expected);
    std::reverse(list.begin(), list.end());
    mergeSort(list.begin(), list.end());
    EXPECT_EQ(list, expected);
}

TEST(MergeSort, comparesAListInOrderOnceAPair) {
    std::vector<int> list(1000);
    for (int i = 0; i < 1000; ++i) list[static_cast<std::size_t>(i)] = i / 2;
    int comparisons = 0;
    sortOnce(list, [&comparisons](int one, int other) {
        ++comparisons;
        return one < other;
    });
    EXPECT_EQ(comparisons, 999);
}

TEST(MergeSort, sortsPartOfAList) {
    std::array<int, 6> list{9, 3, 2, 1, 8, 0};
    mergeSort(list.begin() + 1, list.begin() + 4);
    EXPECT_EQ(list, (std::array<int, 6>{9, 1, 2, 3, 8, 0}));
}

}  // namespace
