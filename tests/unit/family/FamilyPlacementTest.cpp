// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the persons of one family unit stand. Units start at x 0 and y 0 unless a test says otherwise; a box
// stands at the middle of its span, so a lone box of 55 stands at 27.5.

#include <gtest/gtest.h>

#include <vector>

#include "HandMadeFamily.h"

namespace {

using views::kFemale;
using views::kMale;
using views::placeOf;
using views::Point;

class FamilyPlacement : public views::HandMadeFamily {
protected:
    void placeUnit() { measureAndPlace(focus, 0.0f, 0.0f); }
    void makeFocusAWoman() { focus.setGender(false); }
    // Spouses of keys 1, 2, ... of the other sex.
    void addSpouses(int count) {
        for (int key = 1; key <= count; ++key) focus.addSpouse(key, !focus.gender);
    }
    TreeViewPerson& spouse(std::size_t index = 0) { return focus.spouses.at(index); }
    std::vector<float> spouseOffsets() {
        std::vector<float> offsets;
        for (const TreeViewPerson& one : focus.spouses) offsets.push_back(one.spouseLineOffset);
        return offsets;
    }
};

struct OffsetRow {
    int spouseCount;
    int ofAMan;
    int ofAWoman;
};

TEST_F(FamilyPlacement, firstMarriageLineStartsAtAnOffsetThatGrowsByPairs) {
    const std::vector<OffsetRow> rows{{0, 0, 0},    {1, 0, 0},    {2, 5, -5},   {3, 10, -10},
                                      {4, 20, -20}, {5, 20, -20}, {6, 30, -30}, {7, 30, -30}};
    for (const OffsetRow& row : rows) {
        EXPECT_EQ(row.ofAMan, layouter.getLineOffset(row.spouseCount, true)) << row.spouseCount;
        EXPECT_EQ(row.ofAWoman, layouter.getLineOffset(row.spouseCount, false)) << row.spouseCount;
    }
}

TEST_F(FamilyPlacement, lineOffsetsAreCutTowardZero) {
    layouter.treeSize.spouseLineStep = 7.5f;
    EXPECT_EQ(3, layouter.getLineOffset(2, true));
    EXPECT_EQ(-3, layouter.getLineOffset(2, false));
    EXPECT_EQ(7, layouter.getLineOffset(3, true));
    EXPECT_EQ(-7, layouter.getLineOffset(3, false));
}

TEST_F(FamilyPlacement, personAloneStandsInTheMiddleOfItsSpan) {
    measureAndPlace(focus, 100.0f, 7.0f);
    EXPECT_EQ((Point{127.5f, 7.0f}), placeOf(focus));
}

TEST_F(FamilyPlacement, personWithUnknownChildrenStandsOverTheirBlock) {
    focus.addChildWithNoOtherSpouse(1, kMale);
    focus.addChildWithNoOtherSpouse(2, kMale);
    placeUnit();
    EXPECT_EQ((Point{67.5f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(unknownChild(focus, 0)));
    EXPECT_EQ((Point{107.5f, 110.0f}), placeOf(unknownChild(focus, 1)));
}

TEST_F(FamilyPlacement, childlessCoupleStandsSideBySide) {
    addSpouses(1);
    placeUnit();
    EXPECT_EQ((Point{27.5f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{107.5f, 0.0f}), placeOf(spouse()));
}

TEST_F(FamilyPlacement, womanStandsAtTheRightOfHerHusband) {
    makeFocusAWoman();
    addSpouses(1);
    placeUnit();
    EXPECT_EQ((Point{27.5f, 0.0f}), placeOf(spouse()));
    EXPECT_EQ((Point{107.5f, 0.0f}), placeOf(focus));
}

TEST_F(FamilyPlacement, twoChildrenStandUnderTheirParents) {
    addSpouses(1);
    focus.addChildWithSpouse(5, 1, kMale);
    focus.addChildWithSpouse(6, 1, kFemale);
    placeUnit();
    EXPECT_EQ((Point{27.5f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{107.5f, 0.0f}), placeOf(spouse()));
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(childUnder(focus, 1, 0)));
    EXPECT_EQ((Point{107.5f, 110.0f}), placeOf(childUnder(focus, 1, 1)));
}

TEST_F(FamilyPlacement, onlyChildStandsUnderTheMiddleOfTheCouple) {
    addSpouses(1);
    focus.addChildWithSpouse(5, 1, kMale);
    placeUnit();
    EXPECT_EQ((Point{67.5f, 110.0f}), placeOf(childUnder(focus, 1)));
}

TEST_F(FamilyPlacement, coupleStandsOverTheMiddleOfAWideBlockOfChildren) {
    addSpouses(1);
    for (const int child : {5, 6, 7}) focus.addChildWithSpouse(child, 1, kMale);
    placeUnit();
    EXPECT_EQ((Point{67.5f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{147.5f, 0.0f}), placeOf(spouse()));
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(childUnder(focus, 1, 0)));
    EXPECT_EQ((Point{187.5f, 110.0f}), placeOf(childUnder(focus, 1, 2)));
}

TEST_F(FamilyPlacement, womanStandsWithHerLastHusbandAndTheFirstStandsAlone) {
    makeFocusAWoman();
    addSpouses(2);
    placeUnit();
    EXPECT_EQ((Point{67.5f, 0.0f}), placeOf(spouse(0)));
    EXPECT_EQ((Point{187.5f, 0.0f}), placeOf(spouse(1)));
    EXPECT_EQ((Point{267.5f, 0.0f}), placeOf(focus));
}

TEST_F(FamilyPlacement, manStandsWithHisFirstWifeAndTheOthersStandAlone) {
    addSpouses(3);
    placeUnit();
    EXPECT_EQ((Point{27.5f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{107.5f, 0.0f}), placeOf(spouse(0)));
    EXPECT_EQ((Point{227.5f, 0.0f}), placeOf(spouse(1)));
    EXPECT_EQ((Point{387.5f, 0.0f}), placeOf(spouse(2)));
}

TEST_F(FamilyPlacement, manWithAnUnknownChildFormsNoCouple) {
    addSpouses(1);
    focus.addChildWithNoOtherSpouse(5, kMale);
    placeUnit();
    EXPECT_EQ((Point{27.5f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(unknownChild(focus)));
    EXPECT_EQ((Point{147.5f, 0.0f}), placeOf(spouse()));
}

TEST_F(FamilyPlacement, spouseWithoutACoupleIsStillJoinedByALine) {
    addSpouses(1);
    focus.addChildWithNoOtherSpouse(5, kMale);
    placeUnit();
    drawLines();
    EXPECT_EQ((views::Segment{82, 40, 147, 40, true}), views::segmentsOf(focus).front());
}

TEST_F(FamilyPlacement, womanWithAnUnknownChildStandsRightOfHerHusbandsBlock) {
    makeFocusAWoman();
    addSpouses(1);
    focus.addChildWithNoOtherSpouse(5, kMale);
    placeUnit();
    EXPECT_EQ((Point{67.5f, 0.0f}), placeOf(spouse()));
    EXPECT_EQ((Point{187.5f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{187.5f, 110.0f}), placeOf(unknownChild(focus)));
}

TEST_F(FamilyPlacement, lineOffsetsOfAMansWivesRunDownward) {
    addSpouses(3);
    placeUnit();
    EXPECT_EQ((std::vector<float>{10, 0, -10}), spouseOffsets());
}

TEST_F(FamilyPlacement, lineOffsetsOfTwoWivesLieAboutZero) {
    addSpouses(2);
    placeUnit();
    EXPECT_EQ((std::vector<float>{5, -5}), spouseOffsets());
}

TEST_F(FamilyPlacement, lineOffsetsOfAWomansHusbandsRunUpward) {
    makeFocusAWoman();
    addSpouses(3);
    placeUnit();
    EXPECT_EQ((std::vector<float>{-10, 0, 10}), spouseOffsets());
}

TEST_F(FamilyPlacement, lineOffsetsOfAManWithUnknownChildrenRunDownwardToo) {
    addSpouses(2);
    focus.addChildWithNoOtherSpouse(5, kMale);
    placeUnit();
    EXPECT_EQ((std::vector<float>{5, -5}), spouseOffsets());
}

TEST_F(FamilyPlacement, lineOffsetsOfAWomanWithUnknownChildrenRunAwayFromZero) {
    makeFocusAWoman();
    addSpouses(3);
    focus.addChildWithNoOtherSpouse(5, kMale);
    placeUnit();
    EXPECT_EQ((std::vector<float>{-10, -20, -30}), spouseOffsets());
}

TEST_F(FamilyPlacement, lineOffsetOfACoupleIsCutTowardZeroAtEachStep) {
    layouter.treeSize.spouseLineStep = 7.5f;
    addSpouses(3);
    placeUnit();
    EXPECT_EQ((std::vector<float>{7, 0, -7}), spouseOffsets());  // 7.5, 7 - 7.5 = -0.5, 0 - 7.5
}

TEST_F(FamilyPlacement, nonCombinedSpouseWithoutChildrenStandsInTheMiddleOfAnEmptySpan) {
    addSpouses(2);
    placeUnit();
    EXPECT_EQ((Point{160.0f + 67.5f, 0.0f}), placeOf(spouse(1)));
}

TEST_F(FamilyPlacement, nonCombinedWifeHasHerOwnChildrenAtTheRight) {
    addSpouses(2);
    spouse(1).addChildWithNoOtherSpouse(8, kMale);
    focus.addChildWithSpouse(7, 2, kMale);
    placeUnit();
    EXPECT_EQ((Point{227.5f, 0.0f}), placeOf(spouse(1)));
    EXPECT_EQ((Point{187.5f, 110.0f}), placeOf(childUnder(focus, 2)));
    EXPECT_EQ((Point{267.5f, 110.0f}), placeOf(unknownChild(spouse(1))));
}

TEST_F(FamilyPlacement, nonCombinedHusbandHasHisOwnChildrenAtTheLeft) {
    makeFocusAWoman();
    addSpouses(2);
    spouse(0).addChildWithNoOtherSpouse(8, kMale);
    focus.addChildWithSpouse(7, 1, kMale);
    placeUnit();
    EXPECT_EQ((Point{67.5f, 0.0f}), placeOf(spouse(0)));
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(unknownChild(spouse(0))));
    EXPECT_EQ((Point{107.5f, 110.0f}), placeOf(childUnder(focus, 1)));
}

TEST_F(FamilyPlacement, wifeInACoupleHasHerOwnChildrenAtTheRight) {
    addSpouses(1);
    spouse().addChildWithNoOtherSpouse(8, kMale);
    focus.addChildWithSpouse(7, 1, kMale);
    placeUnit();
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(childUnder(focus, 1)));
    EXPECT_EQ((Point{107.5f, 110.0f}), placeOf(unknownChild(spouse())));
}

TEST_F(FamilyPlacement, husbandInACoupleHasHisOwnChildrenAtTheLeft) {
    makeFocusAWoman();
    addSpouses(1);
    spouse().addChildWithNoOtherSpouse(8, kMale);
    focus.addChildWithSpouse(7, 1, kMale);
    placeUnit();
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(unknownChild(spouse())));
    EXPECT_EQ((Point{107.5f, 110.0f}), placeOf(childUnder(focus, 1)));
}

TEST_F(FamilyPlacement, childrenOfANonCombinedSpouseStandOneRowBelowHer) {
    addSpouses(2);
    focus.addChildWithSpouse(7, 2, kMale);
    spouse(1).addChildWithNoOtherSpouse(8, kMale);
    measureAndPlace(focus, 0.0f, 1000.0f);
    EXPECT_EQ(1000.0f, placeOf(spouse(1)).y);
    EXPECT_EQ(1110.0f, placeOf(childUnder(focus, 2)).y);
    EXPECT_EQ(1110.0f, placeOf(unknownChild(spouse(1))).y);
}

// The first wife's block measures 135, but her married son's unit alone fills that: his brother stands in the
// span of the second wife, whose own child is set there as well.
TEST_F(FamilyPlacement, unitThatMeasuredTooNarrowRunsUnderTheNextOne) {
    addSpouses(2);
    spouse(0).addChildWithNoOtherSpouse(10, kMale);
    spouse(0).addChildWithNoOtherSpouse(11, kMale);
    unknownChild(spouse(0)).addSpouse(12, kFemale);
    focus.addChildWithSpouse(7, 2, kMale);
    placeUnit();
    EXPECT_EQ(135.0f, spouse(0).layoutWidth);
    EXPECT_EQ((Point{187.5f, 110.0f}), placeOf(unknownChild(spouse(0), 1)));
    EXPECT_EQ((Point{227.5f, 110.0f}), placeOf(childUnder(focus, 2)));
}

TEST_F(FamilyPlacement, grandchildrenStandTwoRowsDown) {
    addSpouses(1);
    TreeViewPerson& child = focus.addChildWithSpouse(5, 1, kMale);
    child.addSpouse(6, kFemale);
    child.addChildWithSpouse(7, 6, kMale);
    measureAndPlace(focus, 10.0f, 1000.0f);
    EXPECT_EQ((Point{37.5f, 1110.0f}), placeOf(child));
    EXPECT_EQ((Point{117.5f, 1110.0f}), placeOf(child.spouses.front()));
    EXPECT_EQ((Point{77.5f, 1220.0f}), placeOf(childUnder(child, 6)));
}

TEST_F(FamilyPlacement, onlyChildrenOfACoupleAreTouched) {
    addSpouses(2);
    focus.addChildWithSpouse(5, 1, kMale);
    spouse(0).addChildWithNoOtherSpouse(6, kMale);
    focus.addChildWithSpouse(7, 2, kMale);
    spouse(1).addChildWithNoOtherSpouse(8, kMale);
    placeUnit();
    EXPECT_EQ((std::vector<int>{5, 6}), data.touched);
}

TEST_F(FamilyPlacement, unknownChildrenAreNotTouched) {
    focus.addChildWithNoOtherSpouse(5, kMale);
    placeUnit();
    EXPECT_TRUE(data.touched.empty());
}

// Each child is touched before its own family, and that family before the next child.
TEST_F(FamilyPlacement, unitsArePlacedDepthFirst) {
    addSpouses(1);
    TreeViewPerson& first = focus.addChildWithSpouse(5, 1, kMale);
    first.addSpouse(6, kFemale);
    first.addChildWithSpouse(7, 6, kMale);
    focus.addChildWithSpouse(8, 1, kMale);
    placeUnit();
    EXPECT_EQ((std::vector<int>{5, 7, 8}), data.touched);
}

TEST_F(FamilyPlacement, coupleIsAsWideAsTheWidestOfPairHusbandAndWife) {
    TreeViewPerson& wife = focus.addSpouse(1, kFemale);
    const auto coupleWidth = [&](float husbands, float wifes) {
        focus.layoutWidth = husbands;
        wife.layoutWidth = wifes;
        return layouter.layoutTraditionalHusbandAndWife(focus, wife, focus.getChildrenIterator(1), 0.0f,
                                                        0.0f);
    };
    EXPECT_EQ(135.0f, coupleWidth(55.0f, 60.0f));
    EXPECT_EQ(300.0f, coupleWidth(55.0f, 300.0f));
    EXPECT_EQ((Point{110.0f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{190.0f, 0.0f}), placeOf(wife));
    EXPECT_EQ(400.0f, coupleWidth(400.0f, 300.0f));
}

TEST_F(FamilyPlacement, nextSpouseStartsAGapBehindTheCouple) {
    addSpouses(2);
    for (const int child : {5, 6, 7}) focus.addChildWithSpouse(child, 1, kMale);
    placeUnit();
    EXPECT_EQ((Point{215.0f + 25.0f + 67.5f, 0.0f}), placeOf(spouse(1)));
}

TEST_F(FamilyPlacement, rowOfChildrenEndsAGapBehindTheLastUnit) {
    focus.addChildWithNoOtherSpouse(1, kMale);
    focus.addChildWithNoOtherSpouse(2, kMale);
    measure(focus);
    EXPECT_EQ(170.0f, layouter.layoutChildrenOfParents(focus.getChildrenIterator(-1), 500.0f, 10.0f));
    EXPECT_EQ((Point{37.5f, 500.0f}), placeOf(unknownChild(focus, 0))) << "y comes before x";
}

TEST_F(FamilyPlacement, unknownChildrenStandOneRowBelowTheRowGiven) {
    focus.addChildWithNoOtherSpouse(1, kMale);
    measure(focus);
    EXPECT_EQ(90.0f, layouter.layoutUnknownChildren(focus, 10.0f, 500.0f));
    EXPECT_EQ((Point{37.5f, 610.0f}), placeOf(unknownChild(focus)));
}

TEST_F(FamilyPlacement, withoutUnknownChildrenTheRunningXStays) {
    EXPECT_EQ(33.0f, layouter.layoutUnknownChildren(focus, 33.0f, 0.0f));
}

TEST_F(FamilyPlacement, personIsCentredOverItsUnknownChildrenInOneStep) {
    focus.addChildWithNoOtherSpouse(1, kMale);
    focus.addChildWithNoOtherSpouse(2, kMale);
    measure(focus);
    EXPECT_EQ(160.0f, layouter.layoutUnknownChildrenAndPerson(focus, 0.0f, 0.0f));
    EXPECT_EQ((Point{67.5f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{107.5f, 110.0f}), placeOf(unknownChild(focus, 1)));
}

TEST_F(FamilyPlacement, oneStepOfANonCombinedSpouseMovesXAndOffset) {
    TreeViewPerson& wife = focus.addSpouse(1, kFemale);
    wife.layoutWidth = 135.0f;
    layouter.treeSize.spouseLineStep = 7.5f;
    float x = 100.0f;
    int offset = 5;
    layouter.layoutSpouse(wife, focus.getChildrenIterator(1), 20.0f, &x, &offset, true);
    EXPECT_EQ((Point{167.5f, 20.0f}), placeOf(wife));
    EXPECT_EQ(5.0f, wife.spouseLineOffset);
    EXPECT_EQ(-2, offset);
    EXPECT_EQ(260.0f, x);
    offset = -5;
    layouter.layoutSpouse(wife, focus.getChildrenIterator(1), 20.0f, &x, &offset, false);
    EXPECT_EQ(-5.0f, wife.spouseLineOffset);
    EXPECT_EQ(2, offset);
}

TEST_F(FamilyPlacement, emptyWalkOverChildrenFails) {
    TreeViewPerson& wife = focus.addSpouse(1, kFemale);
    measure(focus);
    const TreeViewPerson::Iterator none;
    EXPECT_THROW(layouter.layoutChildrenOfParents(none, 0.0f, 0.0f), boost::bad_function_call);
    EXPECT_THROW(layouter.layoutTraditionalHusbandAndWife(focus, wife, none, 0.0f, 0.0f),
                 boost::bad_function_call);
}

TEST_F(FamilyPlacement, childOfACoupleNeedsTheTouch) {
    addSpouses(1);
    adapter.touchPerson.clear();
    EXPECT_NO_THROW(placeUnit());
    focus.addChildWithSpouse(5, 1, kMale);
    EXPECT_THROW(placeUnit(), boost::bad_function_call);
}

TEST_F(FamilyPlacement, placesFollowTheSizesGiven) {
    layouter.treeSize = TreeSize{100.0f, 40.0f, 10.0f, 20.0f, 4.0f, 0.0f};
    addSpouses(2);
    focus.addChildWithSpouse(5, 1, kMale);
    placeUnit();
    EXPECT_EQ((Point{50.0f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{160.0f, 0.0f}), placeOf(spouse(0)));
    EXPECT_EQ((Point{105.0f, 60.0f}), placeOf(childUnder(focus, 1)));
    EXPECT_EQ((Point{325.0f, 0.0f}), placeOf(spouse(1)));
    EXPECT_EQ((std::vector<float>{2, -2}), spouseOffsets());
}

}  // namespace
