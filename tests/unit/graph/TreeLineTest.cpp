// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Segments with their directions, polylines that grow at either end, and the chaining of loose segments.

#include <cmath>
#include <limits>
#include <ostream>
#include <stdexcept>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/graph/TreeLine.h>
#include <olvane/graph/TreeLineSegment.h>

// For the messages of failures.
static std::ostream& operator<<(std::ostream& out, const TreePoint& point) {
    return out << "(" << point.x << ", " << point.y << ")";
}

namespace {

typedef std::vector<TreePoint> Points;
typedef std::vector<TreeLineSegment> Segments;

TreeLineSegment segment(float x1, float y1, float x2, float y2) {
    return TreeLineSegment{x1, y1, x2, y2, false};
}

TEST(TreeLineSegment, isAPointAtTheOriginAndNoSpouseLineUntilItIsFilled) {
    const TreeLineSegment segment;
    EXPECT_EQ(0.0f, segment.x1);
    EXPECT_EQ(0.0f, segment.y1);
    EXPECT_EQ(0.0f, segment.x2);
    EXPECT_EQ(0.0f, segment.y2);
    EXPECT_FALSE(segment.isSpouseLine);
}

// --- Directions.

struct DirectionRow {
    TreeLineSegment segment;
    int forward;
    int backward;
};

TEST(SegmentDirection, distinguishesTheFourWaysTheDiagonalAndNone) {
    const DirectionRow rows[] = {{segment(0, 0, 0, 5), 1, 2}, {segment(0, 5, 0, 0), 2, 1},
                                 {segment(5, 0, 0, 0), 3, 4}, {segment(0, 0, 5, 0), 4, 3},
                                 {segment(0, 0, 3, 4), 5, 5}, {segment(2, 2, 2, 2), 0, 0}};
    for (const DirectionRow& row : rows) {
        const TreeLineSegment& s = row.segment;
        EXPECT_EQ(row.forward, s.directionFromX1Y1()) << s.x1 << "," << s.y1 << " " << s.x2 << "," << s.y2;
        EXPECT_EQ(row.backward, s.directionFromX2Y2()) << s.x1 << "," << s.y1 << " " << s.x2 << "," << s.y2;
    }
}

TEST(SegmentDirection, everyDiagonalHasTheOneCodeWhateverItsSlope) {
    for (const TreeLineSegment& s :
         {segment(0, 0, 1, 9), segment(0, 0, -9, 1), segment(0, 0, -3, -4), segment(0, 0, 3, -4)}) {
        EXPECT_EQ(5, s.directionFromX1Y1());
        EXPECT_EQ(5, s.directionFromX2Y2());
    }
}

TEST(SegmentDirection, comparesExactly) {
    const float justBeside = std::nextafter(10.0f, 11.0f);
    EXPECT_EQ(4, segment(10.0f, 0.0f, justBeside, 0.0f).directionFromX1Y1());
    EXPECT_EQ(5, segment(10.0f, 0.0f, justBeside, 5.0f).directionFromX1Y1());
    EXPECT_EQ(0, segment(0.0f, 0.0f, -0.0f, -0.0f).directionFromX1Y1());
}

TEST(SegmentSlope, isTheQuotientOfTheDifferences) {
    EXPECT_EQ(2.0f, segment(0, 0, 2, 4).slope());
    EXPECT_EQ(-0.5f, segment(0, 0, -4, 2).slope());
    EXPECT_EQ(0.0f, segment(0, 3, 5, 3).slope());
}

TEST(SegmentSlope, ofAVerticalIsWhatFloatDivisionGives) {
    EXPECT_EQ(std::numeric_limits<float>::infinity(), segment(0, 5, 0, 0).slope());
    EXPECT_EQ(-std::numeric_limits<float>::infinity(), segment(0, 0, 0, 5).slope());
    EXPECT_TRUE(std::isnan(segment(2, 2, 2, 2).slope()));
}

// --- Growing a line.

TreeLine lineOf(const Points& points) {
    return TreeLine(points);
}

TEST(Line, startsEmptyFromPointsOrFromASegment) {
    EXPECT_TRUE(TreeLine().points().empty());
    EXPECT_EQ((Points{{1, 2}, {3, 4}, {5, 6}}), lineOf({{1, 2}, {3, 4}, {5, 6}}).points());
    EXPECT_EQ((Points{{1, 2}, {3, 4}}), TreeLine(segment(1, 2, 3, 4)).points());
}

TEST(Line, takesPointsAtEitherEnd) {
    TreeLine line;
    line.pushPointBack({1, 1});
    line.pushPointBack({2, 2});
    line.pushPointFront({0, 0});
    EXPECT_EQ((Points{{0, 0}, {1, 1}, {2, 2}}), line.points());
    EXPECT_EQ((TreePoint{0, 0}), line.first());
    EXPECT_EQ((TreePoint{2, 2}), line.last());
}

TEST(Line, copyIsDeep) {
    const TreeLine line = lineOf({{0, 0}, {1, 1}});
    TreeLine copy = line;
    copy.pushPointBack({2, 2});
    EXPECT_EQ(2u, line.points().size());
}

TEST(Line, frontSegmentRunsForwardAndBackSegmentRunsBackward) {
    const TreeLine line = lineOf({{0, 0}, {10, 0}, {10, 20}});
    const TreeLineSegment front = line.frontLineSegment();
    EXPECT_EQ((Points{{0, 0}, {10, 0}}), (Points{front.firstEnd(), front.secondEnd()}));
    EXPECT_FALSE(front.isSpouseLine);
    const TreeLineSegment back = line.backLineSegment();
    EXPECT_EQ((Points{{10, 20}, {10, 0}}), (Points{back.firstEnd(), back.secondEnd()}));
    EXPECT_FALSE(back.isSpouseLine);
}

TEST(Line, tooShortForAnAnswerFails) {
    TreeLine line;
    EXPECT_THROW(line.first(), std::out_of_range);
    EXPECT_THROW(line.last(), std::out_of_range);
    line.pushPointBack({1, 1});
    EXPECT_THROW(line.frontLineSegment(), std::out_of_range);
    EXPECT_THROW(line.backLineSegment(), std::out_of_range);
}

TEST(LineJoinedAtTheBack, emptyLineTakesBothEndsInTheirOrder) {
    TreeLine line;
    EXPECT_TRUE(line.addLineSegmentBack(segment(3, 3, 4, 4)));
    EXPECT_EQ((Points{{3, 3}, {4, 4}}), line.points());
}

TEST(LineJoinedAtTheBack, segmentMeetsByItsFirstOrBySecondEnd) {
    TreeLine byFirst = lineOf({{0, 0}, {10, 0}});
    EXPECT_TRUE(byFirst.addLineSegmentBack(segment(10, 0, 10, 10)));
    EXPECT_EQ((Points{{0, 0}, {10, 0}, {10, 10}}), byFirst.points());
    TreeLine bySecond = lineOf({{0, 0}, {10, 0}});
    EXPECT_TRUE(bySecond.addLineSegmentBack(segment(10, 10, 10, 0)));
    EXPECT_EQ((Points{{0, 0}, {10, 0}, {10, 10}}), bySecond.points());
}

TEST(LineJoinedAtTheBack, segmentThatDoesNotMeetIsRefusedAndNothingChanges) {
    TreeLine line = lineOf({{0, 0}, {10, 0}});
    EXPECT_FALSE(line.addLineSegmentBack(segment(3, 3, 4, 4)));
    EXPECT_FALSE(line.addLineSegmentBack(segment(0, 0, 0, 10)));  // it meets the other end
    EXPECT_FALSE(line.addLineSegmentBack(segment(std::nextafter(10.0f, 11.0f), 0, 10, 10)));
    EXPECT_EQ((Points{{0, 0}, {10, 0}}), line.points());
}

TEST(LineJoinedAtTheFront, emptyLineTakesBothEndsInTheirOrder) {
    TreeLine line;
    EXPECT_TRUE(line.addLineSegmentFront(segment(3, 3, 4, 4)));
    EXPECT_EQ((Points{{3, 3}, {4, 4}}), line.points());
}

TEST(LineJoinedAtTheFront, segmentMeetsByItsFirstOrBySecondEnd) {
    TreeLine byFirst = lineOf({{0, 0}, {10, 0}});
    EXPECT_TRUE(byFirst.addLineSegmentFront(segment(0, 0, 0, 10)));
    EXPECT_EQ((Points{{0, 10}, {0, 0}, {10, 0}}), byFirst.points());
    TreeLine bySecond = lineOf({{0, 0}, {10, 0}});
    EXPECT_TRUE(bySecond.addLineSegmentFront(segment(0, 10, 0, 0)));
    EXPECT_EQ((Points{{0, 10}, {0, 0}, {10, 0}}), bySecond.points());
}

TEST(LineJoinedAtTheFront, segmentThatDoesNotMeetIsRefusedAndNothingChanges) {
    TreeLine line = lineOf({{0, 0}, {10, 0}});
    EXPECT_FALSE(line.addLineSegmentFront(segment(3, 3, 4, 4)));
    EXPECT_FALSE(line.addLineSegmentFront(segment(10, 0, 10, 10)));
    EXPECT_EQ((Points{{0, 0}, {10, 0}}), line.points());
}

TEST(LineJoinedAtTheBack, zeroLengthSegmentRepeatsThePoint) {
    TreeLine line = lineOf({{0, 0}, {10, 0}});
    EXPECT_TRUE(line.addLineSegmentBack(segment(10, 0, 10, 0)));
    EXPECT_EQ((Points{{0, 0}, {10, 0}, {10, 0}}), line.points());
}

// --- Length.

TEST(LineLength, sumsTheDistancesFromTheFirstPointNotFromTheOneBefore) {
    TreeLine line = lineOf({{0, 0}, {10, 0}, {10, 10}});
    EXPECT_EQ(10.0f + std::sqrt(200.0f), line.length());
    EXPECT_FLOAT_EQ(10.0f + 14.142136f, line.length());
}

TEST(LineLength, ofTwoPointsIsTheirDistance) {
    EXPECT_EQ(5.0f, lineOf({{1, 1}, {4, 5}}).length());
}

TEST(LineLength, ofFewerThanTwoPointsIsZero) {
    EXPECT_EQ(0.0f, TreeLine().length());
    EXPECT_EQ(0.0f, lineOf({{7, 7}}).length());
}

TEST(LineLength, isTheSameAtTheSecondAsking) {
    TreeLine line = lineOf({{0, 0}, {10, 0}, {10, 10}});
    const float first = line.length();
    EXPECT_EQ(first, line.length());
}

TEST(LineLength, everyChangeOfTheLineIsCounted) {
    TreeLine line = lineOf({{0, 0}, {10, 0}});
    EXPECT_EQ(10.0f, line.length());
    line.pushPointBack({20, 0});
    EXPECT_EQ(30.0f, line.length());
    line.pushPointFront({0, 0});
    EXPECT_EQ(30.0f, line.length());
    line.pushPointFront({-10, 0});  // now 10, 10, 20 and 30 away from the first point
    EXPECT_EQ(70.0f, line.length());
    EXPECT_TRUE(line.addLineSegmentBack(segment(20, 0, 30, 0)));
    EXPECT_EQ(110.0f, line.length());
    EXPECT_TRUE(line.addLineSegmentFront(segment(-10, 0, -10, 0)));
    EXPECT_EQ(110.0f, line.length());
    EXPECT_TRUE(line.addLineSegmentFront(segment(-10, 0, 30, 0)));  // 40, 40, 30, 30, 20, 10 and 0 away
    EXPECT_EQ(170.0f, line.length());
}

// --- Chaining.

typedef std::vector<Points> Lines;

Lines chained(const Segments& segments) {
    Lines lines;
    for (const TreeLine& line : TreeLine::TreeLinesFromLineSegments(segments)) lines.push_back(line.points());
    return lines;
}

const TreeLineSegment kA = segment(0, 0, 10, 0);

TEST(Chaining, emptyListGivesNoLine) {
    EXPECT_EQ(Lines{}, chained({}));
}

TEST(Chaining, oneSegmentGivesOneLine) {
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}}}), chained({kA}));
}

