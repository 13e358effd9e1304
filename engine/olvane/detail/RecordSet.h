// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <boost/function.hpp>

#include <functional>
#include <set>
#include <type_traits>
#include <utility>

#include <olvane/detail/Arena.h>

namespace olvane {

// The ordered set of a person's spouses or children, in the memory of a picture: a std::set with another
// allocator, made from a plain std::set and copied into one wherever a host has that type.
template <class Record>
class RecordSet : public std::set<Record, std::less<Record>, ArenaAllocator<Record>> {
    typedef std::set<Record, std::less<Record>, ArenaAllocator<Record>> Base;

public:
    typedef std::set<Record> Plain;

    using Base::Base;
    RecordSet() = default;
    RecordSet(const Plain& records) : Base(records.begin(), records.end()) {}
    operator Plain() const { return Plain(this->begin(), this->end()); }
};

// A callback that adds a person's records to a set: a boost::function of void (int key, set&), in which the set may
// be a RecordSet or a plain std::set. It is made from a function of either kind and called with a set of either
// kind. Between unlike kinds the records are copied, in their order.
//
// Fails: as a boost::function does; what a callback added before it threw is in the set.
template <class Record>
class RecordsCallback {
public:
    typedef RecordSet<Record> Set;
    typedef std::set<Record> PlainSet;

    RecordsCallback() = default;
    template <class Function, class = std::enable_if_t<!std::is_same_v<Function, RecordsCallback> &&
                                                       (std::is_invocable_v<Function&, int, Set&> ||
                                                        std::is_invocable_v<Function&, int, PlainSet&>)>>
    RecordsCallback(Function function) {
        if constexpr (std::is_invocable_v<Function&, int, Set&>) {
            callback_ = std::move(function);
        } else if (!isEmpty(function)) {
            callback_ = OverPlainSet<Function>{std::move(function)};
        }
    }

    void operator()(int key, Set& records) const { callback_(key, records); }
    void operator()(int key, PlainSet& records) const {
        throughCopy<Set>(records, [&](Set& copy) { callback_(key, copy); });
    }

    bool empty() const { return callback_.empty(); }
    explicit operator bool() const { return !empty(); }
    void clear() { callback_.clear(); }

private:
    template <class Function>
    struct OverPlainSet {
        Function function;
        void operator()(int key, Set& records) {
            throughCopy<PlainSet>(records, [&](PlainSet& copy) { function(key, copy); });
        }
    };

    template <class Copy, class Original, class Call>
    static void throughCopy(Original& original, const Call& call) {
        Copy copy(original.begin(), original.end());
        try {
            call(copy);
        } catch (...) {
            moveBack(copy, original);
            throw;
        }
        moveBack(copy, original);
    }
    // Neighbours in a set have been compared, so each comes in at the end.
    template <class Copy, class Original>
    static void moveBack(const Copy& copy, Original& original) {
        original.clear();
        for (const Record& record : copy) original.insert(original.end(), record);
    }

    // As boost::function finds it of what it is made from.
    template <class Function>
    static bool isEmpty(const Function& function) {
        if constexpr (std::is_pointer_v<Function>) {
            return function == nullptr;
        } else if constexpr (requires { function.empty(); }) {
            return function.empty();
        } else {
            return false;
        }
    }

    boost::function<void(int, Set&)> callback_;
};

}  // namespace olvane
