// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstddef>
#include <span>
#include <vector>

#include <olvane/picture/Picture.h>

namespace olvane::picture {

// The members of all families, each family's sorted and each box once.
class FamilyMembers {
public:
    explicit FamilyMembers(const Picture& picture) {
        first_.reserve(picture.families.size() + 1);
        for (const Family& family : picture.families) {
            first_.push_back(boxes_.size());
            const auto start = static_cast<std::ptrdiff_t>(boxes_.size());
            const auto parents = picture.parents(family);
            const auto children = picture.children(family);
            boxes_.insert(boxes_.end(), parents.begin(), parents.end());
            boxes_.insert(boxes_.end(), children.begin(), children.end());
            std::sort(boxes_.begin() + start, boxes_.end());
            boxes_.erase(std::unique(boxes_.begin() + start, boxes_.end()), boxes_.end());
        }
        first_.push_back(boxes_.size());
    }

    std::size_t count() const { return boxes_.size(); }
    std::span<const Index> of(std::size_t family) const {
        return {boxes_.data() + first_[family], first_[family + 1] - first_[family]};
    }
    // The member's place among all; count() where the box is nobody's in the family.
    std::size_t placeOf(std::size_t family, Index box) const {
        const auto members = of(family);
        const auto found = std::lower_bound(members.begin(), members.end(), box);
        if (found == members.end() || *found != box) return count();
        return first_[family] + static_cast<std::size_t>(found - members.begin());
    }
    std::size_t firstOf(std::size_t family) const { return first_[family]; }
    bool has(std::size_t family, Index box) const { return placeOf(family, box) != count(); }

private:
    std::vector<Index> boxes_;
    std::vector<std::size_t> first_;
};

}  // namespace olvane::picture
