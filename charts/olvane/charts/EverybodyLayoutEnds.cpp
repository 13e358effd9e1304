// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the lines of one part end: at the middle of a box or of a couple, or beside it where several end there, and between
// boxes where a line passes through a row.

#include <olvane/charts/PartLayouterInternal.h>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

// How far a line that runs between boxes may be moved to keep it off others. In points.
constexpr double kMostPassMove = 20;

}  // namespace

// Where ends lie in their nodes, now that it is known which chains are turned round.
void PartLayouter::measureEnds() {
    layout_.sizes.width.resize(at(layout_.rows.nodeCount()), 0);
    layout_.sizes.endPlace.assign(layout_.rows.ends.size(), 0);
    for (std::size_t e = 0; e < layout_.rows.ends.size(); ++e) {
        const Rows::End& end = layout_.rows.ends[e];
        if (layout_.rows.isPass(end.node)) continue;
        const BoxPlace box = boxPlace(layout_.chains.persons[end.node][at(end.sub / 2)]);
        double place = (box.left + box.right) / 2;
        if (end.sub % 2 == 1) {
            place = layout_.order.flipped[at(end.node)] != 0 ? box.left - layout_.sizes.gap / 2
                                                             : box.right + layout_.sizes.gap / 2;
        }
        layout_.sizes.endPlace[e] = place;
    }
}

// In its chain.
PartLayouter::BoxPlace PartLayouter::boxPlace(std::int32_t person) const {
    const std::int32_t chain = layout_.chains.chain[at(person)];
    const auto persons = layout_.chains.persons[chain];
    const bool flipped = layout_.order.flipped[at(chain)] != 0;
    const auto slot = at(layout_.chains.slot[at(person)]);
    double left = 0;
    for (std::size_t i = flipped ? persons.size() - 1 : 0; i != slot; flipped ? --i : ++i) {
        left += boxes_.width(layout_.part, persons[i]) + layout_.sizes.gap;
    }
    return {left, left + boxes_.width(layout_.part, person)};
}

std::vector<EndRange> PartLayouter::endRanges() const {
    std::vector<EndRange> ranges;
    ranges.reserve(layout_.rows.ends.size());
    for (std::size_t e = 0; e < layout_.rows.ends.size(); ++e) {
        const Rows::End& end = layout_.rows.ends[e];
        const double wanted = layout_.left[at(end.node)] + layout_.sizes.endPlace[e];
        double room = 0;
        if (!layout_.rows.isPass(end.node)) {
            const std::int32_t person = layout_.chains.persons[end.node][at(end.sub / 2)];
            room = end.sub % 2 == 1 ? coupleEndRoom() : boxEndRoom(person);
        }
        ranges.push_back({wanted, wanted - room, wanted + room});
    }
    for (std::int32_t chain = 0; chain < layout_.rows.chainCount; ++chain) spreadEnds(chain, ranges);
    for (const auto& nodes : layout_.order.nodes) givePassesRoom(nodes, ranges);
    return ranges;
}

// A pass may be moved between its neighbours, half of the way if that is another pass.
void PartLayouter::givePassesRoom(const std::vector<std::int32_t>& nodes,
                                  std::vector<EndRange>& ranges) const {
    const auto room = [this](std::int32_t beside, double apart) {
        return std::max(0.0,
                        layout_.rows.isPass(beside) ? (apart - GapLines::kApart) / 2 : apart - kBoxMargin);
    };
    for (std::size_t i = 0; i < nodes.size(); ++i) {
        if (!layout_.rows.isPass(nodes[i])) continue;
        const double x = layout_.left[at(nodes[i])];
        double before = kMostPassMove;
        double behind = kMostPassMove;
        if (i > 0) {
            const double edge = layout_.left[at(nodes[i - 1])] + layout_.sizes.width[at(nodes[i - 1])];
            before = std::min(before, room(nodes[i - 1], x - edge));
        }
        if (i + 1 < nodes.size())
            behind = std::min(behind, room(nodes[i + 1], layout_.left[at(nodes[i + 1])] - x));
        for (const std::int32_t e : layout_.rows.endsAt[nodes[i]])
            ranges[at(e)] = {x, x - before, x + behind};
    }
}

// Ends at one side of one box, or of one couple, stand beside one another in the order of where they lead to.
void PartLayouter::spreadEnds(std::int32_t chain, std::vector<EndRange>& ranges) const {
    std::vector<std::int32_t> ends(layout_.rows.endsAt[chain].begin(), layout_.rows.endsAt[chain].end());
    if (ends.size() < 2) return;
    const auto sameSide = [this](std::int32_t a, std::int32_t b) {
        return layout_.rows.isBelow(a) == layout_.rows.isBelow(b) &&
               layout_.rows.ends[at(a)].sub == layout_.rows.ends[at(b)].sub;
    };
    kin::mergeSort(ends.begin(), ends.end(), [&](std::int32_t a, std::int32_t b) {
        if (layout_.rows.isBelow(a) != layout_.rows.isBelow(b)) return layout_.rows.isBelow(a);
        if (layout_.rows.ends[at(a)].sub != layout_.rows.ends[at(b)].sub)
            return layout_.rows.ends[at(a)].sub < layout_.rows.ends[at(b)].sub;
        return otherSide(a, ranges) < otherSide(b, ranges);
    });
    for (std::size_t first = 0, last = 0; first < ends.size(); first = last) {
        for (last = first; last < ends.size() && sameSide(ends[first], ends[last]); ++last) {
        }
        const auto steps = static_cast<double>(last - first - 1);
        if (steps == 0) continue;
        const EndRange range = ranges[at(ends[first])];
        const double step = std::min(9.0, (range.high - range.low) / steps);
        for (std::size_t i = first; i < last; ++i) {
            ranges[at(ends[i])].wanted += step * (static_cast<double>(i - first) - steps / 2);
            ranges[at(ends[i])].low = ranges[at(ends[i])].wanted - (step - GapLines::kApart) / 2;
            ranges[at(ends[i])].high = ranges[at(ends[i])].wanted + (step - GapLines::kApart) / 2;
        }
    }
}

// The outermost places that the strand of an end has on the other side of its gap; far left where it has none.
std::pair<double, double> PartLayouter::otherSide(std::int32_t e, const std::vector<EndRange>& ranges) const {
    const Rows::Strand& strand = layout_.rows.strands[at(layout_.rows.strandOfEnd[at(e)])];
    const bool below = layout_.rows.isBelow(e);
    const std::uint32_t first = strand.firstEnd + (below ? 0 : strand.aboveCount);
    const std::uint32_t count = below ? strand.aboveCount : strand.belowCount;
    if (count == 0) return {-1, -1};
    std::pair<double, double> places(ranges[first].wanted, ranges[first].wanted);
    for (std::uint32_t i = first; i < first + count; ++i) {
        places.first = std::min(places.first, ranges[i].wanted);
        places.second = std::max(places.second, ranges[i].wanted);
    }
    return places;
}

}  // namespace olvane::charts
