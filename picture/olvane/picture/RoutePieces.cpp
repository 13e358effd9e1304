// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// From a plan to lines: pieces in the frame of the router, the bridges where two families cross, and the way to the sheet.

#include <olvane/picture/RoutePiecesInternal.h>

#include <algorithm>
#include <cstddef>
#include <limits>
#include <numeric>
#include <tuple>
#include <utility>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::picture {

namespace {

using kin::at;

constexpr Index kShared = -2;  // of several pieces, or of none of a child

struct Piece {
    Line line;
    Index family = kNone;
    std::vector<double> bridges;
};

// The stretches at the ends of a bar that lead to one child alone: they are pieces of their own, so that they
// can be drawn like the child's stem.
struct ChildEnds {
    Index childLo = kNone;
    Index childHi = kNone;
    double innerLo = std::numeric_limits<double>::infinity();   // the second place from the left
    double innerHi = -std::numeric_limits<double>::infinity();  // the second place from the right
};

class PieceWriter {
public:
    PieceWriter(const RoutePlan& plan, const RoutePlaces& places, Picture& picture)
        : plan_(plan), places_(places), picture_(picture) {}

    void write() {
        addPieces();
        addBridges();
        writePieces();
    }

private:
    double yOf(const VerticalEnd& end) const {
        return end.bar != kNone ? plan_.bars[at(end.bar)].y : end.y + places_.shift[at(end.row)];
    }

    void addPieces() {
        pieceOfRow_.reserve(plan_.rowPieces.size());
        for (const RowPiece& piece : plan_.rowPieces) {
            const double y = piece.y + places_.shift[at(piece.row)];
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

    // Lanes alternate: channel 0, row 0, channel 1, ... A vertical takes part in all between its ends.
    std::size_t laneOf(const VerticalEnd& end) const {
        return end.bar != kNone ? 2 * at(plan_.bars[at(end.bar)].channel) : 2 * at(end.row) + 1;
    }

    void addBridges() {
        std::vector<std::vector<Index>> lanes(2 * places_.shift.size() + 1);
        std::vector<Index> order(plan_.verticals.size());
        std::iota(order.begin(), order.end(), 0);
        kin::mergeSort(order.begin(), order.end(), [this](Index a, Index b) {
            return std::pair(plan_.verticals[at(a)].x, a) < std::pair(plan_.verticals[at(b)].x, b);
        });
        for (const Index v : order) {
            const Vertical& vertical = plan_.verticals[at(v)];
            if (vertical.isMerged || places_.dropped[at(vertical.family)]) continue;
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
        if (places_.dropped[at(family)]) return;
        auto v = std::upper_bound(verticals.begin(), verticals.end(), line.x1,
                                  [this](double x, Index i) { return x < plan_.verticals[at(i)].x; });
        for (; v != verticals.end() && plan_.verticals[at(*v)].x < line.x2; ++v) {
            const Index steep = pieceOfVertical_[at(*v)];
            const Line& other = pieces_[at(steep)].line;
            const auto [low, high] = std::minmax(other.y1, other.y2);
            if (pieces_[at(steep)].family == family || line.y1 <= low || line.y1 >= high) continue;
            if (places_.frame.isSideways()) {
                pieces_[at(steep)].bridges.push_back(places_.frame.turned(other.x1, line.y1).first);
            } else {
                pieces_[at(flat)].bridges.push_back(other.x1);
            }
        }
    }

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
                if (places_.dropped[f]) continue;
                writePiece(pieces_[order[next]]);
                ++family.lineCount;
            }
        }
    }

    void writePiece(Piece& piece) {
        Line line = piece.line;
        std::tie(line.x1, line.y1) = places_.frame.turned(piece.line.x1, piece.line.y1);
        std::tie(line.x2, line.y2) = places_.frame.turned(piece.line.x2, piece.line.y2);
        kin::mergeSort(piece.bridges.begin(), piece.bridges.end());
        if (piece.bridges.size() > 0xFFFF) piece.bridges.resize(0xFFFF);
        line.firstBridge = static_cast<std::uint32_t>(picture_.bridges.size());
        line.bridgeCount = static_cast<std::uint16_t>(piece.bridges.size());
        picture_.bridges.insert(picture_.bridges.end(), piece.bridges.begin(), piece.bridges.end());
        picture_.lines.push_back(line);
    }

    const RoutePlan& plan_;
    const RoutePlaces& places_;
    Picture& picture_;
    std::vector<Piece> pieces_;
    std::vector<Index> pieceOfRow_;
    std::vector<Index> pieceOfVertical_;
    std::vector<std::pair<Index, Index>> barPieces_;  // first piece and how many, by bar
};

}  // namespace

void writePieces(const RoutePlan& plan, const RoutePlaces& places, Picture& picture) {
    PieceWriter(plan, places, picture).write();
}

}  // namespace olvane::picture
