// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/unordered_set.hpp>

#include <cstddef>
#include <vector>

namespace SharedTreeViewer {

// A set of person keys. Keys are handed out one after the other, so nearly all of them are marks in an array;
// a host that calls a layouter with keys of its own may hand out any, and those far out go to a hash set.
class KeySet {
public:
    void insert(int key) {
        ++inserted_;
        if (isFarOut(key)) {
            farOut_.insert(key);
            return;
        }
        const std::size_t place = static_cast<std::size_t>(key);
        if (place >= marks_.size()) marks_.resize(place + place / 2 + kLeastMarks);
        marks_[place] = 1;
    }

    bool contains(int key) const {
        const std::size_t place =
            static_cast<std::size_t>(key);  // beyond every mark where the key is negative
        if (place < marks_.size() && marks_[place] != 0) return true;
        return !farOut_.empty() && farOut_.find(key) != farOut_.end();
    }

    void clear() {
        inserted_ = 0;
        marks_.clear();
        farOut_.clear();
    }

private:
    static constexpr std::size_t kLeastMarks = 1024;
    static constexpr std::size_t kMarksForEachKey = 64;

    bool isFarOut(int key) const {
        return key < 0 || static_cast<std::size_t>(key) >= kLeastMarks + kMarksForEachKey * inserted_;
    }

    std::vector<unsigned char> marks_;  // by key; bytes, which are read with less work than bits
    std::size_t inserted_ = 0;
    boost::unordered_set<int> farOut_;
};

}  // namespace SharedTreeViewer
