// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Rows, plan, tracks, places of the tracks, pieces, bridges: in this order, since each needs the one before.

#include <olvane/picture/LineRouter.h>

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <limits>
#include <numeric>
#include <tuple>
#include <utility>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>
#include <olvane/picture/ChannelTracksInternal.h>
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
        addPieces();
        addBridges();
        writePieces();
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

    double yOf(const VerticalEnd& end) const {
        return end.bar != kNone ? plan_.bars[at(end.bar)].y : end.y + shift_[at(end.row)];
    }

    // --- pieces, in the frame of the router

    struct Piece {
        Line line;
        Index family = kNone;
        std::vector<double> bridges;
    };

    void addPieces() {
        pieceOfRow_.reserve(plan_.rowPieces.size());
        for (const RowPiece& piece : plan_.rowPieces) {
            const double y = piece.y + shift_[at(piece.row)];
            pieceOfRow_.push_back(
                addPiece(piece.family, {piece.x1, y, piece.x2, y, kNone, 0, 0, LineRole::marriage}));
        }
        for (std::size_t v = 0; v < plan_.verticals.size(); ++v) {
            const Vertical& vertical = plan_.verticals[v];
            if (vertical.isMerged) {
                pieceOfVertical_.push_back(kNone);
                continue;
            }
            pieceOfVertical_.push_back(
                addPiece(vertical.family, {vertical.x, yOf(vertical.top), vertical.x, yOf(vertical.bottom),
                                           vertical.child, 0, 0, vertical.role}));
        }
        const std::vector<ChildEnds> ends = childEnds();
        for (std::size_t b = 0; b < plan_.bars.size(); ++b) addBar(plan_.bars[b], ends[b]);
    }

    Index addPiece(Index family, const Line& line) {
        const auto place = static_cast<Index>(pieces_.size());
        pieces_.push_back({line, family, {}});
        return place;
    }

    // The stretches at the ends of a bar that lead to one child alone: they are pieces of their own, so that they
    // can be drawn like the child's stem.
    struct ChildEnds {
        Index childLo = kNone;
        Index childHi = kNone;
        double innerLo = std::numeric_limits<double>::infinity();   // the second place from the left
        double innerHi = -std::numeric_limits<double>::infinity();  // the second place from the right
    };

    std::vector<ChildEnds> childEnds() const {
        std::vector<ChildEnds> ends(plan_.bars.size());
        for (const Vertical& v : plan_.verticals) {
            if (v.isMerged) continue;
            for (const VerticalEnd& end : {v.top, v.bottom}) {
                if (end.bar == kNone) continue;
                const Bar& bar = plan_.bars[at(end.bar)];
                ChildEnds& e = ends[at(end.bar)];
                const bool isStem = v.role == LineRole::stem;
                if (v.x > bar.lo) e.innerLo = std::min(e.innerLo, v.x);
                if (v.x < bar.hi) e.innerHi = std::max(e.innerHi, v.x);
                if (v.x == bar.lo) e.childLo = isStem && e.childLo == kNone ? v.child : kShared;
                if (v.x == bar.hi) e.childHi = isStem && e.childHi == kNone ? v.child : kShared;
            }
        }
        return ends;
    }

    static constexpr Index kShared = -2;  // of several pieces, or of none of a child

    void addBar(const Bar& bar, const ChildEnds& ends) {
        barPieces_.emplace_back(static_cast<Index>(pieces_.size()), 0);
        if (bar.isPoint()) return;
        double lo = bar.lo;
        double hi = bar.hi;
        const auto add = [&](double x1, double x2, Index child) {
            addPiece(bar.family, {x1, bar.y, x2, bar.y, child, 0, 0, bar.role});
            ++barPieces_.back().second;
        };
        if (ends.childLo >= 0 && ends.innerLo <= hi) {
            add(lo, ends.innerLo, ends.childLo);
            lo = ends.innerLo;
        }
        const bool splitsHi = ends.childHi >= 0 && ends.innerHi >= lo && lo < hi;
        if (splitsHi) hi = ends.innerHi;
        if (lo < hi) add(lo, hi, kNone);
        if (splitsHi) add(hi, bar.hi, ends.childHi);
    }

    // --- bridges: what lies flat on the sheet jumps

    // Lanes alternate: channel 0, row 0, channel 1, ... A vertical takes part in all between its ends.
    std::size_t laneOf(const VerticalEnd& end) const {
        return end.bar != kNone ? 2 * at(plan_.bars[at(end.bar)].channel) : 2 * at(end.row) + 1;
    }

    void addBridges() {
        std::vector<std::vector<Index>> lanes(2 * rowCount() + 1);
        std::vector<Index> order(plan_.verticals.size());
        std::iota(order.begin(), order.end(), 0);
        kin::mergeSort(order.begin(), order.end(), [this](Index a, Index b) {
            return std::pair(plan_.verticals[at(a)].x, a) < std::pair(plan_.verticals[at(b)].x, b);
        });
        for (const Index v : order) {
            const Vertical& vertical = plan_.verticals[at(v)];
            if (vertical.isMerged || dropped_[at(vertical.family)]) continue;
            const std::size_t from = laneOf(vertical.top);
            const std::size_t to = laneOf(vertical.bottom);
            for (std::size_t lane = std::min(from, to); lane <= std::max(from, to); ++lane)
                lanes[lane].push_back(v);
        }
        for (std::size_t b = 0; b < plan_.bars.size(); ++b) {
            const auto& [first, count] = barPieces_[b];
            for (Index i = first; i < first + count; ++i) cross(i, lanes[2 * at(plan_.bars[b].channel)]);
        }
        for (std::size_t i = 0; i < plan_.rowPieces.size(); ++i) {
            cross(pieceOfRow_[i], lanes[2 * at(plan_.rowPieces[i].row) + 1]);
        }
    }

    void cross(Index flat, const std::vector<Index>& verticals) {
        const Line line = pieces_[at(flat)].line;
        const Index family = pieces_[at(flat)].family;
        if (dropped_[at(family)]) return;
        auto v = std::upper_bound(verticals.begin(), verticals.end(), line.x1,
                                  [this](double x, Index i) { return x < plan_.verticals[at(i)].x; });
        for (; v != verticals.end() && plan_.verticals[at(*v)].x < line.x2; ++v) {
            const Index steep = pieceOfVertical_[at(*v)];
            const Line& other = pieces_[at(steep)].line;
            const auto [low, high] = std::minmax(other.y1, other.y2);
            if (pieces_[at(steep)].family == family || line.y1 <= low || line.y1 >= high) continue;
            if (frame_.isSideways()) {
                pieces_[at(steep)].bridges.push_back(frame_.turned(other.x1, line.y1).first);
            } else {
                pieces_[at(flat)].bridges.push_back(other.x1);
            }
        }
    }

    // --- to the sheet

    void writePieces() {
        picture_.lines.clear();
        picture_.bridges.clear();
        std::vector<std::size_t> order(pieces_.size());
        std::iota(order.begin(), order.end(), std::size_t{0});
        kin::mergeSort(order.begin(), order.end(), [this](std::size_t a, std::size_t b) {
            return pieces_[a].family < pieces_[b].family;
        });
        for (Family& family : picture_.families) family.lineCount = 0;
        std::size_t next = 0;
        for (std::size_t f = 0; f < picture_.families.size(); ++f) {
            Family& family = picture_.families[f];
            family.firstLine = static_cast<std::uint32_t>(picture_.lines.size());
            for (; next < order.size() && at(pieces_[order[next]].family) == f; ++next) {
                if (dropped_[f]) continue;
                writePiece(pieces_[order[next]]);
                ++family.lineCount;
            }
        }
    }

    void writePiece(Piece& piece) {
        Line line = piece.line;
        std::tie(line.x1, line.y1) = frame_.turned(piece.line.x1, piece.line.y1);
        std::tie(line.x2, line.y2) = frame_.turned(piece.line.x2, piece.line.y2);
        kin::mergeSort(piece.bridges.begin(), piece.bridges.end());
        if (piece.bridges.size() > 0xFFFF) piece.bridges.resize(0xFFFF);
        line.firstBridge = static_cast<std::uint32_t>(picture_.bridges.size());
        line.bridgeCount = static_cast<std::uint16_t>(piece.bridges.size());
        picture_.bridges.insert(picture_.bridges.end(), piece.bridges.begin(), piece.bridges.end());
        picture_.lines.push_back(line);
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
    std::vector<Piece> pieces_;
    std::vector<Index> pieceOfRow_;
    std::vector<Index> pieceOfVertical_;
    std::vector<std::pair<Index, Index>> barPieces_;  // first piece and how many, by bar
};

}  // namespace

void routeLines(Picture& picture, const RouteOptions& options) {
    if (picture.isRound()) return;
    LineRouter(picture, options).route();
}

}  // namespace olvane::picture
