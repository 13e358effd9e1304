// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Each step of a way is a walk over the lines of one family, breadth first from the pieces that touch the one box to
// a piece that touches the other. All steps of a way become one set of pieces, in which what lies on one line is
// joined, so that dashes are drawn once wherever the way comes and goes by the same line. What enough nearer ways take
// already is cut from that set: a bundle of all of them would be wider than the room between two boxes.

#include <olvane/picture/shared/WayLines.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <tuple>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>
#include <olvane/picture/PieceGeometryInternal.h>

namespace olvane::picture {

namespace {

constexpr double kNear = 0.01;       // points
constexpr double kSideBySide = 2.5;  // points between ways that share a line
constexpr double kIntoBox = 6;       // points that a way reaches into a box
constexpr int kMostTogether = 3;     // ways that are drawn along one stretch of a line

using kin::at;

// A part of a horizontal or vertical line.
struct Part {
    bool isUpright = false;
    double across = 0;  // x of an upright part, y of a level one
    double from = 0;
    double to = 0;
};

bool isBefore(const Part& a, const Part& b) {
    return std::tie(a.isUpright, a.across, a.from, a.to) < std::tie(b.isUpright, b.across, b.from, b.to);
}

bool isOnOneLine(const Part& a, const Part& b) {
    return a.isUpright == b.isUpright && std::abs(a.across - b.across) < kNear;
}

Part partBetween(const Point& a, const Point& b) {
    if (std::abs(a.x - b.x) < kNear) return {true, a.x, std::min(a.y, b.y), std::max(a.y, b.y)};
    return {false, a.y, std::min(a.x, b.x), std::max(a.x, b.x)};
}

void sortParts(std::vector<Part>& parts) {
    kin::mergeSort(parts.begin(), parts.end(), [](const Part& a, const Part& b) { return isBefore(a, b); });
}

// Sorted, and what touches on one line made one.
std::vector<Part> joined(std::vector<Part> parts) {
    sortParts(parts);
    std::vector<Part> result;
    for (const Part& part : parts) {
        if (!result.empty() && isOnOneLine(result.back(), part) && part.from <= result.back().to + kNear) {
            result.back().to = std::max(result.back().to, part.to);
        } else {
            result.push_back(part);
        }
    }
    return result;
}

bool overlap(const std::vector<Part>& one, const std::vector<Part>& other) {
    return std::any_of(one.begin(), one.end(), [&other](const Part& a) {
        return std::any_of(other.begin(), other.end(), [&a](const Part& b) {
            return isOnOneLine(a, b) && std::min(a.to, b.to) - std::max(a.from, b.from) > kNear;
        });
    });
}

// Where two pieces meet that touch one another.
Point meeting(const Line& a, const Line& b) {
    const bool isUpright = a.x1 == a.x2;
    if (isUpright != (b.x1 == b.x2)) return isUpright ? Point{a.x1, b.y1} : Point{b.x1, a.y1};
    return distance(startOf(a), b) < kNear ? startOf(a) : endOf(a);
}

class WayTracer {
public:
    explicit WayTracer(Picture& picture) : picture_(picture), familiesOf_(picture.boxes.size()) {
        for (std::size_t f = 0; f < picture.families.size(); ++f) {
            const Family& family = picture.families[f];
            for (std::uint32_t i = 0; i < family.parentCount + family.childCount; ++i) {
                familiesOf_[at(picture.members[family.firstMember + i])].push_back(f);
            }
        }
    }

    std::vector<Part> partsOf(const Way& way) {
        parts_.clear();
        const auto boxes = picture_.boxesOf(way);
        for (std::size_t i = 1; i < boxes.size(); ++i) addStep(boxes[i - 1], boxes[i]);
        return joined(std::move(parts_));
    }

private:
    void addStep(Index from, Index to) {
        if (from == kNone || to == kNone || from == to) return;
        for (const std::size_t f : familiesOf_[at(from)]) {
            const Family& family = picture_.families[f];
            if (joins(family, from, to) && addWalk(picture_.linesOf(family), from, to)) return;
        }
    }

    // Whether it makes the two partners, or parent and child: siblings are joined over a parent.
    bool joins(const Family& family, Index from, Index to) const {
        const auto parents = picture_.parents(family);
        const auto children = picture_.children(family);
        const auto has = [](std::span<const Index> boxes, Index box) {
            return std::find(boxes.begin(), boxes.end(), box) != boxes.end();
        };
        return has(parents, from) ? has(parents, to) || has(children, to)
                                  : has(parents, to) && has(children, from);
    }

    // The end of a line at a box; null where it has none there.
    const Box& box(Index place) const { return picture_.boxes[at(place)]; }
    bool touches(const Line& line, Index place) const {
        return boxHolds(box(place), startOf(line), kNear) || boxHolds(box(place), endOf(line), kNear);
    }
    Point endAt(const Line& line, Index place) const {
        return boxHolds(box(place), startOf(line), kNear) ? startOf(line) : endOf(line);
    }

