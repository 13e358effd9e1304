// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How wide family units measure. Figures rest on boxes of 55 and gaps of 25, so that a couple takes 135.

#include <gtest/gtest.h>

#include <utility>
#include <vector>

#include "HandMadeFamily.h"

namespace {

using views::kFemale;
using views::kMale;

class FamilyWidths : public views::HandMadeFamily {
protected:
    float unitWidth(TreeViewPerson& person) { return layouter.familyUnitWidthForProximalPerson(person); }
    TreeViewPerson& spouse(std::size_t index = 0) { return focus.spouses.at(index); }
};

TEST_F(FamilyWidths, gapsStandBetweenBlocksAndNotAroundThem) {
    const std::vector<std::pair<int, float>> rows{{-3, 0.0f}, {0, 0.0f},  {1, 0.0f},
                                                  {2, 25.0f}, {3, 50.0f}, {4, 75.0f}};
    for (const auto& [count, width] : rows) {
        EXPECT_EQ(width, layouter.horzPaddingForNodesCount(count)) << count;
    }
}

TEST_F(FamilyWidths, aPersonAloneIsOneBoxWide) {
    measure(focus);
    EXPECT_EQ(55.0f, focus.layoutWidth);
    EXPECT_EQ(55.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, onlyChildWidensToItsParents) {
    focus.addSpouse(1, kFemale);
    focus.addChildWithSpouse(2, 1, kMale);
    measure(focus);
    EXPECT_EQ(135.0f, childUnder(focus, 1).layoutWidth);
    EXPECT_EQ(135.0f, spouse().layoutWidth);
    EXPECT_EQ(135.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, twoChildrenFillACouplesWidth) {
    focus.addSpouse(1, kFemale);
    focus.addChildWithSpouse(2, 1, kMale);
    focus.addChildWithSpouse(3, 1, kMale);
    measure(focus);
    EXPECT_EQ(55.0f, childUnder(focus, 1, 0).layoutWidth);
    EXPECT_EQ(55.0f, childUnder(focus, 1, 1).layoutWidth);
    EXPECT_EQ(135.0f, spouse().layoutWidth);
    EXPECT_EQ(135.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, threeChildrenWidenTheirParents) {
    focus.addSpouse(1, kFemale);
    for (const int child : {2, 3, 4}) focus.addChildWithSpouse(child, 1, kMale);
    measure(focus);
    EXPECT_EQ(215.0f, spouse().layoutWidth);
    EXPECT_EQ(215.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, marriedOnlyChildIsNotWidened) {
    focus.addSpouse(1, kFemale);
    focus.addChildWithSpouse(2, 1, kMale).addSpouse(3, kFemale);
    measure(focus);
    TreeViewPerson& child = childUnder(focus, 1);
    EXPECT_EQ(135.0f, unitWidth(child));
    EXPECT_EQ(55.0f, child.layoutWidth);
    EXPECT_EQ(135.0f, spouse().layoutWidth);
}

TEST_F(FamilyWidths, onlyChildBesideAStepChildIsNotWidened) {
    focus.addSpouse(1, kFemale).addChildWithNoOtherSpouse(3, kMale);
    focus.addChildWithSpouse(2, 1, kMale);
    measure(focus);
    EXPECT_EQ(55.0f, childUnder(focus, 1).layoutWidth);
    EXPECT_EQ(135.0f, spouse().layoutWidth);
}

// Whether the only child has a child is not asked: a unit one box wide is widened.
TEST_F(FamilyWidths, onlyChildWithOneUnknownChildIsWidenedToo) {
    focus.addSpouse(1, kFemale);
    focus.addChildWithSpouse(2, 1, kMale).addChildWithNoOtherSpouse(3, kMale);
    measure(focus);
    EXPECT_EQ(135.0f, childUnder(focus, 1).layoutWidth);
    EXPECT_EQ(55.0f, unknownChild(childUnder(focus, 1)).layoutWidth);
}

TEST_F(FamilyWidths, onlyChildOfAnOnlyChildIsWidenedOnItsOwnLevel) {
    focus.addSpouse(1, kFemale);
    TreeViewPerson& child = focus.addChildWithSpouse(2, 1, kMale);
    child.addSpouse(3, kFemale);
    child.addChildWithSpouse(4, 3, kMale);
    measure(focus);
    EXPECT_EQ(135.0f, childUnder(child, 3).layoutWidth);
    EXPECT_EQ(55.0f, child.layoutWidth);
    EXPECT_EQ(135.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, childlessSpouseReservesACouplesWidth) {
    focus.addSpouse(1, kFemale);
    measure(focus);
    EXPECT_EQ(135.0f, spouse().layoutWidth);
    EXPECT_EQ(55.0f, focus.layoutWidth);
    EXPECT_EQ(135.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, personWithAnUnknownChildStandsBesideTheSpousesBlock) {
    focus.addSpouse(1, kFemale);
    focus.addChildWithNoOtherSpouse(2, kMale);
    measure(focus);
    EXPECT_EQ(55.0f, focus.layoutWidth);
    EXPECT_EQ(135.0f, spouse().layoutWidth);
    EXPECT_EQ(215.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, personWithAnUnknownChildHasOneGapForEachSpouse) {
    focus.addSpouse(1, kFemale);
    focus.addSpouse(2, kFemale);
    focus.addChildWithNoOtherSpouse(3, kMale);
    measure(focus);
    EXPECT_EQ(55.0f + 135.0f + 135.0f + 50.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, twoChildlessSpousesTakeTwoCouplesWidthsAndAGap) {
    focus.addSpouse(1, kFemale);
    focus.addSpouse(2, kFemale);
    measure(focus);
    EXPECT_EQ(135.0f, spouse(0).layoutWidth);
    EXPECT_EQ(135.0f, spouse(1).layoutWidth);
    EXPECT_EQ(295.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, stepChildrenOfASpouseWithoutSharedChildrenStandGapByGap) {
    const std::vector<std::pair<int, float>> rows{{1, 135.0f}, {2, 135.0f}, {3, 215.0f}, {4, 295.0f}};
    for (const auto& [count, width] : rows) {
        TreeViewPerson man(0);
        man.setGender(true);
        TreeViewPerson& wife = man.addSpouse(1, kFemale);
        for (int child = 0; child < count; ++child) wife.addChildWithNoOtherSpouse(10 + child, kMale);
        measure(man);
        EXPECT_EQ(width, wife.layoutWidth) << count;
    }
}

// Two shared children make 135; each of the two step children adds its box and a whole gap.
TEST_F(FamilyWidths, stepChildrenBesideSharedOnesBringAGapEach) {
    TreeViewPerson& wife = focus.addSpouse(1, kFemale);
    wife.addChildWithNoOtherSpouse(4, kMale);
    wife.addChildWithNoOtherSpouse(5, kMale);
    focus.addChildWithSpouse(2, 1, kMale);
    focus.addChildWithSpouse(3, 1, kMale);
    measure(focus);
    EXPECT_EQ(295.0f, wife.layoutWidth);
}

TEST_F(FamilyWidths, spousesOfStepChildrenTakeNoRoom) {
    TreeViewPerson& wife = focus.addSpouse(1, kFemale);
    for (const int child : {4, 5, 6})
        wife.addChildWithNoOtherSpouse(child, kMale).addSpouse(child + 10, kFemale);
    measure(focus);
    EXPECT_EQ(215.0f, wife.layoutWidth);
    EXPECT_EQ(165.0f, layouter.addWidthsForStepChildrenFromSpouse(wife));
}

TEST_F(FamilyWidths, stepChildrenAreMeasuredThemselves) {
    TreeViewPerson& stepChild = focus.addSpouse(1, kFemale).addChildWithNoOtherSpouse(4, kMale);
    stepChild.addSpouse(14, kFemale);
    stepChild.addChildWithNoOtherSpouse(15, kMale);
    stepChild.addChildWithNoOtherSpouse(16, kMale);
    EXPECT_EQ(135.0f, layouter.addWidthsForStepChildrenFromSpouse(spouse()));
    EXPECT_EQ(135.0f, stepChild.layoutWidth);
    EXPECT_EQ(135.0f, stepChild.spouses.front().layoutWidth);
}

// 55 for each child, 135 and a gap for the one spouse, one gap between the two.
TEST_F(FamilyWidths, spousesOfUnknownChildrenTakeRoom) {
    focus.addChildWithNoOtherSpouse(1, kMale).addSpouse(3, kFemale);
    focus.addChildWithNoOtherSpouse(2, kMale);
    measure(focus);
    EXPECT_EQ(295.0f, focus.layoutWidth);
    EXPECT_EQ(295.0f, unitWidth(focus));
}

// The unknown child's unit is 135 wide, yet its parent counts its box, its spouse's block and a gap.
TEST_F(FamilyWidths, marriedUnknownChildIsCountedByBlocksAndNotByItsUnit) {
    focus.addChildWithNoOtherSpouse(1, kMale).addSpouse(3, kFemale);
    measure(focus);
    EXPECT_EQ(215.0f, focus.layoutWidth);
    EXPECT_EQ(135.0f, unitWidth(unknownChild(focus)));
}

TEST_F(FamilyWidths, unknownChildrensBlockIsNeverNarrowerThanABox) {
    focus.addChildWithNoOtherSpouse(1, kMale);
    measure(focus);
    EXPECT_EQ(55.0f, focus.layoutWidth);
}

TEST_F(FamilyWidths, coupleFloorLiesOnTheFirstSpouseOfAManAndOfAWoman) {
    for (const bool male : {true, false}) {
        TreeViewPerson person(9);
        person.setGender(male);
        person.addSpouse(1, !male).layoutWidth = 60.0f;
        person.addSpouse(2, !male).layoutWidth = 60.0f;
        person.spouses.front().layoutWidth = 60.0f;
        EXPECT_EQ(25.0f + 135.0f + 60.0f, unitWidth(person)) << "male " << male;
    }
}

TEST_F(FamilyWidths, wideFirstSpouseIsTakenAsItIs) {
    focus.addSpouse(1, kFemale).layoutWidth = 300.0f;
    EXPECT_EQ(300.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, unitWithUnknownChildrenHasNoCoupleFloor) {
    focus.addSpouse(1, kFemale).layoutWidth = 60.0f;
    focus.addChildWithNoOtherSpouse(2, kMale);
    focus.layoutWidth = 55.0f;
    EXPECT_EQ(25.0f + 55.0f + 60.0f, unitWidth(focus));
}

TEST_F(FamilyWidths, readingTheUnitsWidthChangesNothing) {
    focus.addSpouse(1, kFemale).layoutWidth = 60.0f;
    focus.layoutWidth = 40.0f;
    unitWidth(focus);
    EXPECT_EQ(60.0f, spouse().layoutWidth);
    EXPECT_EQ(40.0f, focus.layoutWidth);
}

TEST_F(FamilyWidths, proximalAreThoseReachedByDescent) {
    focus.addSpouse(1, kFemale).addChildWithNoOtherSpouse(5, kMale);
    spouse().isProximalPerson = true;
    focus.addChildWithSpouse(2, 1, kMale).addSpouse(3, kFemale);
    focus.addChildWithNoOtherSpouse(4, kMale);
    measure(focus);
    EXPECT_TRUE(focus.isProximalPerson);
    EXPECT_FALSE(spouse().isProximalPerson);
    EXPECT_TRUE(unknownChild(spouse()).isProximalPerson);
    EXPECT_TRUE(childUnder(focus, 1).isProximalPerson);
    EXPECT_FALSE(childUnder(focus, 1).spouses.front().isProximalPerson);
    EXPECT_TRUE(unknownChild(focus).isProximalPerson);
}

TEST_F(FamilyWidths, measuringPlacesNobody) {
    focus.addSpouse(1, kFemale);
    focus.addChildWithSpouse(2, 1, kMale);
    measure(focus);
    EXPECT_EQ((views::Point{0.0f, 0.0f}), views::placeOf(spouse()));
    EXPECT_EQ((views::Point{0.0f, 0.0f}), views::placeOf(childUnder(focus, 1)));
}

TEST_F(FamilyWidths, widthsFollowTheSizesGiven) {
    layouter.treeSize.nodeWidth = 100.0f;
    layouter.treeSize.horzPadding = 10.0f;
    focus.addSpouse(1, kFemale);
    focus.addChildWithSpouse(2, 1, kMale);
    measure(focus);
    EXPECT_EQ(100.0f, focus.layoutWidth);
    EXPECT_EQ(210.0f, childUnder(focus, 1).layoutWidth);
    EXPECT_EQ(210.0f, unitWidth(focus));
}

}  // namespace
