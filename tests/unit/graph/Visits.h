// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/graph/TreeViewPerson.h>

namespace unit {

typedef std::vector<int> Keys;

// The keys of the persons that a walk visits, in its order.
inline Keys keysOf(const TreeViewPerson::Iterator& walk) {
    Keys keys;
    walk([&keys](TreeViewPerson& person) { keys.push_back(person.personId); });
    return keys;
}

inline Keys keysOf(const TreeViewPerson::Persons& list) {
    Keys keys;
    for (const TreeViewPerson& person : list) keys.push_back(person.personId);
    return keys;
}

// What the work throws, as text; empty when it throws nothing. Only the named kind of exception is taken.
template <class Exception, class Work>
std::string failureOf(Work work) {
    try {
        work();
    } catch (const Exception& failure) {
        return failure.what();
    }
    return std::string();
}

inline constexpr char kEmptyFunctionFailure[] = "call to empty boost::function";

}  // namespace unit
