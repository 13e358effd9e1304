// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/Export.h>

namespace olvane::kin {

// Different texts, numbered from 0 in the order in which they came first.
//
// A hash table with open addressing; the bytes of all texts lie in one string. The factor of the hash is random, so that
// nobody can make a file whose words all fall into one slot (M. Dietzfelbinger and others, "A reliable randomized
// algorithm for the closest-pair problem", 1997); no number depends on it.
//
// Holds: numbers never change; fewer than 2^32 - 1 texts.
// Fails: std::bad_alloc; std::length_error for one text too many. Then nothing has changed.
class OLVANE_API TextNumbers {
public:
    static constexpr std::uint32_t kNone = 0xFFFFFFFF;

    TextNumbers();

    // The number of a text, a new one where it has not come before. The text is not one of these.
    std::uint32_t numberOf(std::string_view text);
    // kNone where it has not come.
    std::uint32_t find(std::string_view text) const;

    using Use = std::function<void(std::uint32_t number)>;
    // Calls use with the number of each text that holds a part, or begins with it, in order. The part is not empty.
    // Time: that of a pass through all bytes at most, or through all beginnings.
    void visitHolding(std::string_view part, const Use& use) const;
    void visitBeginning(std::string_view part, const Use& use) const;

    std::size_t size() const { return ends_.size(); }
    // Valid until the next new text.
    std::string_view operator[](std::uint32_t number) const {
        const std::size_t start = number == 0 ? 0 : ends_[number - 1];
        return {bytes_.data() + start, ends_[number] - start};
    }

private:
    struct Slot {
        std::uint32_t hash = 0;
        std::uint32_t number = kNone;
    };

    std::uint32_t hashOf(std::string_view text) const;
    // Where the text is, or would be.
    std::size_t slotOf(std::string_view text, std::uint32_t hash) const;
    void grow();

    std::uint64_t factor_;
    std::string bytes_;
    std::vector<std::size_t> ends_;
    std::vector<Slot> slots_;  // a power of two, at most half of them filled
};

}  // namespace olvane::kin
