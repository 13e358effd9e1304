// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/HiddenPersons.h>

#include <algorithm>

namespace olvane::picture {

namespace {

bool isHiddenBox(const std::vector<bool>& hidden, const Picture& picture, Index box) {
    return isHidden(hidden, picture.boxes[static_cast<std::size_t>(box)].id);
}

void hideInFamily(const std::vector<bool>& hidden, Picture& picture, Family& family) {
    const auto parents = picture.parents(family);
    const auto children = picture.children(family);
    for (std::size_t i = 0; i < children.size(); ++i) {
        if (isHiddenBox(hidden, picture, children[i])) {
            picture.childKinds[family.firstMember + family.parentCount + i] = kin::ChildKind::unknown;
        }
    }
    const auto isParentHidden = [&](Index box) { return isHiddenBox(hidden, picture, box); };
    if (std::none_of(parents.begin(), parents.end(), isParentHidden)) return;
    family.number = 0;
    family.style = kin::UnionState::unknown;
}

// The words of a way state an adoption and whether a marriage lasts, and those at its ends state all ways.
void hideInWays(const std::vector<bool>& hidden, Picture& picture) {
    for (Way& way : picture.ways) {
        const auto boxes = picture.boxesOf(way);
        const auto isOneHidden = [&](Index box) { return isHiddenBox(hidden, picture, box); };
        if (std::none_of(boxes.begin(), boxes.end(), isOneHidden)) continue;
        way.words.clear();
        if (way.kind == WayKind::legal) way.kind = WayKind::blood;
        picture.focusIs.clear();
        picture.otherIs.clear();
    }
}

}  // namespace

bool isHidden(const std::vector<bool>& hidden, std::int64_t id) {
    return id > 0 && static_cast<std::size_t>(id) <= hidden.size() &&
           hidden[static_cast<std::size_t>(id - 1)];
}

void hidePersons(const std::vector<bool>& hidden, Picture& picture) {
    if (hidden.empty()) return;
    for (Box& box : picture.boxes) {
        if (isHidden(hidden, box.id)) box.furtherParents = 0;
    }
    for (Family& family : picture.families) hideInFamily(hidden, picture, family);
    hideInWays(hidden, picture);
}

}  // namespace olvane::picture
