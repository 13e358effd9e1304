// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// What a table of a family lies in: rows and texts in chunks that copies of the table share, and an index from
// ids to rows. A chunk is copied when somebody changes it whom others share it with (copy on write).

#include <array>
#include <atomic>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <memory>
#include <span>
#include <string_view>
#include <utility>
#include <vector>

namespace olvane::detail {

// A value with a count of its owners.
//
// Threads: the count is read with acquire, so the only owner left sees all reads of those who let
//          go as past. std::shared_ptr::use_count does not promise that.
template <class Value>
class CowPointer {
public:
    CowPointer() : node_(new Node) {}
    CowPointer(const CowPointer& other) noexcept : node_(other.node_) {
        node_->owners.fetch_add(1, std::memory_order_relaxed);
    }
    CowPointer(CowPointer&& other) noexcept : node_(std::exchange(other.node_, nullptr)) {}
    CowPointer& operator=(CowPointer other) noexcept {
        std::swap(node_, other.node_);
        return *this;
    }
    ~CowPointer() {
        if (node_ != nullptr && node_->owners.fetch_sub(1, std::memory_order_acq_rel) == 1) delete node_;
    }

    const Value& operator*() const { return node_->value; }
    // A value that nobody else has.
    Value& own() {
        if (node_->owners.load(std::memory_order_acquire) != 1) *this = CowPointer(node_->value);
        return node_->value;
    }

private:
    struct Node {
        std::atomic<std::uint32_t> owners{1};
        Value value{};
    };

    explicit CowPointer(const Value& value) : node_(new Node) { node_->value = value; }

    Node* node_;
};

// Rows in chunks.
template <class Row>
class Rows {
public:
    std::size_t size() const { return size_; }
    const Row& operator[](std::size_t row) const { return (*chunks_[row / kChunk])[row % kChunk]; }
    // For changing; the reference lives until another row is asked for changing.
    Row& edit(std::size_t row) { return chunks_[row / kChunk].own()[row % kChunk]; }
    // Makes room for one more row, so that add cannot fail.
    void prepareToAdd() {
        if (size_ == chunks_.size() * kChunk) {
            chunks_.emplace_back();
        } else {
            edit(size_);
        }
    }
    void add(const Row& row) {
        prepareToAdd();
        edit(size_) = row;
        ++size_;
    }
    void resize(std::size_t size) {
        while (chunks_.size() * kChunk < size) chunks_.emplace_back();
        size_ = size;
    }
    std::size_t memoryBytes() const {
        return chunks_.size() * (kChunk * sizeof(Row) + sizeof(CowPointer<Row>) + sizeof(std::uint64_t));
    }

private:
    static constexpr std::size_t kChunk = 128;

    std::vector<CowPointer<std::array<Row, kChunk>>> chunks_;
    std::size_t size_ = 0;
};

// Where each id's row is. As long as ids count 1, 2, 3 with the rows, nothing is stored; else they lie in a hash
// table with open addressing (D. E. Knuth, The Art of Computer Programming 3, 6.4, algorithm L).
class IdIndex {
public:
    static constexpr std::uint32_t kNoRow = 0xFFFFFFFF;

    // A row that may have that id; kNoRow where none has. The caller looks whether the row has it.
    std::uint32_t rowOf(std::int64_t id) const {
        if (isPlain_) {
            return id >= 1 && static_cast<std::uint64_t>(id) <= count_ ? static_cast<std::uint32_t>(id - 1)
                                                                       : kNoRow;
        }
        if (id < 1 || id > 0x7FFFFFFF) return kNoRow;
        const Slot& slot = slots_[place(static_cast<std::uint32_t>(id))];
        return slot.id == 0 ? kNoRow : slot.row;
    }

    // Makes room for one more, so that add cannot fail. The rows count from 0 without a gap.
    void prepareToAdd(std::uint32_t id) {
        if (isPlain_ && id == count_ + 1) return;
        if (isPlain_) {
            leavePlain();
        } else if ((used_ + 1) * 4 > slots_.size() * 3) {
            grow();
        }
        slots_.edit(place(id));
    }
    void add(std::uint32_t id) {
        prepareToAdd(id);
        if (!isPlain_) {
            slots_.edit(place(id)) = {id, count_};
            ++used_;
        }
        ++count_;
    }
    // The row stays counted, and is found no more.
    void prepareToRemove(std::uint32_t id) {
        if (!isPlain_) slots_.edit(place(id));
    }
    void remove(std::uint32_t id) {
        // The id stays in its slot, so that those behind it are found; its row has no id.
        if (!isPlain_) slots_.edit(place(id)).row = kNoRow;
    }

