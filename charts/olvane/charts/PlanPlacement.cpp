// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/PlanPlacementInternal.h>

#include <algorithm>
#include <limits>

namespace olvane::charts {

namespace {

constexpr double kNothing = -std::numeric_limits<double>::infinity();

}  // namespace

PlanPlacement::PlanPlacement(Plan& plan, double gap, double share)
    : plan_(plan),
      gap_(gap),
      isNarrowed_(share < 1),
      embedding_(plan),
      tidy_(plan, gap),
      relaxation_(plan, gap, share) {}

// Embedding a tree may cut off others, which are new roots behind it.
void PlanPlacement::place() {
    std::int32_t lastRow = 0;
    for (const Household& household : plan_.households) {
        firstRow_ = std::min(firstRow_, household.row);
        lastRow = std::max(lastRow, household.row);
    }
    rowEnd_.assign(at(lastRow - firstRow_) + 1, kNothing);
    for (Index h = 0; h < static_cast<Index>(plan_.households.size()); ++h) {
        if (plan_.households[at(h)].treeParent != kNone) continue;
        placeTree(h);
        setBeside();
    }
}

void PlanPlacement::placeTree(Index root) {
    gatherTree(root);
    if (isMixed_ || isNarrowed_) {
        const std::vector<Index> order = embedding_.orderTree(root);
        relaxation_.place(order);
        below_.assign(order.begin(), order.end());
        above_.clear();
        return;
    }
    tidy_.place(below_, false);
    if (above_.size() > 1) tidy_.place(above_, true);
}

void PlanPlacement::gatherTree(Index root) {
    below_.assign(1, root);
    above_.assign(1, root);
    isMixed_ = false;
    for (std::size_t i = 0; i < above_.size(); ++i) {
        const Household& household = plan_.households[at(above_[i])];
        for (Index h = household.upFirst; h < household.upEnd; ++h) {
            if (plan_.households[at(h)].treeParent == above_[i]) above_.push_back(h);
        }
        if (i == 0) continue;
        for (Index h = household.downFirst; h < household.downEnd && !isMixed_; ++h) {
            isMixed_ = plan_.households[at(h)].treeParent == above_[i];
        }
    }
    for (std::size_t i = 0; i < below_.size(); ++i) {
        const Household& household = plan_.households[at(below_[i])];
        for (Index h = household.downFirst; h < household.downEnd; ++h) {
            if (plan_.households[at(h)].treeParent == below_[i]) below_.push_back(h);
        }
    }
}

// To the right of all earlier trees, as near as its rows allow.
void PlanPlacement::setBeside() {
    double shift = kNothing;
    double least = std::numeric_limits<double>::infinity();
    const auto forEach = [this](const auto& visit) {
        for (const Index h : below_) visit(plan_.households[at(h)]);
        for (std::size_t i = 1; i < above_.size(); ++i) visit(plan_.households[at(above_[i])]);
    };
    forEach([&](const Household& h) {
        shift = std::max(shift, rowEnd_[at(h.row - firstRow_)] + gap_ - h.x);
        least = std::min(least, h.x);
    });
    if (shift == kNothing) shift = -least;
    forEach([&](Household& h) {
        h.x += shift;
        double& end = rowEnd_[at(h.row - firstRow_)];
        end = std::max(end, h.x + h.width);
    });
}

}  // namespace olvane::charts
