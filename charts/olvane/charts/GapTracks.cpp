// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/GapTracksInternal.h>

#include <algorithm>
#include <cmath>
#include <limits>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

constexpr double kMargin = 4;                // between lines of different families that could touch
constexpr std::size_t kMostNeighbours = 64;  // without drawn children, looked at in vain

// What stands on the top edge of a box.
constexpr std::uint8_t kMiddle = 1;
constexpr std::uint8_t kLeft = 2;
constexpr std::uint8_t kRight = 4;
constexpr std::uint8_t kOverLine = 8;

std::uint8_t placeOnTop(std::int8_t shift) {
    return shift == 0 ? kMiddle : shift < 0 ? kLeft : kRight;
}

}  // namespace

GapTracks::GapTracks(Plan& plan) : plan_(plan) {
    std::int32_t last = 0;
    for (const Household& household : plan.households) {
        firstRow_ = std::min(firstRow_, household.row);
        last = std::max(last, household.row);
    }
    bars_.assign(at(last - firstRow_) + 1, 0);
    overLines_ = bars_;
    for (const PlannedFamily& family : plan.families) {
        if (family.coupleLine != CoupleLine::over) continue;
        std::int32_t& lines = overLines_[rowOf(family)];
        lines = std::max<std::int32_t>(lines, family.overHeight);
    }
    gatherSpans();
}

// Families with children by row, from left to right. In a plain tree they are in that order already.
void GapTracks::gatherSpans() {
    start_.assign(bars_.size() + 1, 0);
    const auto matters = [this](Index f) {
        return plan_.families[at(f)].hasDrop && plan_.families[at(f)].firstLink < plan_.linkEnd(f);
    };
    const Index families = static_cast<Index>(plan_.families.size());
    for (Index f = 0; f < families; ++f) {
        if (matters(f)) ++start_[rowOf(plan_.families[at(f)]) + 1];
    }
    for (std::size_t row = 1; row < start_.size(); ++row) start_[row] += start_[row - 1];
    spans_.resize(start_.back());
    std::vector<std::size_t> next(start_.begin(), start_.end() - 1);
    for (Index f = 0; f < families; ++f) {
        if (!matters(f)) continue;
        const PlannedFamily& family = plan_.families[at(f)];
        Span span{f, dropOf(plan_, family), std::numeric_limits<double>::infinity(),
                  -std::numeric_limits<double>::infinity()};
        for (std::uint32_t link = family.firstLink; link < plan_.linkEnd(f); ++link) {
            if (!plan_.links[link].drawn) continue;
            const double stem = stemOf(plan_, plan_.links[link]);
            span.from = std::min(span.from, stem);
            span.to = std::max(span.to, stem);
        }
        spans_[next[rowOf(family)]++] = span;
    }
    const auto isLeft = [](const Span& a, const Span& b) { return a.drop < b.drop; };
    for (std::size_t row = 0; row + 1 < start_.size(); ++row) {
        const auto first = spans_.begin() + static_cast<std::ptrdiff_t>(start_[row]);
        const auto end = spans_.begin() + static_cast<std::ptrdiff_t>(start_[row + 1]);
        if (!std::is_sorted(first, end, isLeft)) kin::mergeSort(first, end, isLeft);
    }
}

void GapTracks::addShortLinks(double reach) {
    std::vector<Candidate> candidates;
    gatherCandidates(reach, candidates);
    if (candidates.empty()) return;
    topUsed_.assign(plan_.persons.size(), 0);
    for (const ChildLink& link : plan_.links) {
        if (link.drawn) topUsed_[at(plan_.boxOf[at(link.child)])] |= placeOnTop(link.shift);
    }
    for (const PlannedFamily& family : plan_.families) {
        if (family.coupleLine != CoupleLine::over) continue;
        for (const Index box : family.parents) topUsed_[at(box)] |= kOverLine;
    }
    kin::mergeSort(candidates.begin(), candidates.end(), [](const Candidate& a, const Candidate& b) {
        return a.length != b.length ? a.length < b.length : a.link < b.link;
    });
    for (const Candidate& candidate : candidates) take(candidate);
}