TEST(Chaining, straightRunIsTakenAtTheFrontAndRefusedAtTheBack) {
    const TreeLineSegment b = segment(10, 0, 20, 0);
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {20, 0}}}), chained({kA, b}));
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}}, {{10, 0}, {20, 0}}}), chained({b, kA}));
}

TEST(Chaining, straightRunAtTheBackIsRefusedByItsSecondEndToo) {
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}}, {{20, 0}, {10, 0}}}), chained({segment(20, 0, 10, 0), kA}));
}

TEST(Chaining, straightRunAtTheFrontIsTakenByItsFirstEndToo) {
    EXPECT_EQ((Lines{{{-10, 0}, {0, 0}, {10, 0}}}), chained({segment(0, 0, -10, 0), kA}));
}

TEST(Chaining, turnIsTakenAtTheBackByEitherEnd) {
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {10, 10}}}), chained({segment(10, 0, 10, 10), kA}));
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {10, 10}}}), chained({segment(10, 10, 10, 0), kA}));
}

TEST(Chaining, turnIsTakenAtTheFrontByEitherEnd) {
    EXPECT_EQ((Lines{{{0, 10}, {0, 0}, {10, 0}}}), chained({segment(0, 0, 0, 10), kA}));
    EXPECT_EQ((Lines{{{0, 10}, {0, 0}, {10, 0}}}), chained({segment(0, 10, 0, 0), kA}));
}

