// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstring>
#include <memory>
#include <string_view>
#include <vector>

namespace olvane::gedcom {

// Keeps texts that are not in the file as they are: decoded, joined, put together.
//
// Holds: a text that was kept never moves; all go together when the arena goes.
class TextArena {
public:
    std::string_view keep(std::string_view text) {
        if (text.empty()) return {};
        if (text.size() > free_) addBlock(text.size());
        char* const place = next_;
        std::memcpy(place, text.data(), text.size());
        next_ += text.size();
        free_ -= text.size();
        return {place, text.size()};
    }

private:
    static constexpr std::size_t kBlockBytes = 16 * 1024;

    void addBlock(std::size_t atLeast) {
        const std::size_t size = std::max(atLeast, kBlockBytes);
        blocks_.push_back(std::unique_ptr<char[]>(new char[size]));  // left as it is, without zeros
        next_ = blocks_.back().get();
        free_ = size;
    }

    std::vector<std::unique_ptr<char[]>> blocks_;
    char* next_ = nullptr;
    std::size_t free_ = 0;
};

}  // namespace olvane::gedcom
