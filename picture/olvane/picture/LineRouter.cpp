// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Rows, plan, tracks, places of rows and tracks, pieces: in this order, since each needs the one before.

#include <olvane/picture/LineRouter.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <limits>
#include <numeric>
#include <utility>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>
#include <olvane/picture/ChannelTracksInternal.h>
#include <olvane/picture/RoutePiecesInternal.h>
#include <olvane/picture/RoutePlanInternal.h>
#include <olvane/picture/RowsInternal.h>

namespace olvane::picture {

namespace {

constexpr double kLeastTrack = 2.125;  // points between tracks where rows are not moved

using kin::at;

// To an eighth of a point, so that places are short in every notation and exact in binary.
double snapped(double place) {
    return std::round(place * 8) / 8;
}

class LineRouter {
public:
    LineRouter(Picture& picture, const RouteOptions& options)
        : picture_(picture), options_(options), frame_(options.direction) {}

    void route() {
        picture_.childKinds.resize(picture_.members.size(), kin::ChildKind::birth);
        rows_ = rowsOf(picture_, frame_);
        plan_ = planRoutes(picture_, rows_);
        mergeStraightLines();
        const TrackUse use = assignTracks(plan_, trackRoom());
        placeRows(use);
        placeTracks(use);
        dropCrowdedFamilies(use);
        writePieces(plan_, {frame_, shift_, dropped_}, picture_);
        addMarks();
    }

private:
    std::size_t rowCount() const { return rows_.rows.size(); }

    // A bar without length joins one piece from above with one from below: they become one piece, which
    // belongs to the child where the lower one does.
    void mergeStraightLines() {
        std::vector<std::vector<Index>> ending(plan_.bars.size());
        std::vector<std::vector<Index>> starting(plan_.bars.size());
        for (std::size_t v = 0; v < plan_.verticals.size(); ++v) {
            const Vertical& vertical = plan_.verticals[v];
            if (isPointBar(vertical.bottom)) ending[at(vertical.bottom.bar)].push_back(static_cast<Index>(v));
            if (isPointBar(vertical.top)) starting[at(vertical.top.bar)].push_back(static_cast<Index>(v));
        }
        std::vector<Index> order(plan_.bars.size());
        std::iota(order.begin(), order.end(), 0);
        kin::mergeSort(order.begin(), order.end(), [this](Index a, Index b) {
            return std::pair(plan_.bars[at(a)].channel, a) < std::pair(plan_.bars[at(b)].channel, b);
        });
        for (const Index b : order) {
            if (ending[at(b)].size() == 2 && starting[at(b)].empty()) turnBack(b, ending[at(b)]);
            if (ending[at(b)].size() != 1 || starting[at(b)].size() != 1) continue;
            const Index upper = ending[at(b)][0];
            const Index lower = starting[at(b)][0];
            mergeInto(plan_.verticals[at(upper)], plan_.verticals[at(lower)]);
            plan_.bars[at(b)].isStraight = true;
            const VerticalEnd& end = plan_.verticals[at(upper)].bottom;
            if (isPointBar(end))
                std::replace(ending[at(end.bar)].begin(), ending[at(end.bar)].end(), lower, upper);
        }
    }

    // A drop, and a piece that leads up again at the same place: the latter begins where the drop does.
    void turnBack(Index bar, const std::vector<Index>& verticals) {
        Vertical* drop = &plan_.verticals[at(verticals[0])];
        Vertical* up = &plan_.verticals[at(verticals[1])];
        if (drop->top.row == kNone) std::swap(drop, up);
        if (drop->top.row == kNone) return;
        up->bottom = drop->top;
        drop->isMerged = true;
        plan_.bars[at(bar)].isStraight = true;
    }

    bool isPointBar(const VerticalEnd& end) const {
        return end.bar != kNone && plan_.bars[at(end.bar)].isPoint();
    }

    static void mergeInto(Vertical& upper, Vertical& lower) {
        upper.bottom = lower.bottom;
        if (lower.role == LineRole::stem) {
            upper.role = LineRole::stem;
            upper.child = lower.child;
        }
        lower.isMerged = true;
    }

