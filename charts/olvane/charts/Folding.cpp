// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A branch is counted by choosing the persons of the chart with and without it.

#include <olvane/charts/FoldingInternal.h>

#include <algorithm>
#include <cstddef>
#include <stdexcept>

#include <olvane/charts/LaterSide.h>
#include <olvane/charts/SelectionInternal.h>
#include <olvane/charts/ViewOption.h>

namespace olvane::charts {

using picture::Branch;
using picture::Side;

namespace {

std::size_t shownWith(const kin::KinGraph& graph, ChartRequest request, const std::vector<Fold>& folded) {
    request.folded = folded;
    return selectPersons(graph, request).persons.size();
}

std::int32_t sizeOf(const kin::KinGraph& graph, const ChartRequest& request, const Fold& fold) {
    std::vector<Fold> folded;
    for (const Fold& other : request.folded) {
        if (other != fold) folded.push_back(other);
    }
    const std::size_t without = shownWith(graph, request, folded);
    folded.push_back(fold);
    return static_cast<std::int32_t>(without - shownWith(graph, request, folded));
}

}  // namespace

bool canFold(View view) {
    return (viewsOfFolds() & setOf(view)) != 0;
}

std::array<std::int32_t, 3> branchSizes(const kin::KinGraph& graph, const ChartRequest& request,
                                        std::int64_t person) {
    std::array<std::int32_t, 3> sizes{};
    if (request.focus < 0 || request.focus >= graph.personCount()) throw std::out_of_range("no such person");
    const kin::Place place = graph.placeOf(person);
    if (!canFold(request.view) || place == kin::kNobody) return sizes;
    if (!selectPersons(graph, request).shown[at(place)]) return sizes;
    for (const Branch branch : {Branch::up, Branch::down, Branch::beside}) {
        sizes[static_cast<std::size_t>(branch)] = sizeOf(graph, request, {person, branch});
    }
    return sizes;
}

Side sideOf(Branch branch, const ChartRequest& request) {
    const Side later = laterSideOf(request);
    if (branch == Branch::down) return later;
    if (branch == Branch::up) return opposite(later);
    const bool sideways = later == Side::left || later == Side::right;
    return sideways ? Side::bottom : request.mirrored ? Side::left : Side::right;
}

void addFolded(picture::Picture& picture, const kin::KinGraph& graph, const ChartRequest& request) {
    for (std::size_t i = 0; i < request.folded.size(); ++i) {
        const Fold& fold = request.folded[i];
        const auto before = request.folded.first(i);
        if (std::find(before.begin(), before.end(), fold) != before.end()) continue;
        const auto box = std::find_if(picture.boxes.begin(), picture.boxes.end(),
                                      [&fold](const picture::Box& one) { return one.id == fold.person; });
        if (box == picture.boxes.end()) continue;
        const std::int32_t count = sizeOf(graph, request, fold);
        if (count == 0) continue;
        picture.folded.push_back({static_cast<picture::Index>(box - picture.boxes.begin()), count,
                                  fold.branch, sideOf(fold.branch, request)});
    }
}

}  // namespace olvane::charts