TEST(Chaining, runBackOverTheFirstSegmentIsRefusedAtTheFront) {
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}}, {{0, 0}, {4, 0}}}), chained({segment(0, 0, 4, 0), kA}));
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}}, {{4, 0}, {0, 0}}}), chained({segment(4, 0, 0, 0), kA}));
}

TEST(Chaining, runBackOverTheLastSegmentIsTakenAtTheBack) {
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {4, 0}}}), chained({segment(10, 0, 4, 0), kA}));
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {4, 0}}}), chained({segment(4, 0, 10, 0), kA}));
}

// Both ends of the candidate meet the line. Its second end meets the front and would run back there; the
// back, where it would be taken, is not tried any more.
TEST(Chaining, firstEndThatMeetsSettlesTheCandidate) {
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}}, {{10, 0}, {0, 0}}}), chained({segment(10, 0, 0, 0), kA}));
}

TEST(Chaining, candidateRefusedAtTheBackBeginsALineOfItsOwn) {
    const TreeLineSegment straight = segment(10, 0, 20, 0);
    const TreeLineSegment turn = segment(20, 0, 20, 10);
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}}, {{10, 0}, {20, 0}, {20, 10}}}), chained({turn, straight, kA}));
}

TEST(Chaining, searchStartsAgainFromTheFirstSegmentAfterEachJoin) {
    const TreeLineSegment joinsLater = segment(10, 10, 20, 10);
    const TreeLineSegment joinsFirst = segment(10, 0, 10, 10);
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {10, 10}, {20, 10}}}), chained({joinsLater, joinsFirst, kA}));
}

