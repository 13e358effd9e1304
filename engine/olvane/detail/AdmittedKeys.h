// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <functional>
#include <initializer_list>
#include <map>
#include <utility>
#include <vector>

#include <olvane/detail/Arena.h>

namespace SharedTreeViewer {

// The keys admitted to a graph, as an ordered map; the value is always true. Nearly every person is admitted and
// hardly anybody is looked up, so keys wait in a list and enter the map at the next look. An entry that exists is
// not touched by that.
class AdmittedKeys {
public:
    typedef std::map<int, bool, std::less<int>, olvane::ArenaAllocator<std::pair<const int, bool>>> Map;
    typedef Map::key_type key_type;
    typedef Map::mapped_type mapped_type;
    typedef Map::value_type value_type;
    typedef Map::iterator iterator;
    typedef Map::const_iterator const_iterator;

    explicit AdmittedKeys(olvane::Arena* arena) : map_(arena), waiting_(arena) {}
    AdmittedKeys& operator=(std::initializer_list<Map::value_type> entries) {
        clear();
        map_.insert(entries);
        return *this;
    }

    AdmittedKeys& operator=(const std::map<int, bool>& entries) {
        clear();
        map_.insert(entries.begin(), entries.end());
        return *this;
    }

    void admit(int key) { waiting_.push_back(key); }
    // Upper bound on size(); does not flush.
    std::size_t sizeAtMost() const { return map_.size() + waiting_.size(); }

    // --- The map.
    const Map& map() const {
        flush();
        return map_;
    }
    Map& map() {
        flush();
        return map_;
    }
    bool& operator[](int key) { return map()[key]; }
    const bool& at(int key) const { return map().at(key); }
    std::size_t count(int key) const { return map().count(key); }
    const_iterator find(int key) const { return map().find(key); }
    iterator find(int key) { return map().find(key); }
    const_iterator lower_bound(int key) const { return map().lower_bound(key); }
    const_iterator upper_bound(int key) const { return map().upper_bound(key); }
    const_iterator begin() const { return map().begin(); }
    const_iterator end() const { return map().end(); }
    const_iterator cbegin() const { return begin(); }
    const_iterator cend() const { return end(); }
    iterator begin() { return map().begin(); }
    iterator end() { return map().end(); }
    std::pair<iterator, bool> insert(const value_type& entry) { return map().insert(entry); }
    template <class Input>
    void insert(Input first, Input last) {
        map().insert(first, last);
    }
    template <class... Arguments>
    std::pair<iterator, bool> emplace(Arguments&&... arguments) {
        return map().emplace(std::forward<Arguments>(arguments)...);
    }
    std::size_t erase(int key) { return map().erase(key); }
    iterator erase(const_iterator entry) { return map().erase(entry); }
    operator std::map<int, bool>() const { return std::map<int, bool>(begin(), end()); }
    std::size_t size() const { return map().size(); }
    bool empty() const { return map_.empty() && waiting_.empty(); }
    void clear() {
        map_.clear();
        waiting_.clear();
    }

private:
    // Mostly in the order of the keys, so the end is the place to look first.
    void flush() const {
        for (const int key : waiting_) map_.emplace_hint(map_.end(), key, true);
        waiting_.clear();
    }

    mutable Map map_;
    mutable std::vector<int, olvane::ArenaAllocator<int>> waiting_;
};

}  // namespace SharedTreeViewer
