// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Telling families and marriages from the segments of a layout.

#include <gtest/gtest.h>

#include <olvane/draw/FamilyLinesInternal.h>
#include <olvane/host/LayoutText.h>

namespace olvane::draw {
namespace {

LayoutLines linesOf(const std::string& text, LineDirection direction = LineDirection::downward,
                    BoxSize box = {}) {
    return collectLines(readLayoutText(text), direction, box);
}

// A couple with two children: the wife repeats the drop for each child.
const std::string kCouple =
    "1:0:0:0:55,40,80,40|;2:80:0:0:67,40,67,95|67,40,67,95|;3:0:110:0:27,95,67,95|27,110,27,95|;"
    "4:80:110:0:107,95,67,95|107,110,107,95|;";

TEST(FamilyLines, coupleWithTwoChildrenIsOneFamily) {
    const LayoutLines lines = linesOf(kCouple);
    ASSERT_EQ(lines.families.size(), 1u);
    const FamilyLine& family = lines.families[0];
    EXPECT_EQ(family.trunk, 95);
    EXPECT_EQ(family.joint, 67);
    EXPECT_EQ(family.first(), 27);
    EXPECT_EQ(family.last(), 107);
    EXPECT_TRUE(lines.others.empty());
}

TEST(FamilyLines, repeatedDropIsTakenOnce) {
    const LayoutLines lines = linesOf(kCouple);
    ASSERT_EQ(lines.families.size(), 1u);
    EXPECT_EQ(lines.families[0].taps.size(), 3u);  // the parents' and two children's
}

TEST(FamilyLines, childrenKnowTheirRecords) {
    const LayoutLines lines = linesOf(kCouple);
    ASSERT_EQ(lines.families.size(), 1u);
    EXPECT_EQ(lines.families[0].taps[0].childRecord, FamilyTap::kNoRecord);
    EXPECT_EQ(lines.families[0].taps[1].childRecord, 2u);
    EXPECT_EQ(lines.families[0].taps[2].childRecord, 3u);
}

TEST(FamilyLines, marriageJoinsTheTwoRecords) {
    const LayoutLines lines = linesOf(kCouple);
    ASSERT_EQ(lines.marriages.size(), 1u);
    EXPECT_EQ(lines.marriages[0].from, 0u);
    EXPECT_EQ(lines.marriages[0].to, 1u);
}

TEST(FamilyLines, wifeHoldingTheMarriageFindsHerHusband) {
    const LayoutLines lines = linesOf("1:80:0:0:80,40,55,40|;2:0:0:0:;");
    ASSERT_EQ(lines.marriages.size(), 1u);
    EXPECT_EQ(lines.marriages[0].to, 1u);
}

TEST(FamilyLines, marriageWithNobodyAtItsEndStillCounts) {
    const LayoutLines lines = linesOf("1:0:0:0:55,40,80,40|;");
    ASSERT_EQ(lines.marriages.size(), 1u);
    EXPECT_EQ(lines.marriages[0].to, FamilyTap::kNoRecord);
}

TEST(FamilyLines, childStraightBelowTheDropHasABusOfNoLength) {
    const LayoutLines lines = linesOf("1:0:0:0:27,80,27,87|;3:0:110:0:27,87,27,87|27,110,27,87|;");
    ASSERT_EQ(lines.families.size(), 1u);
    EXPECT_EQ(lines.families[0].taps.size(), 2u);
    EXPECT_TRUE(lines.marriages.empty());
}

TEST(FamilyLines, sidewaysParentsRunIsAFamilyAndTheirMarriage) {
    const LayoutLines lines =
        linesOf("1:27:0:0:107,-5,95,-5|95,-5,95,40|95,40,82,40|;2:107:-100:0:107,-20,107,10|;3:107:10:0:;",
                LineDirection::sideways);
    ASSERT_EQ(lines.families.size(), 1u);
    EXPECT_EQ(lines.families[0].trunk, 95);
    EXPECT_EQ(lines.families[0].first(), -5);
    EXPECT_EQ(lines.families[0].last(), 40);
    ASSERT_EQ(lines.marriages.size(), 1u);
    EXPECT_EQ(lines.marriages[0].from, 1u);
    EXPECT_EQ(lines.marriages[0].to, 2u);
    EXPECT_TRUE(lines.others.empty());
}

TEST(FamilyLines, sidewaysLoneParentJoinsItsChild) {
    const LayoutLines lines =
        linesOf("1:27:0:0:100,40,100,40|82,40,100,40|;2:107:0:0:107,40,100,40|;", LineDirection::sideways);
    ASSERT_EQ(lines.families.size(), 1u);
    EXPECT_EQ(lines.families[0].taps.size(), 2u);
    EXPECT_TRUE(lines.others.empty());
}

TEST(FamilyLines, slantingSegmentIsKeptAsItIs) {
    const LayoutLines lines = linesOf("1:0:0:0:0,0,5,7|;");
    ASSERT_EQ(lines.others.size(), 1u);
    EXPECT_EQ(lines.others[0], (LayoutSegment{0, 0, 5, 7}));
}

}  // namespace
}  // namespace olvane::draw