    bool addWalk(std::span<const Line> lines, Index from, Index to) {
        before_.assign(lines.size(), kUnseen);
        queue_.clear();
        for (std::size_t i = 0; i < lines.size(); ++i) {
            if (!touches(lines[i], from)) continue;
            before_[i] = i;
            queue_.push_back(i);
        }
        for (std::size_t next = 0; next < queue_.size(); ++next) {
            const std::size_t piece = queue_[next];
            if (touches(lines[piece], to)) {
                addBack(lines, piece, from, to);
                return true;
            }
            for (std::size_t i = 0; i < lines.size(); ++i) {
                if (before_[i] != kUnseen || distance(lines[piece], lines[i]) > kNear) continue;
                before_[i] = piece;
                queue_.push_back(i);
            }
        }
        return false;
    }

    // The walk that ends with that piece, from its end.
    void addBack(std::span<const Line> lines, std::size_t piece, Index from, Index to) {
        Point last = endAt(lines[piece], to);
        addReach(lines[piece], last);
        while (before_[piece] != piece) {
            const Point corner = meeting(lines[piece], lines[before_[piece]]);
            addPart(last, corner);
            last = corner;
            piece = before_[piece];
        }
        const Point first = endAt(lines[piece], from);
        addPart(last, first);
        addReach(lines[piece], first);
    }

    void addPart(const Point& a, const Point& b) {
        if (std::abs(a.x - b.x) >= kNear || std::abs(a.y - b.y) >= kNear) {
            parts_.push_back(partBetween(a, b));
        }
    }

    // On beyond an end of the line, into the box there.
    void addReach(const Line& line, const Point& end) {
        const bool isStart = end.x == line.x1 && end.y == line.y1;
        const double dx = isStart ? line.x1 - line.x2 : line.x2 - line.x1;
        const double dy = isStart ? line.y1 - line.y2 : line.y2 - line.y1;
        const auto step = [](double d) { return d > 0 ? kIntoBox : d < 0 ? -kIntoBox : 0; };
        addPart(end, {end.x + step(dx), end.y + step(dy)});
    }

    static constexpr std::size_t kUnseen = static_cast<std::size_t>(-1);

    Picture& picture_;
    std::vector<std::vector<std::size_t>> familiesOf_;
    std::vector<Part> parts_;
    std::vector<std::size_t> before_;  // by piece: from which it was reached; itself at the start
    std::vector<std::size_t> queue_;
};

// What is left of a part where fewer than kMostTogether of the earlier ways run.
void addUncrowded(const Part& part, const std::vector<std::vector<Part>>& earlier, std::vector<Part>& left) {
    std::vector<Part> edges;  // across: where another way begins, with from = 1, or ends, with -1
    for (const std::vector<Part>& way : earlier) {
        for (const Part& other : way) {
            const double from = std::max(part.from, other.from);
            const double to = std::min(part.to, other.to);
            if (!isOnOneLine(part, other) || to - from <= kNear) continue;
            edges.push_back({false, from, 1, 0});
            edges.push_back({false, to, -1, 0});
        }
    }
    sortParts(edges);
    edges.push_back({false, part.to, kMostTogether, 0});
    int together = 0;
    double from = part.from;
    for (const Part& edge : edges) {
        const bool wasFree = together < kMostTogether;
        together += static_cast<int>(edge.from);
        if (wasFree == (together < kMostTogether)) continue;
        if (wasFree && edge.across - from > kNear)
            left.push_back({part.isUpright, part.across, from, edge.across});
        from = edge.across;
    }
}

std::vector<Part> uncrowded(const std::vector<Part>& parts, const std::vector<std::vector<Part>>& earlier) {
    std::vector<Part> left;
    for (const Part& part : parts) addUncrowded(part, earlier, left);
    return left;
}

// 0, then in turns on both sides.
double shiftOf(std::size_t lane) {
    const double steps = std::floor((static_cast<double>(lane) + 1) / 2);
    return (lane % 2 == 1 ? steps : -steps) * kSideBySide;
}

std::size_t freeLane(const std::vector<std::vector<Part>>& parts, const std::vector<std::size_t>& lanes,
                     const std::vector<Part>& added) {
    std::vector<bool> isTaken(lanes.size() + 1, false);
    for (std::size_t i = 0; i < lanes.size(); ++i) {
        if (overlap(parts[i], added)) isTaken[lanes[i]] = true;
    }
    return static_cast<std::size_t>(std::find(isTaken.begin(), isTaken.end(), false) - isTaken.begin());
}

}  // namespace

void addWayLines(Picture& picture) {
    WayTracer tracer(picture);
    std::vector<std::vector<Part>> parts;
    std::vector<std::size_t> lanes;
    picture.wayPieces.clear();
    for (Way& way : picture.ways) {
        std::vector<Part> own = uncrowded(tracer.partsOf(way), parts);
        lanes.push_back(freeLane(parts, lanes, own));
        const double shift = shiftOf(lanes.back());
        way.firstPiece = static_cast<std::uint32_t>(picture.wayPieces.size());
        way.pieceCount = static_cast<std::uint32_t>(own.size());
        for (const Part& part : own) {
            const double across = part.across + shift;
            const double from = part.from + shift;
            const double to = part.to + shift;
            picture.wayPieces.push_back(part.isUpright ? WayPiece{across, from, across, to}
                                                       : WayPiece{from, across, to, across});
        }
        parts.push_back(std::move(own));
    }
}

}  // namespace olvane::picture
