// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The segments that hang from a person, and the cut of a coordinate to a whole point.

#include <cmath>
#include <limits>
#include <stdexcept>
#include <vector>

#include <gtest/gtest.h>

#include <olvane/graph/TreeViewPerson.h>
#include <olvane/graph/WholePointInternal.h>
#include <unit/graph/Visits.h>

namespace {

using unit::failureOf;
using unit::kEmptyFunctionFailure;

TEST(PersonsSegments, areVisitedInTheOrderAddedDuplicatesIncluded) {
    TreeViewPerson person(1);
    person.addLineSegment(1.0f, 2.0f, 3.0f, 4.0f, true);
    person.addLineSegment(5.0f, 6.0f, 7.0f, 8.0f, false);
    person.addLineSegment(1.0f, 2.0f, 3.0f, 4.0f, true);
    std::vector<float> firstNumbers;
    std::vector<bool> marks;
    person.lineSegmentIterator([&](TreeLineSegment& segment) {
        firstNumbers.push_back(segment.x1);
        marks.push_back(segment.isSpouseLine);
    });
    EXPECT_EQ((std::vector<float>{1.0f, 5.0f, 1.0f}), firstNumbers);
    EXPECT_EQ((std::vector<bool>{true, false, true}), marks);
}

TEST(PersonsSegments, keepTheOrderOfTheirEnds) {
    TreeViewPerson person(1);
    person.addLineSegment(1.5f, 2.5f, 3.5f, 4.5f, false);
    const TreeLineSegment& segment = person.lineSegments.at(0);
    EXPECT_EQ(1.5f, segment.x1);
    EXPECT_EQ(2.5f, segment.y1);
    EXPECT_EQ(3.5f, segment.x2);
    EXPECT_EQ(4.5f, segment.y2);
}

TEST(PersonsSegments, areVisitedByReference) {
    TreeViewPerson person(1);
    person.addLineSegment(1.0f, 2.0f, 3.0f, 4.0f, false);
    person.lineSegmentIterator([](TreeLineSegment& segment) { segment.x1 = 9.0f; });
    EXPECT_EQ(9.0f, person.lineSegments[0].x1);
}

TEST(PersonsSegments, emptyVisitorFailsByNameOnlyWhereThereIsASegment) {
    TreeViewPerson person(1);
    EXPECT_NO_THROW(person.lineSegmentIterator(TreeViewPerson::SegmentVisitor()));
    person.addLineSegment(1.0f, 2.0f, 3.0f, 4.0f, false);
    EXPECT_EQ(kEmptyFunctionFailure, failureOf<boost::bad_function_call>([&] {
                  person.lineSegmentIterator(TreeViewPerson::SegmentVisitor());
              }));
}

TEST(SpouseLines, firstLineToASpouseIsTheOneGiven) {
    TreeViewPerson person(1);
    person.addSpouseLine(5, 1.0f, 2.0f, 3.0f, 4.0f);
    person.addSpouseLine(5, 9.0f, 9.0f, 9.0f, 9.0f);
    person.addSpouseLine(6, 7.0f, 7.0f, 7.0f, 7.0f);
    const TreeLineSegment& line = person.getSpouseLine(5);
    EXPECT_EQ(&person.spouseLines[5][0], &line);
    EXPECT_EQ(1.0f, line.x1);
    EXPECT_EQ(2.0f, line.y1);
    EXPECT_EQ(3.0f, line.x2);
    EXPECT_EQ(4.0f, line.y2);
    EXPECT_TRUE(line.isSpouseLine);
    EXPECT_EQ(2u, person.spouseLines[5].size());
    EXPECT_EQ(7.0f, person.getSpouseLine(6).x1);
}

TEST(SpouseLines, doNotStandAmongThePersonsSegments) {
    TreeViewPerson person(1);
    person.addSpouseLine(5, 1.0f, 2.0f, 3.0f, 4.0f);
    EXPECT_TRUE(person.lineSegments.empty());
}

TEST(SpouseLines, lookForALineThatIsNotThereFailsAndLeavesAnEmptyList) {
    TreeViewPerson person(1);
    EXPECT_THROW(person.getSpouseLine(5), std::out_of_range);
    ASSERT_EQ(1u, person.spouseLines.count(5));
    EXPECT_TRUE(person.spouseLines[5].empty());
}

TEST(WholePoints, areCutTowardZero) {
    EXPECT_EQ(-27, olvane::wholePoint(-27.5));
    EXPECT_EQ(27, olvane::wholePoint(27.999));
    EXPECT_EQ(0, olvane::wholePoint(-0.5));
    EXPECT_EQ(0, olvane::wholePoint(0.9));
    EXPECT_EQ(-72, olvane::wholePoint(-72.5));
    EXPECT_EQ(-110, olvane::wholePoint(-110.0));
}

TEST(WholePoints, whatAnIntCannotHoldBecomesTheNearestOne) {
    constexpr int kLeast = std::numeric_limits<int>::min();
    constexpr int kGreatest = std::numeric_limits<int>::max();
    EXPECT_EQ(kGreatest, olvane::wholePoint(2147483647.0));
    EXPECT_EQ(kGreatest, olvane::wholePoint(2147483647.5));
    EXPECT_EQ(kGreatest, olvane::wholePoint(1.0e30));
    EXPECT_EQ(kGreatest, olvane::wholePoint(std::numeric_limits<double>::infinity()));
    EXPECT_EQ(kLeast, olvane::wholePoint(-2147483648.0));
    EXPECT_EQ(kLeast, olvane::wholePoint(-2147483648.5));
    EXPECT_EQ(kLeast, olvane::wholePoint(-1.0e30));
    EXPECT_EQ(kLeast, olvane::wholePoint(-std::numeric_limits<double>::infinity()));
    EXPECT_EQ(kGreatest - 1, olvane::wholePoint(2147483646.9));
    EXPECT_EQ(kLeast + 1, olvane::wholePoint(-2147483647.9));
}

TEST(WholePoints, notANumberBecomesZero) {
    EXPECT_EQ(0, olvane::wholePoint(std::numeric_limits<double>::quiet_NaN()));
}

TEST(WholePoints, sumInDoubleIsCutDirectly) {
    EXPECT_EQ(0, olvane::wholePoint(0.99999999999));  // a float would have made 1 of it
}

// A float is cut by comparisons of its own, and must be cut to the same number: at every power of two and its
// neighbours, and where nothing fits.
TEST(WholePoints, ofAFloatIsThatOfTheSameNumberAsADouble) {
    constexpr float kEndless = std::numeric_limits<float>::infinity();
    std::vector<float> values = {0.0f, -0.0f, kEndless, -kEndless, std::numeric_limits<float>::quiet_NaN()};
    for (int exponent = -149; exponent < 128; ++exponent) {
        const float power = std::ldexp(1.0f, exponent);
        for (const float value : {std::nextafter(power, 0.0f), power, std::nextafter(power, kEndless)}) {
            values.push_back(value);
            values.push_back(-value);
        }
    }
    for (const float value : values) {
        EXPECT_EQ(olvane::wholePoint(static_cast<double>(value)), olvane::wholePoint(value)) << value;
    }
}

TEST(WholePoints, areHandedBackAsCoordinates) {
    EXPECT_EQ(-72.0f, olvane::cutToWholePoint(-72.5));
    EXPECT_EQ(87.0f, olvane::cutToWholePoint(87.5));
}

}  // namespace