TEST(Chaining, firstOfTwoCandidatesInTheListIsTaken) {
    const TreeLineSegment down = segment(10, 0, 10, 10);
    const TreeLineSegment up = segment(10, 0, 10, -10);
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {10, 10}}, {{10, 0}, {10, -10}}}), chained({down, up, kA}));
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {10, -10}}, {{10, 0}, {10, 10}}}), chained({up, down, kA}));
}

TEST(Chaining, linesComeInTheOrderInWhichTheyWereFinishedTheLastSegmentsFirst) {
    EXPECT_EQ((Lines{{{200, 0}, {210, 0}}, {{100, 0}, {110, 0}}, {{0, 0}, {10, 0}}}),
              chained({kA, segment(100, 0, 110, 0), segment(200, 0, 210, 0)}));
}

TEST(Chaining, twoDiagonalsAreNeverChainedWhateverTheirSlopes) {
    const TreeLineSegment rising = segment(0, 0, 5, 5);
    EXPECT_EQ((Lines{{{0, 0}, {5, 5}}, {{5, 5}, {9, 2}}}), chained({segment(5, 5, 9, 2), rising}));
    EXPECT_EQ((Lines{{{0, 0}, {5, 5}}, {{-3, 7}, {0, 0}}}), chained({segment(-3, 7, 0, 0), rising}));
}

TEST(Chaining, diagonalAndStraightSegmentsAreChained) {
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {15, 5}}}), chained({segment(10, 0, 15, 5), kA}));
    EXPECT_EQ((Lines{{{-5, 5}, {0, 0}, {10, 0}}}), chained({segment(-5, 5, 0, 0), kA}));
}

TEST(Chaining, zeroLengthSegmentJoinsAnyLineOfSomeLength) {
    const TreeLineSegment point = segment(10, 0, 10, 0);
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {10, 0}}}), chained({point, kA}));
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {10, 0}}}), chained({kA, point}));
    EXPECT_EQ((Lines{{{0, 0}, {0, 0}, {10, 0}}}), chained({segment(0, 0, 0, 0), kA}));
}

TEST(Chaining, twoZeroLengthSegmentsAreNotChained) {
    EXPECT_EQ((Lines{{{1, 1}, {1, 1}}, {{1, 1}, {1, 1}}}),
              chained({segment(1, 1, 1, 1), segment(1, 1, 1, 1)}));
}

TEST(Chaining, spouseLinesAreChainedLikeAnyOther) {
    TreeLineSegment marriage = segment(10, 0, 10, 10);
    marriage.isSpouseLine = true;
    EXPECT_EQ((Lines{{{0, 0}, {10, 0}, {10, 10}}}), chained({marriage, kA}));
}

TEST(Chaining, endsThatNearlyMeetStayApart) {
    const float almostTen = std::nextafter(10.0f, 11.0f);
    EXPECT_EQ(2u, chained({segment(almostTen, 0, almostTen, 10), kA}).size());
}

TEST(Chaining, notANumberMeetsNothing) {
    const float nan = std::numeric_limits<float>::quiet_NaN();
    EXPECT_EQ(2u, TreeLine::TreeLinesFromLineSegments({segment(nan, 0, 5, 5), segment(0, 0, nan, 0)}).size());
}

TEST(Chaining, callersListStaysAsItWas) {
    const Segments segments{segment(10, 0, 10, 10), kA};
    chained(segments);
    EXPECT_EQ(2u, segments.size());
}

}  // namespace
