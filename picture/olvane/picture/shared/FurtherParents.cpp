// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/shared/FurtherParents.h>

#include <algorithm>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::picture {

namespace {

// Who has a box. Most pictures have nobody with two families of parents, so the list is made when first asked.
class ShownIds {
public:
    explicit ShownIds(const Picture& picture) : picture_(picture) {}

    bool has(std::int64_t id) {
        if (ids_.empty()) {
            for (const Box& box : picture_.boxes) ids_.push_back(box.id);
            kin::mergeSort(ids_.begin(), ids_.end());
        }
        return std::binary_search(ids_.begin(), ids_.end(), id);
    }

private:
    const Picture& picture_;
    std::vector<std::int64_t> ids_;
};

}  // namespace

void countFurtherParents(Picture& picture, const kin::KinGraph& graph) {
    ShownIds shown(picture);
    for (Box& box : picture.boxes) {
        box.furtherParents = 0;
        const kin::Place person = box.kind == BoxKind::person ? graph.placeOf(box.id) : kin::kNobody;
        if (person == kin::kNobody) continue;
        const auto families = graph.unionsAsChild(person);
        for (std::size_t i = 1; i < families.size(); ++i) {
            const auto& partners = graph.partners(families[i]);
            const bool hasBox = std::any_of(partners.begin(), partners.end(), [&](kin::Place partner) {
                return partner != kin::kNobody && shown.has(graph.id(partner));
            });
            if (!hasBox) ++box.furtherParents;
        }
    }
}

}  // namespace olvane::picture