    std::size_t memoryBytes() const { return slots_.memoryBytes(); }

private:
    struct Slot {
        std::uint32_t id = 0;
        std::uint32_t row = 0;
    };
    static constexpr std::size_t kFirstSlots = 64;

    std::size_t place(std::uint32_t id) const {
        const std::size_t mask = slots_.size() - 1;
        std::size_t at = static_cast<std::size_t>((id * std::uint64_t{0x9E3779B97F4A7C15}) >> 32) & mask;
        while (slots_[at].id != 0 && slots_[at].id != id) at = (at + 1) & mask;
        return at;
    }

    void leavePlain() {
        IdIndex other;
        std::size_t size = kFirstSlots;
        while ((count_ + 1) * std::size_t{4} > size * 3) size *= 2;
        other.slots_.resize(size);
        for (std::uint32_t row = 0; row < count_; ++row)
            other.slots_.edit(other.place(row + 1)) = {row + 1, row};
        other.isPlain_ = false;
        other.count_ = count_;
        other.used_ = count_;
        *this = std::move(other);
    }

    void grow() {
        Rows<Slot> larger;
        larger.resize(slots_.size() * 2);
        std::swap(larger, slots_);
        for (std::size_t i = 0; i < larger.size(); ++i) {
            if (larger[i].id != 0) slots_.edit(place(larger[i].id)) = larger[i];
        }
    }

    bool isPlain_ = true;
    std::uint32_t count_ = 0;
    std::size_t used_ = 0;
    Rows<Slot> slots_;
};

// Texts and lists of ids, each stored once and never changed. A reference of 0 is the empty one.
//
// Blocks of up to 64 Ki words of four bytes; a reference is the block and the word in it. Tables that share a block
// may all add to it: each claims its words first, and nobody looks at another's.
class BlobStore {
public:
    using Reference = std::uint32_t;

    std::string_view text(Reference reference) const {
        if (reference == 0) return {};
        const auto* bytes = reinterpret_cast<const unsigned char*>(words(reference));
        std::size_t length = bytes[0];
        std::size_t head = 1;
        if (length == kLong) {
            std::uint32_t stored;
            std::memcpy(&stored, bytes + 1, sizeof stored);
            length = stored;
            head += sizeof stored;
        }
        return {reinterpret_cast<const char*>(bytes + head), length};
    }
    std::span<const std::uint32_t> list(Reference reference) const {
        if (reference == 0) return {};
        const std::uint32_t* const first = words(reference);
        return {first + 1, *first};
    }

    Reference add(std::string_view text);
    Reference add(std::span<const std::uint32_t> list);

    // Words that a stored text or list takes.
    static std::size_t wordsOf(std::string_view text) {
        if (text.empty()) return 0;
        return (text.size() + (text.size() < kLong ? 1 : 5) + 3) / 4;
    }
    static std::size_t wordsOf(std::span<const std::uint32_t> list) {
        return list.empty() ? 0 : list.size() + 1;
    }

    // Words that this store and those that it is a copy of have added.
    std::size_t addedWords() const { return addedWords_; }
    std::size_t memoryBytes() const { return capacityWords_ * sizeof(std::uint32_t); }

private:
    static constexpr unsigned kLong = 255;
    static constexpr std::uint32_t kFirstBlockWords = 256;
    static constexpr std::uint32_t kBlockWords = 65536;

    struct Block {
        explicit Block(std::size_t size) : words(new std::uint32_t[size]), capacity(size) {}
        // The first of `count` words that are the caller's from now on; capacity where there is no room.
        std::size_t claim(std::size_t count);

        std::unique_ptr<std::uint32_t[]> words;
        std::size_t capacity;
        std::atomic<std::size_t> used{0};
    };

    const std::uint32_t* words(Reference reference) const {
        return blocks_[reference >> 16U].words + (reference & 0xFFFFU);
    }
    // Room for `count` words, and its reference.
    std::pair<Reference, std::uint32_t*> allocate(std::size_t count);
    void addBlock(std::size_t count);

    struct SharedBlock {
        std::shared_ptr<Block> block;
        const std::uint32_t* words;  // its own, found without looking at the block
    };

    std::vector<SharedBlock> blocks_;
    std::size_t addedWords_ = 0;
    std::size_t capacityWords_ = 0;
};

}  // namespace olvane::detail
