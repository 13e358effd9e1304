// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where each child is reached: at the middle of its upper edge, or beside it where several families lead to one child.
// Drops then lead to the stems, the nearest rows first.

#include <olvane/picture/RoutePlannerInternal.h>

#include <cmath>
#include <tuple>
#include <utility>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::picture {

// Several stems of one child stand side by side, in the order of the parents.
void RoutePlanner::placeStems() {
    std::vector<Stem> stems = allStems();
    kin::mergeSort(stems.begin(), stems.end(), [](const Stem& a, const Stem& b) {
        return std::tuple(a.child, a.x, a.family) < std::tuple(b.child, b.x, b.family);
    });
    stems.erase(
        std::unique(stems.begin(), stems.end(),
                    [](const Stem& a, const Stem& b) { return a.child == b.child && a.family == b.family; }),
        stems.end());
    for (std::size_t i = 0, next = 0; i < stems.size(); i = next) {
        while (next < stems.size() && stems[next].child == stems[i].child) ++next;
        spreadStems(std::span(stems).subspan(i, next - i));
    }
    groupByFamily(std::move(stems));
}

// Of every child that has no mark in place of a line.
std::vector<Stem> RoutePlanner::allStems() const {
    std::vector<Stem> stems;
    for (std::size_t f = 0; f < picture_.families.size(); ++f) {
        for (const Index child : picture_.children(picture_.families[f])) {
            if (hasParentsMark(picture_.families[f], child)) continue;
            stems.push_back({static_cast<Index>(f), child, middleOfParents(picture_.families[f])});
        }
    }
    return stems;
}

double RoutePlanner::middleOfParents(const Family& f) const {
    double sum = 0;
    for (const Index parent : picture_.parents(f)) sum += rows_.centre(parent);
    return f.parentCount == 0 ? 0 : sum / f.parentCount;
}

void RoutePlanner::spreadStems(std::span<Stem> stems) {
    const Rect& box = rows_.rect(stems[0].child);
    const auto count = static_cast<double>(stems.size());
    const double pitch = std::min(kPortPitch, (box.x2 - box.x1) / (count + 1));
    double x = rows_.centre(stems[0].child) - pitch * (count - 1) / 2;
    for (Stem& stem : stems) {
        stem.x = x;
        x += pitch;
        taken_.take(channelLane(rows_.row(stem.child)), stem.x, stem.family);
    }
}

void RoutePlanner::groupByFamily(std::vector<Stem> stems) {
    kin::mergeSort(stems.begin(), stems.end(), [](const Stem& a, const Stem& b) {
        return std::tuple(a.family, a.x, a.child) < std::tuple(b.family, b.x, b.child);
    });
    firstStem_.assign(picture_.families.size() + 1, 0);
    for (const Stem& stem : stems) ++firstStem_[at(stem.family) + 1];
    for (std::size_t f = 0; f < picture_.families.size(); ++f) firstStem_[f + 1] += firstStem_[f];
    stems_ = std::move(stems);
}

std::span<const Stem> RoutePlanner::stemsOf(Index f) const {
    return {stems_.data() + firstStem_[at(f)], firstStem_[at(f) + 1] - firstStem_[at(f)]};
}

// An only child who is nearly below the drop gets its stem right below: better off the middle of the box than
// with a slight bend.
void RoutePlanner::straighten(Index f, double x, std::size_t channel) {
    if (stemsOf(f).size() != 1) return;
    Stem& stem = stems_[firstStem_[at(f)]];
    const Rect& box = rows_.rect(stem.child);
    const bool isNear =
        std::abs(stem.x - x) <= kPortPitch && x > box.x1 + kPortInset && x < box.x2 - kPortInset;
    if (isNear && rows_.row(stem.child) == channel) stem.x = x;
}

// Nearest rows first, so that farther ones lead on from there.
void RoutePlanner::planChildren(FamilyNet& net) {
    const auto all = stemsOf(net.family);
    std::vector<Stem> stems(all.begin(), all.end());
    if (stems.empty()) return;
    if (net.isEmpty()) {
        for (const Stem& stem : stems) markParents(net.family, stem.child);
        return;
    }
    const auto home = static_cast<Index>(net.lastChannel());
    const double start = net.x;
    const auto rowDistance = [&](const Stem& stem) {
        return std::tuple(std::abs(rows_.rowOf[at(stem.child)] - home), std::abs(stem.x - start), stem.child);
    };
    kin::mergeSort(stems.begin(), stems.end(),
                   [&](const Stem& a, const Stem& b) { return rowDistance(a) < rowDistance(b); });
    for (const Stem& stem : stems) planStem(net, stem);
}

void RoutePlanner::planStem(FamilyNet& net, const Stem& stem) {
    const std::size_t channel = rows_.row(stem.child);
    if (channel > net.lastChannel()) aimAt(net, net.bars.back(), stem.x);
    if (channel < net.firstChannel) aimAt(net, net.bars.front(), stem.x);
    const bool reached = channel >= net.firstChannel ? extendDown(net, channel, stem.x, LineRole::drop)
                                                     : extendUp(net, channel, stem.x);
    if (!reached) return markParents(net.family, stem.child);
    addVertical({net.family, stem.child, LineRole::stem, stem.x, onBar(net.bars[channel - net.firstChannel]),
                 atRow(rows_.rowOf[at(stem.child)], rows_.rect(stem.child).y1)});
}

// The place of a bar from which it is nearest to x.
void RoutePlanner::aimAt(FamilyNet& net, Index bar, double x) const {
    const Bar& b = plan_.bars[at(bar)];
    if (b.lo <= b.hi) net.x = std::clamp(x, b.lo, b.hi);
}

void RoutePlanner::markParents(Index f, Index child) {
    const auto parents = picture_.parents(family(f));
    addMark(MarkKind::parentsElsewhere, child, parents[0], parents.size() > 1 ? parents[1] : kNone);
}

}  // namespace olvane::picture
