// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <vector>

#include <olvane/kin/KinGraph.h>

namespace olvane::picture {

// A place in one of the lists of a Picture; kNone where there is nothing.
using Index = std::int32_t;
constexpr Index kNone = -1;

enum class BoxKind : std::uint8_t { person, unknownParent };

// One box. In a round chart its place is that of `arcs`, and x, y, width and height are those of the smallest
// upright rectangle around it.
//
// Units: points; x grows right, y grows down, (x, y) is the upper-left corner.
// Holds: id is 0 for an unknown parent, and childOf is then the box whose parent it is. repeat is 0 for a
//        person with one box; else it counts the person's boxes from 1, the nearest to the focus first.
struct Box {
    std::int64_t id = 0;
    double x = 0;
    double y = 0;
    float width = 0;
    float height = 0;
    Index childOf = kNone;
    std::int32_t repeat = 0;
    // Relatives without a box.
    std::int32_t hiddenParents = 0;
    std::int32_t hiddenPartners = 0;
    std::int32_t hiddenChildren = 0;
    // Families that the person is a child of, beside the one that comes first, of whose partners none has a box.
    std::int32_t furtherParents = 0;
    BoxKind kind = BoxKind::person;
    kin::Sex sex = kin::Sex::unknown;
    bool hasFlag = false;  // the view is one of the engine's, and flag is its own
    bool flag = false;
};

// A box of a round chart: a piece of a ring, clockwise from the top, in degrees. Ring 0 is the middle.
// line is the box at which its line of descent begins: that of a grandparent, or in a chart of descendants, of a
// child of the middle; kNone for boxes nearer to the middle.
struct Arc {
    std::int32_t ring = 0;
    double from = 0;
    double to = 0;
    Index line = kNone;
};

enum class LineRole : std::uint8_t { marriage, drop, bar, stem, link };

// A straight piece of the lines of a family: horizontal or vertical, save in round charts.
//
// Units: points. Its bridges, in Picture::bridges, are places on the piece where it jumps over another family's
//        line: the x of each on a horizontal piece, the y on a vertical one.
struct Line {
    double x1 = 0;
    double y1 = 0;
    double x2 = 0;
    double y2 = 0;
    Index child = kNone;  // the box of the child that the piece belongs to alone
    std::uint32_t firstBridge = 0;
    std::uint16_t bridgeCount = 0;
    LineRole role = LineRole::link;
};

// A family of which two members are shown.
//
// Holds: parents are one or two boxes, father or husband first; members lie in Picture::members, parents, then
//        children, and childKinds beside them; lines in Picture::lines. number is the data source's own number
//        of the family, 0 without one.
struct Family {
    std::uint32_t firstMember = 0;
    std::uint32_t firstLine = 0;
    std::uint32_t childCount = 0;
    std::uint32_t lineCount = 0;
    std::uint32_t number = 0;
    std::uint8_t parentCount = 0;
    kin::UnionState style = kin::UnionState::unknown;
};

enum class MarkKind : std::uint8_t { samePerson, parentsElsewhere, partnersElsewhere };

// What is expressed without a line. samePerson: two boxes of one person; parentsElsewhere: a child and the one
// or two parents whose family is drawn elsewhere; partnersElsewhere: two partners.
// Marks of the same number, from 1, are shown by the same sign at each of their boxes.
struct Mark {
    Index boxes[3] = {kNone, kNone, kNone};
    std::int32_t number = 0;
    MarkKind kind = MarkKind::samePerson;
};

// The relatives of one person in one direction: ancestors, descendants, or partners and siblings with theirs.
enum class Branch : std::uint8_t { up, down, beside };

enum class Side : std::uint8_t { top, right, bottom, left };

constexpr Side opposite(Side side) {
    switch (side) {
        case Side::top:
            return Side::bottom;
        case Side::right:
            return Side::left;
        case Side::bottom:
            return Side::top;
        case Side::left:
            return Side::right;
    }
    return side;
}

// A branch that was asked to be left out: count persons, 1 or more, would have boxes with it. They would stand on that
// side of the box.
struct FoldedBranch {
    Index box = kNone;
    std::int32_t count = 0;
    Branch branch = Branch::down;
    Side side = Side::bottom;
};

// How two persons are related by a way that a picture shows.
enum class WayKind : std::uint8_t { blood, legal, marriage };

// A way from one person to another.
//
// Holds: its boxes lie in Picture::wayBoxes, from the one person to the other; behind them, the common ancestors at
//        its top, one or both of a couple. A way by marriage has none. Its lines lie in Picture::wayPieces.
struct Way {
    std::uint32_t firstBox = 0;
    std::uint32_t boxCount = 0;
    std::uint32_t ancestorCount = 0;
    std::uint32_t firstPiece = 0;
    std::uint32_t pieceCount = 0;
    WayKind kind = WayKind::blood;
    std::string words;  // what the other person is to the focus by this way alone: "first cousin"
};

// A straight piece of the line of a way, in points: horizontal or vertical. It runs along the lines of families, or
// beside them where several ways take the same line, and reaches into the boxes at its ends.
struct WayPiece {
    double x1 = 0;
    double y1 = 0;
    double x2 = 0;
    double y2 = 0;
};

// What is drawn, as data: boxes, families and the lines of each family. Every view ends in one.
//
// Holds: places are valid; boxes stand in a stable order; a family's members, kinds and lines lie side by
//        side. A value: copies are deep.
struct Picture {
    std::string view;
    Index focus = kNone;
    std::vector<Box> boxes;
    std::vector<Arc> arcs;  // one for each box of a round chart, else empty
    // Of a round chart: ring i reaches from ringRadii[i] to ringRadii[i + 1], around the middle.
    std::vector<double> ringRadii;
    double middleX = 0;
    double middleY = 0;
    std::vector<Family> families;
    std::vector<Index> members;
    std::vector<kin::ChildKind> childKinds;  // beside members; of no meaning at a parent
    std::vector<Line> lines;
    std::vector<double> bridges;
    std::vector<Mark> marks;
    std::vector<FoldedBranch> folded;
    // Of a picture of kinship: the other person, the ways, those by blood first, and in words what the focus is to
    // the other person and the other one to the focus; empty where no way is known.
    Index other = kNone;
    std::vector<Way> ways;
    std::vector<Index> wayBoxes;
    std::vector<WayPiece> wayPieces;
    std::string focusIs;
    std::string otherIs;

    bool isRound() const { return !arcs.empty(); }
    std::span<const Index> parents(const Family& f) const {
        return {members.data() + f.firstMember, f.parentCount};
    }
    std::span<const Index> children(const Family& f) const {
        return {members.data() + f.firstMember + f.parentCount, f.childCount};
    }
    std::span<const kin::ChildKind> kinds(const Family& f) const {
        return {childKinds.data() + f.firstMember + f.parentCount, f.childCount};
    }
    std::span<const Line> linesOf(const Family& f) const { return {lines.data() + f.firstLine, f.lineCount}; }
    std::span<const Index> boxesOf(const Way& way) const {
        return {wayBoxes.data() + way.firstBox, way.boxCount};
    }
    std::span<const Index> ancestorsOf(const Way& way) const {
        return {wayBoxes.data() + way.firstBox + way.boxCount, way.ancestorCount};
    }
    std::span<const WayPiece> piecesOf(const Way& way) const {
        return {wayPieces.data() + way.firstPiece, way.pieceCount};
    }
    std::span<const double> bridgesOf(const Line& line) const {
        return {bridges.data() + line.firstBridge, line.bridgeCount};
    }
};

}  // namespace olvane::picture
