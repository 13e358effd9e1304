// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the focus's spouses and children stand: spouses below the focus at x 27.5, children in one column at
// x -52.5, stacked by the other parent with those of no known other parent on top. The focus stands at
// (27.5, 0) and the pitch is 110.

#include <gtest/gtest.h>

#include <vector>

#include <unit/family/LaidOutCase.h>

#include "HandMadePedigree.h"

namespace {

using views::placeOf;
using views::Point;

class PedigreeFocusFamily : public views::HandMadePedigree {
protected:
    void setOut() { layouter.addAndLayoutChildrenAndSpousesOfFocusPerson(focus); }
    // The heights of the children with one other parent, -1 for none; all of them stand in the column.
    std::vector<float> childHeights(int otherParent) {
        std::vector<float> heights;
        focus.childrenIterator(otherParent, [&heights](TreeViewPerson& child) {
            EXPECT_EQ(-52.5f, placeOf(child).x);
            heights.push_back(placeOf(child).y);
        });
        return heights;
    }
};

typedef std::vector<float> Heights;

TEST_F(PedigreeFocusFamily, ofALoneFocusIsEmpty) {
    setOut();
    EXPECT_TRUE(focus.spouses.empty());
    EXPECT_EQ(0, focus.getAllChildrenCount());
    EXPECT_EQ((Point{27.5f, 0.0f}), placeOf(focus));
}

TEST_F(PedigreeFocusFamily, childlessSpouseStandsBelowTheFocus) {
    addWifeWithChildren(1, {});
    setOut();
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(spouse()));
}

TEST_F(PedigreeFocusFamily, onlyChildStandsBesideTheMiddleOfTheCouple) {
    addWifeWithChildren(1, {5});
    setOut();
    EXPECT_EQ((Point{-52.5f, 55.0f}), placeOf(childUnder(1)));
}

TEST_F(PedigreeFocusFamily, twoChildrenStandLevelWithTheCouple) {
    addWifeWithChildren(1, {5, 6});
    setOut();
    EXPECT_EQ((Heights{0, 110}), childHeights(1));
}

TEST_F(PedigreeFocusFamily, threeChildrenStandAroundTheMiddleOfTheCouple) {
    addWifeWithChildren(1, {5, 6, 7});
    setOut();
    EXPECT_EQ((Heights{-55, 55, 165}), childHeights(1));
}

TEST_F(PedigreeFocusFamily, unknownChildStandsOnePitchAboveTheSharedOnes) {
    addWifeWithChildren(1, {5});
    setChildrenWithoutSecondParent({6});
    setOut();
    EXPECT_EQ((Heights{55}), childHeights(1));
    EXPECT_EQ((Heights{-55}), childHeights(-1));
}

TEST_F(PedigreeFocusFamily, unknownChildrenContinueTheStackUpward) {
    addWifeWithChildren(1, {5, 6});
    setChildrenWithoutSecondParent({7, 8});
    setOut();
    EXPECT_EQ((Heights{0, 110}), childHeights(1));
    EXPECT_EQ((Heights{-220, -110}), childHeights(-1));
}

TEST_F(PedigreeFocusFamily, unknownChildOfAFocusWithAChildlessSpouseStandsAboveTheFocus) {
    addWifeWithChildren(1, {});
    setChildrenWithoutSecondParent({5});
    setOut();
    EXPECT_EQ((Heights{-80}), childHeights(-1));
}

TEST_F(PedigreeFocusFamily, unknownChildrenOfAnUnmarriedFocusEndAtItsTop) {
    setChildrenWithoutSecondParent({5, 6});
    setOut();
    EXPECT_EQ((Heights{-190, -80}), childHeights(-1));
}

TEST_F(PedigreeFocusFamily, secondSpouseStandsLevelWithHerOwnChildrenOrBelowTheFirst) {
    addWifeWithChildren(1, {5});
    addWifeWithChildren(2, {6});
    setOut();
    EXPECT_EQ((Heights{55}), childHeights(1));
    EXPECT_EQ((Heights{165}), childHeights(2));
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(spouse(0)));
    EXPECT_EQ((Point{27.5f, 220.0f}), placeOf(spouse(1)));
}

TEST_F(PedigreeFocusFamily, childrenOfTheSecondSpouseStartWhereTheFirstLeftOff) {
    addWifeWithChildren(1, {});
    addWifeWithChildren(2, {5, 6, 7});
    setOut();
    EXPECT_EQ((Heights{95, 205, 315}), childHeights(2));
    EXPECT_EQ((Point{27.5f, 220.0f}), placeOf(spouse(1)));
}

TEST_F(PedigreeFocusFamily, furtherSpousesSinkToTheMiddleOfTheirChildren) {
    addWifeWithChildren(1, {5});
    addWifeWithChildren(2, {6, 7, 8, 9, 10});
    addWifeWithChildren(3, {});
    setOut();
    EXPECT_EQ((Heights{165, 275, 385, 495, 605}), childHeights(2));
    EXPECT_EQ((Point{27.5f, 385.0f}), placeOf(spouse(1)));
    EXPECT_EQ((Point{27.5f, 495.0f}), placeOf(spouse(2)));
}

TEST_F(PedigreeFocusFamily, childlessFurtherSpousesStandOnePitchApart) {
    for (const int wife : {1, 2, 3}) addWifeWithChildren(wife, {});
    setOut();
    EXPECT_EQ((Point{27.5f, 220.0f}), placeOf(spouse(1)));
    EXPECT_EQ((Point{27.5f, 330.0f}), placeOf(spouse(2)));
}

