// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// An earlier chart of everybody, whose places a new one keeps: rows and order are taken over, new chains and passes are
// inserted, and what then has no room is moved aside by as little as can be.

#include <olvane/charts/EverybodyEarlierInternal.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;
using picture::Index;
using picture::kNone;

}  // namespace

const picture::Box* boxOf(const Component& part, const EarlierPicture& earlier, std::int32_t person) {
    const Index box = earlier.boxOf[at(part.persons[at(person)])];
    return box == kNone ? nullptr : &earlier.picture.boxes[at(box)];
}

bool stoodFlipped(const Component& part, const Chains& chains, std::int32_t chain,
                  const EarlierPicture& earlier) {
    const picture::Box* before = nullptr;
    for (const std::int32_t person : chains.persons[chain]) {
        const picture::Box* box = boxOf(part, earlier, person);
        if (box == nullptr) continue;
        if (before != nullptr) return box->x < before->x;
        before = box;
    }
    return false;
}

EarlierPicture earlierPictureOf(const kin::KinGraph& graph, const picture::Picture& picture, bool sideways,
                                bool mirrored) {
    EarlierPicture earlier;
    earlier.picture = picture;
    earlier.boxOf.assign(at(graph.personCount()), kNone);
    double bottom = 0;
    for (picture::Box& box : earlier.picture.boxes) {
        if (sideways) {
            std::swap(box.x, box.y);
            std::swap(box.width, box.height);
        }
        bottom = std::max(bottom, box.y + double{box.height});
    }
    for (std::size_t i = 0; i < earlier.picture.boxes.size(); ++i) {
        picture::Box& box = earlier.picture.boxes[i];
        if (mirrored) box.y = bottom - box.y - double{box.height};
        const kin::Place place = graph.placeOf(box.id);
        const bool isPlaced = std::isfinite(box.x) && std::isfinite(box.y);
        if (place != kin::kNobody && isPlaced) earlier.boxOf[at(place)] = static_cast<Index>(i);
    }
    for (picture::Line& line : earlier.picture.lines) {
        if (sideways) {
            std::swap(line.x1, line.y1);
            std::swap(line.x2, line.y2);
        }
        if (!mirrored) continue;
        line.y1 = bottom - line.y1;
        line.y2 = bottom - line.y2;
    }
    return earlier;
}

void markAsBefore(const Component& part, const EarlierPicture& earlier, MarkedLinks& marked) {
    std::vector<std::array<Index, 3>> marks;
    for (const picture::Mark& mark : earlier.picture.marks) {
        if (mark.kind == picture::MarkKind::samePerson) continue;
        marks.push_back({mark.boxes[0], mark.boxes[1], mark.boxes[2]});
    }
    kin::mergeSort(marks.begin(), marks.end());
    const auto had = [&](Index a, Index b, Index c) {
        return a != kNone && std::binary_search(marks.begin(), marks.end(), std::array{a, b, c});
    };
    const auto box = [&](std::int32_t person) {
        return person < 0 ? kNone : earlier.boxOf[at(part.persons[at(person)])];
    };
    std::size_t link = 0;
    for (std::int32_t u = 0; u < part.unionCount(); ++u) {
        const auto& two = part.partners[at(u)];
        const Index first = two[0] >= 0 ? box(two[0]) : box(two[1]);
        const Index second = two[0] >= 0 ? box(two[1]) : kNone;
        for (const std::int32_t child : part.children[u]) {
            if (had(box(child), first, second)) marked.child[link] = 1;
            ++link;
        }
        if (marked.partner[at(u)] == 0 && two[0] >= 0 && two[1] >= 0 &&
            had(box(two[0]), box(two[1]), kNone)) {
            marked.partner[at(u)] = 2;
        }
    }
}

}  // namespace olvane::charts
