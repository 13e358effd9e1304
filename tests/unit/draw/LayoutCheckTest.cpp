// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Counting what makes a layout hard to read.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include <olvane/draw/LayoutCheck.h>

namespace olvane::draw {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

LayoutFindings check(const std::string& text) {
    return checkLayout(readLayoutText(text), LineDirection::downward, BoxSize());
}

TEST(LayoutCheck, boxesSideBySideDoNotOverlap) {
    const LayoutFindings findings = check("1:0:0:0:;2:55:0:0:;3:0:80:0:;");
    EXPECT_THAT(findings.overlappingBoxes, IsEmpty());
    EXPECT_FALSE(findings.anyTrouble());
}

TEST(LayoutCheck, everyPairOfOverlappingBoxesIsTold) {
    EXPECT_THAT(check("1:0:0:0:;2:54:0:0:;3:20:79:0:;").overlappingBoxes,
                UnorderedElementsAre(IdPair(1, 2), IdPair(1, 3), IdPair(3, 2)));
}

TEST(LayoutCheck, boxesOfOnePlaceOverlap) {
    EXPECT_THAT(check("1:0:0:0:;2:0:0:0:;").overlappingBoxes, ElementsAre(IdPair(1, 2)));
}

TEST(LayoutCheck, lineBehindAnotherBoxIsTold) {
    EXPECT_THAT(check("1:0:0:0:55,40,200,40|;2:80:0:0:;3:200:0:0:;").linesThroughBoxes,
                ElementsAre(IdPair(1, 2)));
}

TEST(LayoutCheck, verticalLineThroughABoxIsTold) {
    EXPECT_THAT(check("1:300:0:0:20,-50,20,200|;2:0:0:0:;").linesThroughBoxes, ElementsAre(IdPair(1, 2)));
}

TEST(LayoutCheck, repeatedPieceOfLineCountsOnce) {
    EXPECT_THAT(check("1:300:0:0:20,-50,20,200|20,-50,20,200|;2:0:0:0:;").linesThroughBoxes,
                ElementsAre(IdPair(1, 2)));
}

TEST(LayoutCheck, lineThatEndsOnAnEdgeOrRunsAlongOneIsNone) {
    EXPECT_THAT(check("1:0:0:0:54,40,80,40|;2:80:0:0:55,80,200,80|;").linesThroughBoxes, IsEmpty());
}

TEST(LayoutCheck, familiesWhoseTrunksLieOnOneAnotherAreTold) {
    // The first family's trunk runs from x 27 to 200, the second's from 107 to 300, both at y 95.
    const std::string text =
        "1:0:0:0:27,80,27,95|;2:80:0:0:107,80,107,95|;3:173:110:0:200,95,27,95|200,110,200,95|;"
        "4:273:110:0:300,95,107,95|300,110,300,95|;";
    EXPECT_THAT(check(text).sharedTracks, ElementsAre(IdPair(3, 4)));
}

TEST(LayoutCheck, childrenOfOneFamilyShareTheirTrunkByRight) {
    const std::string text =
        "1:0:0:0:27,80,27,95|27,80,27,95|;3:73:110:0:100,95,27,95|100,110,100,95|;"
        "4:173:110:0:200,95,27,95|200,110,200,95|;";
    EXPECT_THAT(check(text).sharedTracks, IsEmpty());
}

TEST(LayoutCheck, personInSeveralBoxesIsCountedAndNoTrouble) {
    const LayoutFindings findings = check("1:0:0:0:;2:80:0:0:;1:160:0:0:;");
    ASSERT_EQ(findings.repeatedPersons.size(), 1u);
    EXPECT_EQ(findings.repeatedPersons[0].id, 1);
    EXPECT_EQ(findings.repeatedPersons[0].boxes, 2);
    EXPECT_FALSE(findings.anyTrouble());
}

}  // namespace
}  // namespace olvane::draw