TEST_F(PedigreeFocusFamily, unknownChildFallsBackToTheFocusWhenNoSpouseHasAChild) {
    addWifeWithChildren(1, {});
    addWifeWithChildren(2, {});
    setChildrenWithoutSecondParent({5});
    setOut();
    EXPECT_EQ((Heights{-80}), childHeights(-1));
}

TEST_F(PedigreeFocusFamily, unknownChildStandsAboveTheSecondSpousesChildrenToo) {
    addWifeWithChildren(1, {});
    addWifeWithChildren(2, {5});
    setChildrenWithoutSecondParent({6});
    setOut();
    EXPECT_EQ((Heights{95}), childHeights(2));
    EXPECT_EQ((Heights{-15}), childHeights(-1));
}

TEST_F(PedigreeFocusFamily, firstSpouseOfTheListStandsDirectlyBelow) {
    views::LaidOutCase chart(
        "focus 1\nview pedigree 1 4\nspouses 1 2 3\nspouses 2 1\nspouses 3 1\npreferred 1 3\n");
    EXPECT_EQ((Point{27.5f, 110.0f}), chart.at(2));
    EXPECT_EQ((Point{27.5f, 220.0f}), chart.at(3));
}

// The second node of the first spouse shares its key, so no step places it; the child counts twice.
TEST_F(PedigreeFocusFamily, firstSpouseListedTwiceStandsOnceAndItsSecondNodeStaysUnplaced) {
    addWifeWithChildren(1, {5});
    data.spouses[0] = {1, 1};
    setOut();
    ASSERT_EQ(2u, focus.spouses.size());
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(spouse(0)));
    EXPECT_EQ((Point{0.0f, 0.0f}), placeOf(spouse(1)));
    EXPECT_EQ((Heights{0, 110}), childHeights(1));
}

// Both entries of the spouse set out the same two nodes of the child, so the second time counts: 315 and 425,
// with their middle at 370 for the first entry and a pitch further for the second.
TEST_F(PedigreeFocusFamily, laterSpouseListedTwiceSetsItsChildrenOutTwice) {
    addWifeWithChildren(1, {});
    addWifeWithChildren(2, {5});
    data.spouses[0] = {1, 2, 2};
    setOut();
    EXPECT_EQ((Heights{315, 425}), childHeights(2));
    EXPECT_EQ((Point{27.5f, 370.0f}), placeOf(spouse(1)));
    EXPECT_EQ((Point{27.5f, 480.0f}), placeOf(spouse(2)));
}

TEST_F(PedigreeFocusFamily, everyChildIsEnteredAsShown) {
    addWifeWithChildren(1, {5});
    addWifeWithChildren(2, {6});
    setChildrenWithoutSecondParent({7});
    setOut();
    for (const int key : {1, 2, 5, 6, 7}) EXPECT_EQ(1u, layouter.shownPersons.count(key)) << key;
}

// Also one whom the data source does not list: what counts is that it hangs under the focus.
TEST_F(PedigreeFocusFamily, childThatHangsThereAlreadyIsEnteredAsShown) {
    focus.addChildWithNoOtherSpouse(8, views::kMale);
    setOut();
    EXPECT_EQ(1u, layouter.shownPersons.count(8));
    EXPECT_EQ((Heights{-80}), childHeights(-1));
}

// The record of who is shown goes by the nodes that hang there, not by who was given a place.
TEST_F(PedigreeFocusFamily, childOfASpouseAloneIsEnteredWhereItHangsThere) {
    addWifeWithChildren(1, {5});
    focus.addSpouse(2, views::kFemale).addChildWithNoOtherSpouse(9, views::kMale);
    setOut();
    EXPECT_EQ(1u, layouter.shownPersons.count(9));
}

TEST_F(PedigreeFocusFamily, bringsNoGrandchildrenAndNoStepChildren) {
    addWifeWithChildren(1, {5});
    data.children[1].push_back(8);
    data.parents[8] = {-1, 1};
    data.children[5] = {9};
    data.parents[9] = {5, -1};
    setOut();
    EXPECT_EQ((std::vector<int>{0, 1, 5}), everybody());
    EXPECT_EQ(0u, layouter.shownPersons.count(8));
}

TEST_F(PedigreeFocusFamily, standsWhereTheFocusStands) {
    views::place(focus, 100.0f, 50.0f);
    addWifeWithChildren(1, {5});
    setChildrenWithoutSecondParent({6});
    setOut();
    EXPECT_EQ((Point{100.0f, 160.0f}), placeOf(spouse()));
    EXPECT_EQ((Point{20.0f, 105.0f}), placeOf(childUnder(1)));
    EXPECT_EQ((Point{20.0f, -5.0f}), placeOf(unknownChild()));
}

TEST_F(PedigreeFocusFamily, followsTheSizesGiven) {
    layouter.treeSize = TreeSize{100.0f, 40.0f, 10.0f, 20.0f, 10.0f, 0.0f};
    views::place(focus, 50.0f, 0.0f);
    addWifeWithChildren(1, {5});
    setOut();
    EXPECT_EQ((Point{50.0f, 60.0f}), placeOf(spouse()));
    EXPECT_EQ((Point{-60.0f, 30.0f}), placeOf(childUnder(1)));
}

TEST_F(PedigreeFocusFamily, womansHusbandStandsBelowHerToo) {
    focus.setGender(false);
    data.spouses = {{0, {1}}, {1, {0}}};
    data.children = {{0, {5}}, {1, {5}}};
    data.parents[5] = {1, 0};
    setOut();
    EXPECT_EQ((Point{27.5f, 110.0f}), placeOf(spouse()));
    EXPECT_TRUE(spouse().gender);
    EXPECT_EQ((Heights{55}), childHeights(1));
}

}  // namespace
