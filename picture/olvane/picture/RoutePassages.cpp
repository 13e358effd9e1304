// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Through rows: the way of a family whose children, or whose partners, are rows apart. It takes the nearest free place of
// each row that lies between.

#include <olvane/picture/RoutePlannerInternal.h>

#include <cmath>
#include <limits>

namespace olvane::picture {

namespace {

constexpr std::size_t kMostGaps = 64;  // looked at when something has to pass through a row

}  // namespace

// A free place in a row, such that the way from one x to the other is short.
std::optional<double> RoutePlanner::freePassage(Index f, std::size_t r, double from, double to) const {
    const std::vector<RowGap>& gaps = row(r).gaps;
    std::optional<double> best;
    double bestLength = std::numeric_limits<double>::infinity();
    const auto look = [&](std::size_t gap, double wanted) {
        const auto x = taken_.freePlace({rowLane(r), channelLane(r), channelLane(r + 1)},
                                        gaps[gap].lo + kBoxRoom, gaps[gap].hi - kBoxRoom, wanted, f);
        if (!x) return false;
        const double length = std::abs(*x - from) + std::abs(*x - to);
        if (length < bestLength) {
            bestLength = length;
            best = x;
        }
        return true;
    };
    for (const double wanted : {to, from}) {
        const std::size_t middle = row(r).gapAt(wanted);
        bool found = false;
        for (std::size_t step = 0; step < kMostGaps && !found; ++step) {
            if (middle >= step) found = look(middle - step, wanted) || found;
            if (step > 0 && middle + step < gaps.size()) found = look(middle + step, wanted) || found;
        }
    }
    if (best) return best;
    // The outside of the row is wide: some place is free there.
    const std::size_t outside = to - gaps.front().hi < gaps.back().lo - to ? 0 : gaps.size() - 1;
    const double edge = outside == 0 ? gaps.front().hi - kBoxRoom : gaps.back().lo + kBoxRoom;
    look(outside, edge);
    return best;
}

void RoutePlanner::addPassage(FamilyNet& net, std::size_t r, double x, LineRole role, Index barAbove,
                              Index barBelow) {
    taken_.take(rowLane(r), x, net.family);
    taken_.take(channelLane(r), x, net.family);
    taken_.take(channelLane(r + 1), x, net.family);
    addVertical({net.family, kNone, role, x, onBar(barAbove), onBar(barBelow)});
    net.x = x;
}

// Down to the channel, towards x. False where a row lets nothing pass.
bool RoutePlanner::extendDown(FamilyNet& net, std::size_t channel, double x, LineRole role) {
    while (net.lastChannel() < channel) {
        const std::size_t r = net.lastChannel();
        const auto passage = freePassage(net.family, r, net.x, x);
        if (!passage) return false;
        const Index above = net.bars.back();
        const Index below = addBar(net, r + 1, role == LineRole::marriage ? role : LineRole::bar);
        addPassage(net, r, *passage, role, above, below);
    }
    return true;
}

bool RoutePlanner::extendUp(FamilyNet& net, std::size_t channel, double x) {
    while (net.firstChannel > channel) {
        const std::size_t r = net.firstChannel - 1;
        const auto passage = freePassage(net.family, r, net.x, x);
        if (!passage) return false;
        const Index below = net.bars.front();
        const Index above = addBar(net, r, LineRole::bar);
        addPassage(net, r, *passage, LineRole::drop, above, below);
    }
    return true;
}

}  // namespace olvane::picture
