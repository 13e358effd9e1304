// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Blocks of an arena: apart from each other, aligned, and handed out again by size.

#include <gtest/gtest.h>
#include <olvane/detail/Arena.h>

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <utility>
#include <vector>

namespace {

using olvane::Arena;
using olvane::ArenaAllocator;

// Under the address sanitizer every block is an allocation of its own, and none is handed out again.
#if defined(__SANITIZE_ADDRESS__)
constexpr bool kPoolingDisabled = true;
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
constexpr bool kPoolingDisabled = true;
#else
constexpr bool kPoolingDisabled = false;
#endif
#else
constexpr bool kPoolingDisabled = false;
#endif

// Blocks of an arena that go back to it, as containers do it.
class Blocks {
public:
    explicit Blocks(Arena& arena) : arena_(arena) {}
    Blocks(const Blocks&) = delete;
    Blocks& operator=(const Blocks&) = delete;
    ~Blocks() {
        for (const auto& [block, bytes] : blocks_) arena_.deallocate(block, bytes);
    }

    char* allocate(std::size_t bytes) {
        char* const block = static_cast<char*>(arena_.allocate(bytes));
        blocks_.emplace_back(block, bytes);
        return block;
    }

    void fill() {
        for (std::size_t i = 0; i < blocks_.size(); ++i) {
            std::memset(blocks_[i].first, static_cast<int>(i % 251), blocks_[i].second);
        }
    }

    // Those whose bytes are not all as they were filled.
    std::size_t disturbed() const {
        std::size_t count = 0;
        for (std::size_t i = 0; i < blocks_.size(); ++i) {
            const std::vector<char> expected(blocks_[i].second, static_cast<char>(i % 251));
            count += std::memcmp(blocks_[i].first, expected.data(), expected.size()) == 0 ? 0 : 1;
        }
        return count;
    }

private:
    Arena& arena_;
    std::vector<std::pair<char*, std::size_t>> blocks_;
};

TEST(Arena, noBlockReachesIntoAnother) {
    Arena arena;
    Blocks blocks(arena);
    for (std::size_t bytes = 1; bytes < 3000; bytes += 7) blocks.allocate(bytes);
    for (const std::size_t bytes : {4079U, 4080U, 4081U, 8175U, 8176U, 8177U, 70000U, 1U, 200000U})
        blocks.allocate(bytes);
    blocks.fill();
    EXPECT_EQ(blocks.disturbed(), 0u);
}

TEST(Arena, noBlockReachesIntoAnotherThatIsHandedOutAgain) {
    Arena arena;
    {
        Blocks first(arena);
        for (std::size_t bytes = 0; bytes < 1100; ++bytes) first.allocate(bytes);
    }
    Blocks blocks(arena);
    for (std::size_t bytes = 1100; bytes-- > 1;) blocks.allocate(bytes);
    for (std::size_t bytes = 1; bytes < 1100; ++bytes) blocks.allocate(bytes);
    blocks.fill();
    EXPECT_EQ(blocks.disturbed(), 0u);
}

TEST(Arena, everyBlockIsAlignedForEveryFundamentalType) {
    Arena arena;
    Blocks blocks(arena);
    for (std::size_t bytes = 0; bytes < 100; ++bytes) {
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(blocks.allocate(bytes)) % alignof(std::max_align_t), 0u)
            << bytes;
    }
}

TEST(Arena, twoPiecesOfNothingAreTwoBlocks) {
    Arena arena;
    Blocks blocks(arena);
    const char* const first = blocks.allocate(0);
    const char* const second = blocks.allocate(0);
    EXPECT_NE(first, second);
}

TEST(Arena, handsABlockOutAgainForWhatNeedsAsMuch) {
    if (kPoolingDisabled) GTEST_SKIP() << "every block is an allocation of its own";
    Arena arena;
    void* const large = arena.allocate(48);
    void* const small = arena.allocate(32);
    arena.deallocate(large, 48);
    arena.deallocate(small, 32);
    EXPECT_NE(arena.allocate(49), large);
    EXPECT_EQ(arena.allocate(33), large);
    EXPECT_EQ(arena.allocate(17), small);
    EXPECT_NE(arena.allocate(33), large);
}

TEST(Arena, handsTheLastBlockThatCameBackOutFirst) {
    if (kPoolingDisabled) GTEST_SKIP() << "every block is an allocation of its own";
    Arena arena;
    void* const first = arena.allocate(64);
    void* const second = arena.allocate(64);
    arena.deallocate(first, 64);
    arena.deallocate(second, 64);
    EXPECT_EQ(arena.allocate(64), second);
    EXPECT_EQ(arena.allocate(64), first);
}

TEST(Arena, longBlocksAreNotHandedOutAgain) {
    if (kPoolingDisabled) GTEST_SKIP() << "every block is an allocation of its own";
    Arena arena;
    void* const longest = arena.allocate(1008);
    void* const tooLong = arena.allocate(1009);
    arena.deallocate(longest, 1008);
    arena.deallocate(tooLong, 1009);
    EXPECT_EQ(arena.allocate(1008), longest);
    EXPECT_NE(arena.allocate(1009), tooLong);
}

TEST(Arena, aVeryLongBlockLeavesTheRestOfTheChunkInUse) {
    if (kPoolingDisabled) GTEST_SKIP() << "every block is an allocation of its own";
    Arena arena;
    char* const first = static_cast<char*>(arena.allocate(16));
    arena.allocate(100000);
    EXPECT_EQ(static_cast<char*>(arena.allocate(16)), first + 16);
}

TEST(ArenaAllocator, aContainerLiesInTheArenaAndItsCopyOnTheHeap) {
    Arena arena;
    std::vector<int, ArenaAllocator<int>> numbers({1, 2, 3}, ArenaAllocator<int>(&arena));
    const std::vector<int, ArenaAllocator<int>> copy = numbers;
    EXPECT_EQ(numbers.get_allocator().arena(), &arena);
    EXPECT_EQ(copy.get_allocator().arena(), nullptr);
    EXPECT_EQ(copy, (std::vector<int, ArenaAllocator<int>>{1, 2, 3}));
}

TEST(ArenaAllocator, aContainerThatIsMovedStaysWhereItIs) {
    Arena arena;
    std::vector<int, ArenaAllocator<int>> numbers({1, 2, 3}, ArenaAllocator<int>(&arena));
    const int* const place = numbers.data();
    std::vector<int, ArenaAllocator<int>> moved;
    moved = std::move(numbers);
    EXPECT_EQ(moved.data(), place);
    EXPECT_EQ(moved.get_allocator().arena(), &arena);
}

TEST(ArenaAllocator, twoAreEqualThatShareAnArena) {
    Arena arena;
    Arena other;
    EXPECT_TRUE(ArenaAllocator<int>(&arena) == ArenaAllocator<char>(&arena));
    EXPECT_FALSE(ArenaAllocator<int>(&arena) == ArenaAllocator<int>(&other));
    EXPECT_TRUE(ArenaAllocator<int>() == ArenaAllocator<int>());
}

}  // namespace