    // How many tracks each channel has room for.
    std::vector<std::int32_t> trackRoom() const {
        std::vector<std::int32_t> most(rowCount() + 1, std::numeric_limits<std::int32_t>::max());
        if (options_.growGaps) return most;
        for (std::size_t c = 1; c < rowCount(); ++c) {
            const double room = rows_.rows[c].top - rows_.rows[c - 1].bottom;
            most[c] = static_cast<std::int32_t>(std::floor(std::min(room / kLeastTrack, 1e6))) - 1;
        }
        return most;
    }

    // How far each row is moved, so that the tracks above it find room.
    void placeRows(const TrackUse& use) {
        shift_.assign(rowCount(), 0);
        if (!options_.growGaps) return;
        std::vector<std::int32_t> tracks(rowCount() + 1);
        for (std::size_t b = 0; b < plan_.bars.size(); ++b) {
            if (!plan_.bars[b].hasTrack()) continue;
            std::int32_t& most = tracks[at(plan_.bars[b].channel)];
            most = std::max(most, use.tracks[b]);
        }
        for (std::size_t r = 1; r < rowCount(); ++r) {
            const double room = rows_.rows[r].top - rows_.rows[r - 1].bottom;
            const double needed = (tracks[r] + 1) * options_.trackDistance;
            shift_[r] = shift_[r - 1] + (tracks[r] > 0 ? std::max(0.0, std::ceil(needed - room)) : 0.0);
        }
        for (std::size_t i = 0; i < picture_.boxes.size(); ++i) {
            frame_.moveAlong(picture_.boxes[i], shift_[at(rows_.rowOf[i])]);
        }
    }

    double topOf(std::size_t r) const { return rows_.rows[r].top + shift_[r]; }
    double bottomOf(std::size_t r) const { return rows_.rows[r].bottom + shift_[r]; }

    void placeTracks(const TrackUse& use) {
        for (std::size_t b = 0; b < plan_.bars.size(); ++b) {
            Bar& bar = plan_.bars[b];
            const auto c = at(bar.channel);
            const auto count = static_cast<double>(use.tracks[b]);
            const double track = static_cast<double>(bar.track);
            if (c == 0) {
                bar.y = topOf(0) - options_.trackDistance * (count - track);
            } else if (c == rowCount()) {
                bar.y = bottomOf(c - 1) + options_.trackDistance * (track + 1);
            } else {
                const double room = topOf(c) - bottomOf(c - 1);
                bar.y = bottomOf(c - 1) + snapped(room * (track + 1) / (count + 1));
            }
        }
    }

    // Families with a bar for which the channel has no track get marks instead of lines.
    void dropCrowdedFamilies(const TrackUse& use) {
        dropped_.assign(picture_.families.size(), false);
        const std::vector<std::int32_t> most = trackRoom();
        for (std::size_t b = 0; b < plan_.bars.size(); ++b) {
            const Bar& bar = plan_.bars[b];
            const bool isCrowded = use.tracks[b] > most[at(bar.channel)];
            if (bar.hasTrack() && isCrowded) dropped_[at(bar.family)] = true;
        }
        for (std::size_t f = 0; f < dropped_.size(); ++f) {
            if (dropped_[f]) markFamily(picture_.families[f]);
        }
    }

    void markFamily(const Family& family) {
        const auto parents = picture_.parents(family);
        const Index second = parents.size() > 1 && parents[1] != parents[0] ? parents[1] : kNone;
        if (second != kNone)
            plan_.marks.push_back({{parents[0], second, kNone}, 0, MarkKind::partnersElsewhere});
        for (const Index child : picture_.children(family)) {
            plan_.marks.push_back({{child, parents[0], second}, 0, MarkKind::parentsElsewhere});
        }
    }

    void addMarks() {
        std::int32_t number = 0;
        for (const Mark& mark : picture_.marks) number = std::max(number, mark.number);
        for (Mark mark : plan_.marks) {
            mark.number = ++number;
            picture_.marks.push_back(mark);
        }
    }

    Picture& picture_;
    const RouteOptions& options_;
    RouteFrame frame_;
    Rows rows_;
    RoutePlan plan_;
    std::vector<double> shift_;  // by row
    std::vector<bool> dropped_;  // by family
};

}  // namespace

void routeLines(Picture& picture, const RouteOptions& options) {
    if (picture.isRound()) return;
    LineRouter(picture, options).route();
}

}  // namespace olvane::picture
