// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/detail/Arena.h>

namespace olvane {

// A std::vector in the memory of a picture, made from a plain std::vector and copied into one wherever a host has
// that type.
template <class Element>
class ArenaList : public std::vector<Element, ArenaAllocator<Element>> {
    typedef std::vector<Element, ArenaAllocator<Element>> Base;

public:
    using Base::Base;
    ArenaList() = default;
    ArenaList(const std::vector<Element>& elements) : Base(elements.begin(), elements.end()) {}
    operator std::vector<Element>() const { return std::vector<Element>(this->begin(), this->end()); }
};

}  // namespace olvane