void GapTracks::gatherCandidates(double reach, std::vector<Candidate>& candidates) const {
    for (std::size_t row = 0; row + 1 < start_.size(); ++row) {
        for (std::size_t i = start_[row]; i < start_[row + 1]; ++i) {
            const Index f = spans_[i].family;
            const std::int32_t below = plan_.households[at(plan_.families[at(f)].household)].row + 1;
            for (std::uint32_t link = plan_.families[at(f)].firstLink; link < plan_.linkEnd(f); ++link) {
                if (plan_.links[link].drawn) continue;
                const Index box = plan_.childBox(link);
                if (plan_.households[at(plan_.householdOf[at(box)])].row != below) continue;
                if (plan_.isCovered[at(box)]) continue;
                const double stem = stemOf(plan_, plan_.links[link]);
                const Span& span = spans_[i];
                const double left = std::min(span.drop, span.from);
                const double right = std::max(span.drop, span.to);
                const double length = std::max({0.0, left - stem, stem - right});
                if (length > reach) continue;
                candidates.push_back({length, link, f, static_cast<std::uint32_t>(i)});
            }
        }
    }
}

// Beside a stem that is there already, on the side that the line comes from.
std::int8_t GapTracks::shiftFor(const Candidate& candidate) const {
    const Index box = plan_.childBox(candidate.link);
    if ((topUsed_[at(box)] & ~kOverLine) == 0) return 0;
    const double stem = stemOf(plan_, plan_.links[candidate.link]);
    return spans_[candidate.place].drop < stem ? static_cast<std::int8_t>(-kStemShift) : kStemShift;
}

void GapTracks::take(const Candidate& candidate) {
    ChildLink& link = plan_.links[candidate.link];
    const Index box = plan_.childBox(candidate.link);
    const std::int8_t shift = shiftFor(candidate);
    const std::uint8_t used = topUsed_[at(box)];
    if (shift != 0 && (plan_.boxWidth[at(box)] < kLeastWidthForTwoStems || (used & kOverLine) != 0)) return;
    if ((used & placeOnTop(shift)) != 0) return;
    const double stem = stemOf(plan_, link) + shift;
    if (!canTake(candidate, stem)) return;
    link.drawn = true;
    link.shift = shift;
    topUsed_[at(box)] |= placeOnTop(shift);
    Span& span = spans_[candidate.place];
    span.from = std::min(span.from, stem);
    span.to = std::max(span.to, stem);
}

// Whether all children of earlier families stay to the left, and those of later ones to the right.
bool GapTracks::canTake(const Candidate& candidate, double stem) const {
    const std::size_t row = rowOf(plan_.families[at(candidate.family)]);
    const Span& own = spans_[candidate.place];
    const double from = std::min(own.from, stem);
    const double to = std::max(own.to, stem);
    std::size_t looked = 0;
    for (std::size_t i = candidate.place; i-- > start_[row];) {
        if (spans_[i].from <= spans_[i].to) {
            if (spans_[i].to > from - kMargin) return false;
            break;
        }
        if (++looked > kMostNeighbours) return false;
    }
    looked = 0;
    for (std::size_t i = candidate.place + 1; i < start_[row + 1]; ++i) {
        if (spans_[i].from <= spans_[i].to) {
            if (spans_[i].from < to + kMargin) return false;
            break;
        }
        if (++looked > kMostNeighbours) return false;
    }
    return true;
}

void GapTracks::assignTracks() {
    for (std::size_t row = 0; row + 1 < start_.size(); ++row) bars_[row] = tracksOfRow(row);
}

// From left to right: each leftward bar below the one before that it meets, and those between its children below both;
// then the same from the right.
std::int32_t GapTracks::tracksOfRow(std::size_t row) {
    const std::int32_t leftward = setTracks(row, false);
    return std::max(leftward, setTracks(row, true));
}

// Seen from the other side, places have the other sign.
std::int32_t GapTracks::setTracks(std::size_t row, bool fromRight) {
    constexpr double kFar = std::numeric_limits<double>::infinity();
    std::int32_t most = 0;
    const auto set = [this, &most](const Span& span, std::int32_t track) {
        PlannedFamily& family = plan_.families[at(span.family)];
        family.track = static_cast<std::uint16_t>(std::max<std::int32_t>(family.track, track));
        most = std::max<std::int32_t>(most, family.track + 1);
    };
    double reach = -kFar;
    std::int32_t track = -1;
    const std::size_t count = start_[row + 1] - start_[row];
    for (std::size_t i = 0; i < count; ++i) {
        const Span& span = spans_[fromRight ? start_[row + 1] - 1 - i : start_[row] + i];
        const double from = fromRight ? -span.to : span.from;
        const double to = fromRight ? -span.from : span.to;
        const double drop = fromRight ? -span.drop : span.drop;
        if (!(from <= to) || drop < from) continue;
        const bool meets = reach + kMargin > from;
        if (drop > to) {
            track = meets ? track + 1 : 0;
            reach = drop;
            set(span, track);
        } else {
            set(span, meets ? track + 1 : 0);
        }
    }
    return most;
}

}  // namespace olvane::charts
