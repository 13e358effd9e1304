// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstddef>
#include <span>
#include <utility>
#include <vector>

#include <olvane/kin/KinGraph.h>
#include <olvane/picture/FamilyMembersInternal.h>
#include <olvane/picture/JoinedGroupsInternal.h>
#include <olvane/picture/Judge.h>
#include <olvane/picture/Picture.h>
#include <olvane/picture/PieceGeometryInternal.h>

namespace olvane::picture {

// Up to this, things are joined; in points.
constexpr double kJoinedDistance = 0.5;

template <class Value>
void keepEachOnce(std::vector<Value>& values) {
    std::sort(values.begin(), values.end());
    values.erase(std::unique(values.begin(), values.end()), values.end());
}

inline Rect rectOf(const Box& box, double margin = 0) {
    return {box.x - margin, box.y - margin, box.x + static_cast<double>(box.width) + margin,
            box.y + static_cast<double>(box.height) + margin};
}

// Finds what is counted by the places of boxes and lines: what lies on one another, what crosses, and whom a family's
// lines do not reach. Pairs of families and boxes are gathered as keys, so that each counts once however often it is
// found.
//
// Holds: the picture outlives it; run() is called once.
class PictureJudge {
public:
    explicit PictureJudge(const Picture& picture);

    void run(Judgement& judgement);
    std::vector<Finding> findings() const;  // after run()

private:
    using Pair = std::pair<Index, Index>;

    // The space between two boxes of a couple that stand in one row or column.
    struct CoupleStrip {
        Rect rect;
        Index one = kNone;
        Index other = kNone;
        bool isFree = true;
    };

    // Of a round chart, with its beginning in [0, 360).
    struct Cell {
        double from = 0;
        double to = 0;
        Index box = kNone;
    };

    static Pair ordered(Index a, Index b) { return {std::min(a, b), std::max(a, b)}; }

    // JudgeCouples.cpp
    void listCouples();
    void addStrip(Index one, Index other);

    // JudgeCollisions.cpp
    void sweep();
    void judgePair(std::size_t i, std::size_t j);
    void judgeBoxes(Index i, Index j);
    void judgeBoxAndLine(Index box, std::size_t line);
    void judgeLines(std::size_t i, std::size_t j);
    bool touchOutsideSharedBoxes(const Line& a, const Line& b, std::size_t f, std::size_t g) const;
    bool inSharedBox(const Point& p, std::size_t f, std::size_t g) const;
    void judgeStrip(Index box, CoupleStrip& strip) const;

    // JudgeCells.cpp
    void judgeCells();
    void judgeRing(std::vector<Cell>& cells);
    void joinCells(std::size_t f);
    bool cellsBorder(Index a, Index b, int ringsApart = 1) const;
    Cell cellOf(Index box) const;

    // JudgeUnjoined.cpp
    void listUnjoined();
    std::size_t mainGroup(std::size_t f);
    std::vector<Pair> markedMembers() const;
    std::vector<std::vector<std::size_t>> marksByFirstBox() const;
    bool isMarked(const Mark& mark, const Family& family, std::span<const Index> parents, Index member) const;

    void countPairs(Judgement& judgement);

    const Picture& picture_;
    FamilyMembers members_;
    JoinedGroups groups_;  // lines, then members
    std::vector<Index> familyOfLine_;
    std::vector<Pair> couples_;
    std::vector<CoupleStrip> strips_;
    std::vector<Pair> overlaps_;
    std::vector<Pair> hits_;
    std::vector<Pair> crossings_;
    std::vector<Pair> tracks_;
    std::vector<Pair> touches_;
    std::vector<Pair> unjoined_;
};

// JudgePersons.cpp
void countPersons(const Picture& picture, Judgement& judgement);
void countMarks(const Picture& picture, Judgement& judgement);

// JudgeSizes.cpp
void measure(const Picture& picture, Judgement& judgement);

// Known relations of shown persons that no family and no mark states. JudgeRelations.cpp
std::size_t countUntold(const Picture& picture, const kin::KinGraph& known);

}  // namespace olvane::picture
