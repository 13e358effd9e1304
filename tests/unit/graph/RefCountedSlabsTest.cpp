// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Blocks on slabs: apart from each other, aligned, and good for as long as somebody holds them.

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <thread>
#include <utility>
#include <vector>

#include <gtest/gtest.h>
#include <boost/make_shared.hpp>
#include <boost/weak_ptr.hpp>

#include <olvane/detail/Arena.h>
#include <olvane/detail/RefCountedSlabs.h>
#include <olvane/graph/TreeViewPerson.h>

namespace {

using olvane::RefCountedSlabs;
using olvane::SlabAllocator;

typedef std::pair<char*, std::size_t> Block;

std::vector<Block> blocksOfEveryLength(RefCountedSlabs& slabs) {
    std::vector<Block> blocks;
    for (std::size_t bytes = 1; bytes < 2000; bytes += 3) {
        blocks.emplace_back(static_cast<char*>(slabs.allocate(bytes)), bytes);
    }
    return blocks;
}

char markOf(std::size_t place) {
    return static_cast<char>(place % 101);
}

void fill(const std::vector<Block>& blocks) {
    for (std::size_t i = 0; i < blocks.size(); ++i) std::memset(blocks[i].first, markOf(i), blocks[i].second);
}

// Those whose bytes are not all as they were filled.
std::size_t disturbed(const std::vector<Block>& blocks) {
    std::size_t count = 0;
    for (std::size_t i = 0; i < blocks.size(); ++i) {
        const std::vector<char> expected(blocks[i].second, markOf(i));
        count += std::memcmp(blocks[i].first, expected.data(), expected.size()) == 0 ? 0 : 1;
    }
    return count;
}

TEST(RefCountedSlabs, noBlockReachesIntoAnother) {
    RefCountedSlabs slabs;
    const std::vector<Block> blocks = blocksOfEveryLength(slabs);
    fill(blocks);
    EXPECT_EQ(disturbed(blocks), 0u);
    for (const Block& block : blocks) RefCountedSlabs::deallocate(block.first);
}

TEST(RefCountedSlabs, everyBlockIsAlignedForEveryFundamentalType) {
    RefCountedSlabs slabs;
    for (const Block& block : blocksOfEveryLength(slabs)) {
        EXPECT_EQ(reinterpret_cast<std::uintptr_t>(block.first) % alignof(std::max_align_t), 0u)
            << block.second;
        RefCountedSlabs::deallocate(block.first);
    }
}

TEST(RefCountedSlabs, blocksStayWhenTheSlabsGo) {
    std::vector<Block> blocks;
    {
        RefCountedSlabs slabs;
        blocks = blocksOfEveryLength(slabs);
        fill(blocks);
    }
    EXPECT_EQ(disturbed(blocks), 0u);
    for (const Block& block : blocks) RefCountedSlabs::deallocate(block.first);
}

TEST(RefCountedSlabs, aSlabThatIsBeingFilledStaysWhenItsBlocksAreDeallocated) {
    RefCountedSlabs slabs;
    for (int i = 0; i < 1000; ++i) {
        void* const block = slabs.allocate(40);
        std::memset(block, 1, 40);
        RefCountedSlabs::deallocate(block);
    }
}

TEST(RefCountedSlabs, blocksAreDeallocatedOnAnyThread) {
    RefCountedSlabs slabs;
    const std::vector<Block> blocks = blocksOfEveryLength(slabs);
    std::vector<std::thread> threads;
    for (std::size_t first = 0; first < 4; ++first) {
        threads.emplace_back([&blocks, first] {
            for (std::size_t i = first; i < blocks.size(); i += 4)
                RefCountedSlabs::deallocate(blocks[i].first);
        });
    }
    for (std::thread& thread : threads) thread.join();
}

TEST(RefCountedSlabs, aBlockOfItsOwnIsDeallocatedLikeTheOthers) {
    char* const block = static_cast<char*>(RefCountedSlabs::allocateSingle(100));
    std::memset(block, 1, 100);
    RefCountedSlabs::deallocate(block);
}

TEST(RefCountedSlabs, anEdgeThatIsHeldOutlivesItsPicture) {
    TreeViewPerson child(5);
    boost::shared_ptr<TreeViewGenerationEdge> held;
    boost::weak_ptr<TreeViewGenerationEdge> watched;
    {
        olvane::Arena arena;
        TreeViewPerson parent(1, &arena);
        const SlabAllocator<TreeViewGenerationEdge> onSlabs(arena.slabs());
        const TreeLine line({TreePoint{1.0f, 2.0f}, TreePoint{3.0f, 4.0f}});
        held = boost::allocate_shared<TreeViewGenerationEdge>(onSlabs, line, &child, &parent);
        watched = held;
        parent.addGenerationEdge(held);
    }
    EXPECT_EQ((TreePoint{3.0f, 4.0f}), held->line().last());
    EXPECT_EQ(&child, held->child);
    held.reset();
    EXPECT_TRUE(watched.expired());
}

TEST(SlabAllocator, anyDeallocatesWhatAnotherAllocated) {
    RefCountedSlabs slabs;
    RefCountedSlabs others;
    EXPECT_TRUE(SlabAllocator<int>(slabs) == SlabAllocator<char>(others));
    SlabAllocator<int> one(slabs);
    SlabAllocator<int> another(others);
    another.deallocate(one.allocate(1), 1);
}

TEST(EdgeOfACouple, liesOnASlabOfTheOwnersArenaOrOnTheHeap) {
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
