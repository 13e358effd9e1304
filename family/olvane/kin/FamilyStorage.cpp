// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How texts and lists are stored: in the last block where it has room, else in a new one of twice the size.

#include <olvane/kin/FamilyStorageInternal.h>

#include <algorithm>
#include <new>

namespace olvane::detail {

std::size_t BlobStore::Block::claim(std::size_t count) {
    std::size_t first = used.load(std::memory_order_relaxed);
    do {
        // A block of more than 64 Ki words holds one long text, for a reference cannot say where others begin.
        if (first + count > capacity || first >= kBlockWords) return capacity;
    } while (!used.compare_exchange_weak(first, first + count, std::memory_order_relaxed));
    return first;
}

void BlobStore::addBlock(std::size_t count) {
    if (blocks_.size() >= kBlockWords) throw std::bad_alloc();
    const std::size_t twice = blocks_.empty()
                                  ? kFirstBlockWords
                                  : std::min<std::size_t>(blocks_.back().block->capacity * 2, kBlockWords);
    auto block = std::make_shared<Block>(std::max(twice, count + 1));
    if (blocks_.empty()) block->used = 1;  // a reference of 0 is the empty one
    const std::uint32_t* const words = block->words.get();
    const std::size_t capacity = block->capacity;
    blocks_.push_back({std::move(block), words});
    capacityWords_ += capacity;
}

std::pair<BlobStore::Reference, std::uint32_t*> BlobStore::allocate(std::size_t count) {
    std::size_t first = blocks_.empty() ? 0 : blocks_.back().block->claim(count);
    if (blocks_.empty() || first == blocks_.back().block->capacity) {
        addBlock(count);
        first = blocks_.back().block->claim(count);
    }
    addedWords_ += count;
    const auto block = static_cast<std::uint32_t>(blocks_.size() - 1);
    return {block << 16U | static_cast<std::uint32_t>(first), blocks_.back().block->words.get() + first};
}

BlobStore::Reference BlobStore::add(std::string_view text) {
    if (text.empty()) return 0;
    const auto [reference, words] = allocate(wordsOf(text));
    auto* bytes = reinterpret_cast<unsigned char*>(words);
    if (text.size() < kLong) {
        *bytes++ = static_cast<unsigned char>(text.size());
    } else {
        *bytes++ = static_cast<unsigned char>(kLong);
        const auto length = static_cast<std::uint32_t>(text.size());
        std::memcpy(bytes, &length, sizeof length);
        bytes += sizeof length;
    }
    std::memcpy(bytes, text.data(), text.size());
    return reference;
}

BlobStore::Reference BlobStore::add(std::span<const std::uint32_t> list) {
    if (list.empty()) return 0;
    const auto [reference, words] = allocate(wordsOf(list));
    words[0] = static_cast<std::uint32_t>(list.size());
    std::copy(list.begin(), list.end(), words + 1);
    return reference;
}

}  // namespace olvane::detail
