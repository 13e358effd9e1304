// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pieces of an arena: apart from each other, aligned, and handed out again by size.

#include <gtest/gtest.h>
#include <olvane/Arena.h>

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <utility>
#include <vector>

namespace {

using olvane::Arena;
using olvane::ArenaAllocator;

// Under the address sanitizer every piece is an allocation of its own, and none is handed out again.
#if defined(__SANITIZE_ADDRESS__)
constexpr bool kEachPieceAlone = true;
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
constexpr bool kEachPieceAlone = true;
#else
constexpr bool kEachPieceAlone = false;
#endif
#else
constexpr bool kEachPieceAlone = false;
#endif

// Pieces of an arena that go back to it, as containers do it.
class Pieces {
public:
    explicit Pieces(Arena& arena) : arena_(arena) {}
    Pieces(const Pieces&) = delete;
    Pieces& operator=(const Pieces&) = delete;
    ~Pieces() {
        for (const auto& [piece, bytes] : pieces_) arena_.giveBack(piece, bytes);
    }

    char* take(std::size_t bytes) {
        char* const piece = static_cast<char*>(arena_.take(bytes));
        pieces_.emplace_back(piece, bytes);
        return piece;
    }

    void fill() {
        for (std::size_t i = 0; i < pieces_.size(); ++i) {
            std::memset(pieces_[i].first, static_cast<int>(i % 251), pieces_[i].second);
        }
    }

    // Those whose bytes are not all as they were filled.
    std::size_t disturbed() const {
        std::size_t count = 0;
        for (std::size_t i = 0; i < pieces_.size(); ++i) {
            const std::vector<char> expected(pieces_[i].second, static_cast<char>(i % 251));
            count += std::memcmp(pieces_[i].first, expected.data(), expected.size()) == 0 ? 0 : 1;
        }
        return count;
    }

private:
    Arena& arena_;
    std::vector<std::pair<char*, std::size_t>> pieces_;
};

TEST(Arena, noPieceReachesIntoAnother) {
    Arena arena;
    Pieces pieces(arena);
    for (std::size_t bytes = 1; bytes < 3000; bytes += 7) pieces.take(bytes);
    for (const std::size_t bytes : {4079U, 4080U, 4081U, 8175U, 8176U, 8177U, 70000U, 1U, 200000U})
        pieces.take(bytes);
    pieces.fill();
    EXPECT_EQ(pieces.disturbed(), 0u);
}

TEST(Arena, noPieceReachesIntoAnotherThatIsHandedOutAgain) {
    Arena arena;
    {
        Pieces first(arena);
        for (std::size_t bytes = 0; bytes < 1100; ++bytes) first.take(bytes);
    }
    Pieces pieces(arena);
    for (std::size_t bytes = 1100; bytes-- > 1;) pieces.take(bytes);
    for (std::size_t bytes = 1; bytes < 1100; ++bytes) pieces.take(bytes);
    pieces.fill();
    EXPECT_EQ(pieces.disturbed(), 0u);
}

TEST(Arena, everyPieceIsAlignedForEveryFundamentalType) {
    Arena arena;
    Pieces pieces(arena);
    for (std::size_t bytes = 0; bytes < 100; ++bytes) {
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(pieces.take(bytes)) % alignof(std::max_align_t), 0u)
            << bytes;
    }
}

TEST(Arena, twoPiecesOfNothingAreTwoPieces) {
    Arena arena;
    Pieces pieces(arena);
    const char* const first = pieces.take(0);
    const char* const second = pieces.take(0);
    EXPECT_NE(first, second);
}

TEST(Arena, handsAPieceOutAgainForWhatNeedsAsMuch) {
    if (kEachPieceAlone) GTEST_SKIP() << "every piece is an allocation of its own";
    Arena arena;
    void* const large = arena.take(48);
    void* const small = arena.take(32);
    arena.giveBack(large, 48);
    arena.giveBack(small, 32);
    EXPECT_NE(arena.take(49), large);
    EXPECT_EQ(arena.take(33), large);
    EXPECT_EQ(arena.take(17), small);
    EXPECT_NE(arena.take(33), large);
}

TEST(Arena, handsTheLastPieceThatCameBackOutFirst) {
    if (kEachPieceAlone) GTEST_SKIP() << "every piece is an allocation of its own";
    Arena arena;
    void* const first = arena.take(64);
    void* const second = arena.take(64);
    arena.giveBack(first, 64);
    arena.giveBack(second, 64);
    EXPECT_EQ(arena.take(64), second);
    EXPECT_EQ(arena.take(64), first);
}

TEST(Arena, longPiecesAreNotHandedOutAgain) {
    if (kEachPieceAlone) GTEST_SKIP() << "every piece is an allocation of its own";
    Arena arena;
    void* const longest = arena.take(1008);
    void* const tooLong = arena.take(1009);
    arena.giveBack(longest, 1008);
    arena.giveBack(tooLong, 1009);
    EXPECT_EQ(arena.take(1008), longest);
    EXPECT_NE(arena.take(1009), tooLong);
}

TEST(Arena, aVeryLongPieceLeavesTheRestOfTheBlockInUse) {
    if (kEachPieceAlone) GTEST_SKIP() << "every piece is an allocation of its own";
    Arena arena;
    char* const first = static_cast<char*>(arena.take(16));
    arena.take(100000);
    EXPECT_EQ(static_cast<char*>(arena.take(16)), first + 16);
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
