// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pieces on trays: apart from each other, aligned, and good for as long as somebody holds them.

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <thread>
#include <utility>
#include <vector>

#include <gtest/gtest.h>
#include <boost/make_shared.hpp>
#include <boost/weak_ptr.hpp>

#include <olvane/Arena.h>
#include <olvane/Trays.h>
#include <olvane/graph/TreeViewPerson.h>

namespace {

using olvane::TrayAllocator;
using olvane::Trays;

typedef std::pair<char*, std::size_t> Piece;

std::vector<Piece> takeOfEveryLength(Trays& trays) {
    std::vector<Piece> pieces;
    for (std::size_t bytes = 1; bytes < 2000; bytes += 3) {
        pieces.emplace_back(static_cast<char*>(trays.take(bytes)), bytes);
    }
    return pieces;
}

char markOf(std::size_t place) {
    return static_cast<char>(place % 101);
}

void fill(const std::vector<Piece>& pieces) {
    for (std::size_t i = 0; i < pieces.size(); ++i) std::memset(pieces[i].first, markOf(i), pieces[i].second);
}

// Those whose bytes are not all as they were filled.
std::size_t disturbed(const std::vector<Piece>& pieces) {
    std::size_t count = 0;
    for (std::size_t i = 0; i < pieces.size(); ++i) {
        const std::vector<char> expected(pieces[i].second, markOf(i));
        count += std::memcmp(pieces[i].first, expected.data(), expected.size()) == 0 ? 0 : 1;
    }
    return count;
}

TEST(Trays, noPieceReachesIntoAnother) {
    Trays trays;
    const std::vector<Piece> pieces = takeOfEveryLength(trays);
    fill(pieces);
    EXPECT_EQ(disturbed(pieces), 0u);
    for (const Piece& piece : pieces) Trays::giveBack(piece.first);
}

TEST(Trays, everyPieceIsAlignedForEveryFundamentalType) {
    Trays trays;
    for (const Piece& piece : takeOfEveryLength(trays)) {
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(piece.first) % alignof(std::max_align_t), 0u)
            << piece.second;
        Trays::giveBack(piece.first);
    }
}

TEST(Trays, piecesStayWhenTheTraysGo) {
    std::vector<Piece> pieces;
    {
        Trays trays;
        pieces = takeOfEveryLength(trays);
        fill(pieces);
    }
    EXPECT_EQ(disturbed(pieces), 0u);
    for (const Piece& piece : pieces) Trays::giveBack(piece.first);
}

TEST(Trays, aTrayThatIsBeingFilledStaysWhenItsPiecesComeBack) {
    Trays trays;
    for (int i = 0; i < 1000; ++i) {
        void* const piece = trays.take(40);
        std::memset(piece, 1, 40);
        Trays::giveBack(piece);
    }
}

TEST(Trays, piecesComeBackOnAnyThread) {
    Trays trays;
    const std::vector<Piece> pieces = takeOfEveryLength(trays);
    std::vector<std::thread> threads;
    for (std::size_t first = 0; first < 4; ++first) {
        threads.emplace_back([&pieces, first] {
            for (std::size_t i = first; i < pieces.size(); i += 4) Trays::giveBack(pieces[i].first);
        });
    }
    for (std::thread& thread : threads) thread.join();
}

TEST(Trays, aPieceOfItsOwnGoesBackLikeTheOthers) {
    char* const piece = static_cast<char*>(Trays::takeAlone(100));
    std::memset(piece, 1, 100);
    Trays::giveBack(piece);
}

TEST(Trays, anEdgeThatIsHeldOutlivesItsPicture) {
    TreeViewPerson child(5);
    boost::shared_ptr<TreeViewGenerationEdge> held;
    boost::weak_ptr<TreeViewGenerationEdge> watched;
    {
        olvane::Arena arena;
        TreeViewPerson parent(1, &arena);
        const TrayAllocator<TreeViewGenerationEdge> onTrays(arena.trays());
        const TreeLine line({TreePoint{1.0f, 2.0f}, TreePoint{3.0f, 4.0f}});
        held = boost::allocate_shared<TreeViewGenerationEdge>(onTrays, line, &child, &parent);
        watched = held;
        parent.addGenerationEdge(held);
    }
    EXPECT_EQ((TreePoint{3.0f, 4.0f}), held->line().last());
    EXPECT_EQ(&child, held->child);
    held.reset();
    EXPECT_TRUE(watched.expired());
}

TEST(TrayAllocator, anyTakesBackWhatAnotherMade) {
    Trays trays;
    Trays others;
    EXPECT_TRUE(TrayAllocator<int>(trays) == TrayAllocator<char>(others));
    TrayAllocator<int> one(trays);
    TrayAllocator<int> another(others);
    another.deallocate(one.allocate(1), 1);
}

TEST(EdgeOfACouple, liesOnATrayOfTheOwnersArenaOrByItself) {
    olvane::Arena arena;
    TreeViewPerson man(1, &arena);
    TreeViewPerson woman(2, &arena);
    man.setGender(true);
    EXPECT_EQ(&man, man.spouseEdge(&woman, TreeLine())->person);
    alignas(TreeViewSpouseEdge) unsigned char place[sizeof(TreeViewSpouseEdge)];
    TreeViewSpouseEdge* const edge = new (place) TreeViewSpouseEdge(&man, &woman);
    EXPECT_EQ(static_cast<void*>(place), edge);
    edge->~TreeViewSpouseEdge();
    delete new TreeViewSpouseEdge(&man, &woman);
}

}  // namespace
