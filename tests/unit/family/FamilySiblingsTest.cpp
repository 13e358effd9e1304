// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where siblings stand beside the focus, and the parents' siblings beside the parents. A childless sibling's
// unit is 55 wide and its box stands 27.5 into it; a sibling list holds an entry for the person itself, which
// is never placed.

#include <gtest/gtest.h>

#include <stdexcept>
#include <vector>

#include "HandMadeFamily.h"

namespace {

using views::kFemale;
using views::kMale;
using views::place;
using views::placeOf;
using views::Point;

class FamilySiblings : public views::HandMadeFamily {
protected:
    // Measures the focus's unit and sets out its siblings, given by key in list order; 0 is the focus's own.
    float setOutSiblings(const std::vector<int>& keys) {
        for (const int key : keys) focus.addSibling(key, kMale);
        measureAndPlace(focus, 0.0f, 0.0f);
        return layouter.layoutSiblings(focus);
    }
    TreeViewPerson& sibling(std::size_t index) { return focus.siblings.at(index); }
};

// A focus with its own entry at x 0, and two parents at the places that a focus at 27.5 gives them.
class AuntsAndUncles : public FamilySiblings {
protected:
    AuntsAndUncles() {
        focus.addSibling(0, kMale);
        focus.setParents(100, 200);
        place(father(), -12.5f, -110.0f);
        place(mother(), 67.5f, -110.0f);
    }
    TreeViewPerson& father() { return focus.getPreferredFather(); }
    TreeViewPerson& mother() { return focus.getPreferredMother(); }
    float setOutFathersSiblings(const std::vector<int>& keys) {
        for (const int key : keys) father().addSibling(key, kMale);
        return layouter.layoutFatherSiblings(focus, 9999.0f, -110.0f);
    }
    float setOutMothersSiblings(const std::vector<int>& keys) {
        for (const int key : keys) mother().addSibling(key, kMale);
        return layouter.layoutMotherSiblings(focus, 9999.0f, -110.0f);
    }
    // A sibling of the focus, already placed on row 0.
    TreeViewPerson& placedSibling(int key, bool male, float x) {
        TreeViewPerson& one = focus.addSibling(key, male);
        place(one, x, 0.0f);
        return one;
    }
    void addPlacedSpouse(TreeViewPerson& person, int key, float x) {
        place(person.addSpouse(key, !person.gender), x, 0.0f);
    }
};

TEST_F(FamilySiblings, withoutAListTheRowEndsAtZero) {
    EXPECT_EQ(0.0f, setOutSiblings({}));
}

TEST_F(FamilySiblings, ownEntryAloneEndsTheRowAGapBehindTheFocus) {
    EXPECT_EQ(80.0f, setOutSiblings({0}));
    EXPECT_EQ((Point{0.0f, 0.0f}), placeOf(sibling(0)));
}

TEST_F(FamilySiblings, siblingBehindTheFocusStandsRightOfIt) {
    EXPECT_EQ(160.0f, setOutSiblings({0, 1}));
    EXPECT_EQ((Point{80.0f + 27.5f, 0.0f}), placeOf(sibling(1)));
}

TEST_F(FamilySiblings, siblingBeforeTheFocusStandsLeftOfIt) {
    EXPECT_EQ(80.0f, setOutSiblings({1, 0}));
    EXPECT_EQ((Point{-80.0f + 27.5f, 0.0f}), placeOf(sibling(0)));
}

TEST_F(FamilySiblings, rowFollowsTheListFromLeftToRight) {
    EXPECT_EQ(240.0f, setOutSiblings({1, 2, 0, 3, 4}));
    EXPECT_EQ(-132.5f, placeOf(sibling(0)).x);
    EXPECT_EQ(-52.5f, placeOf(sibling(1)).x);
    EXPECT_EQ((Point{0.0f, 0.0f}), placeOf(sibling(2)));
    EXPECT_EQ(107.5f, placeOf(sibling(3)).x);
    EXPECT_EQ(187.5f, placeOf(sibling(4)).x);
}

TEST_F(FamilySiblings, withoutAnOwnEntryEverySiblingStandsAtTheLeft) {
    EXPECT_EQ(-160.0f, setOutSiblings({1, 2}));
    EXPECT_EQ(-52.5f, placeOf(sibling(1)).x);
    EXPECT_EQ(-132.5f, placeOf(sibling(0)).x);
}

TEST_F(FamilySiblings, rightHandSideStartsBehindTheFocussWholeUnit) {
    focus.addSpouse(9, kFemale);
    EXPECT_EQ(240.0f, setOutSiblings({0, 1}));
    EXPECT_EQ(160.0f + 27.5f, placeOf(sibling(1)).x);
}

TEST_F(FamilySiblings, siblingsFamilyIsMeasuredWhenItIsReached) {
    focus.addSibling(1, kMale).addSpouse(7, kFemale);
    sibling(0).addChildWithSpouse(8, 7, kMale);
    EXPECT_EQ(80.0f, setOutSiblings({0}));
    EXPECT_EQ((Point{-160.0f + 27.5f, 0.0f}), placeOf(sibling(0)));
    EXPECT_EQ((Point{-160.0f + 107.5f, 0.0f}), placeOf(sibling(0).spouses.front()));
    EXPECT_EQ((Point{-160.0f + 67.5f, 110.0f}), placeOf(childUnder(sibling(0), 7)));
}

TEST_F(FamilySiblings, rowStaysAtZeroWhereverTheFocusIs) {
    for (const int key : {1, 0, 2}) focus.addSibling(key, kMale);
    measureAndPlace(focus, 0.0f, 500.0f);
    layouter.layoutSiblings(focus);
    EXPECT_EQ(0.0f, placeOf(sibling(0)).y);
    EXPECT_EQ(0.0f, placeOf(sibling(2)).y);
}

TEST_F(FamilySiblings, everyEntryIsTouchedOutwardFromTheFocus) {
    setOutSiblings({1, 2, 0, 3});
    EXPECT_EQ((std::vector<int>{2, 1, 0, 3}), data.touched);
}

TEST_F(FamilySiblings, rowIsSetOutWithoutATouchToo) {
    adapter.touchPerson.clear();
    EXPECT_EQ(160.0f, setOutSiblings({0, 1}));
}

TEST_F(AuntsAndUncles, fatherWithoutAListHandsTheXBack) {
    EXPECT_EQ(9999.0f, setOutFathersSiblings({}));
}

TEST_F(AuntsAndUncles, motherWithoutAListHandsTheXBack) {
    EXPECT_EQ(9999.0f, setOutMothersSiblings({}));
}

TEST_F(AuntsAndUncles, unitOfTheFathersBrotherStartsHalfABoxAndAGapLeftOfTheAnchor) {
    EXPECT_EQ(-120.0f, setOutFathersSiblings({100, 101}));
    EXPECT_EQ((Point{-120.0f + 27.5f, -110.0f}), placeOf(father().siblings[1]));
    EXPECT_EQ((Point{0.0f, 0.0f}), placeOf(father().siblings[0])) << "his own entry is not placed";
}

TEST_F(AuntsAndUncles, unitOfTheMothersBrotherStartsABoxAndTwoGapsRightOfTheAnchor) {
    EXPECT_EQ(252.5f, setOutMothersSiblings({200, 201}));
    EXPECT_EQ((Point{172.5f + 27.5f, -110.0f}), placeOf(mother().siblings[1]));
}

TEST_F(AuntsAndUncles, allFathersSiblingsStandLeftOfHimTheLastOneNearest) {
    EXPECT_EQ(-200.0f, setOutFathersSiblings({101, 100, 102}));
    EXPECT_EQ(-120.0f + 27.5f, placeOf(father().siblings[2]).x);
    EXPECT_EQ(-200.0f + 27.5f, placeOf(father().siblings[0]).x);
}

TEST_F(AuntsAndUncles, allMothersSiblingsStandRightOfHerTheFirstOneNearest) {
    EXPECT_EQ(332.5f, setOutMothersSiblings({201, 200, 202}));
    EXPECT_EQ(172.5f + 27.5f, placeOf(mother().siblings[0]).x);
    EXPECT_EQ(252.5f + 27.5f, placeOf(mother().siblings[2]).x);
}

TEST_F(AuntsAndUncles, familiesAreMeasuredWhenTheyAreReached) {
    father().addSibling(101, kMale).addSpouse(7, kFemale);
    EXPECT_EQ(-200.0f, setOutFathersSiblings({}));
    EXPECT_EQ(-200.0f + 27.5f, placeOf(father().siblings[0]).x);
    mother().addSibling(201, kMale).addSpouse(8, kFemale);
    mother().addSibling(202, kMale);
    EXPECT_EQ(172.5f + 135.0f + 25.0f + 55.0f + 25.0f, setOutMothersSiblings({}));
    EXPECT_EQ(332.5f + 27.5f, placeOf(mother().siblings[1]).x);
}

TEST_F(AuntsAndUncles, fathersSideStartsAtTheLeftmostSiblingOfTheFocus) {
    placedSibling(1, kMale, -52.5f);
    placedSibling(2, kMale, -132.5f);
    placedSibling(3, kMale, 107.5f);
    EXPECT_EQ(-132.5f - 27.5f - 80.0f, setOutFathersSiblings({101}));
}

TEST_F(AuntsAndUncles, mothersSideStartsAtTheRightmostSiblingOfTheFocus) {
    placedSibling(1, kMale, 107.5f);
    placedSibling(2, kMale, 187.5f);
    placedSibling(3, kMale, -52.5f);
    EXPECT_EQ(187.5f + 105.0f + 80.0f, setOutMothersSiblings({201}));
}

TEST_F(AuntsAndUncles, ownEntryAtZeroTakesPartInTheSearch) {
    place(father(), 500.0f, -110.0f);
    place(mother(), -500.0f, -110.0f);
    placedSibling(1, kMale, 107.5f);
    EXPECT_EQ(0.0f - 27.5f - 80.0f, setOutFathersSiblings({101}));
    focus.siblings.back().nodeCenter.x = -107.5f;
    EXPECT_EQ(0.0f + 105.0f + 80.0f, setOutMothersSiblings({201}));
}

TEST_F(AuntsAndUncles, parentFartherOutThanEverySiblingIsTheAnchor) {
    place(father(), -500.0f, -110.0f);
    place(mother(), 500.0f, -110.0f);
    EXPECT_EQ(-500.0f - 27.5f - 80.0f, setOutFathersSiblings({101}));
    EXPECT_EQ(500.0f + 105.0f + 80.0f, setOutMothersSiblings({201}));
}

TEST_F(AuntsAndUncles, leftmostSisterWithTwoHusbandsAnchorsAtTheLastOfThem) {
    TreeViewPerson& sister = placedSibling(1, kFemale, -300.0f);
    addPlacedSpouse(sister, 11, -460.0f);
    addPlacedSpouse(sister, 12, -380.0f);
    EXPECT_EQ(-380.0f - 27.5f - 80.0f, setOutFathersSiblings({101}));
}

TEST_F(AuntsAndUncles, rightmostBrotherWithTwoWivesAnchorsAtTheLastOfThem) {
    TreeViewPerson& brother = placedSibling(1, kMale, 300.0f);
    addPlacedSpouse(brother, 11, 380.0f);
    addPlacedSpouse(brother, 12, 540.0f);
    EXPECT_EQ(540.0f + 105.0f + 80.0f, setOutMothersSiblings({201}));
}

TEST_F(AuntsAndUncles, leftmostBrotherAndRightmostSisterAreAnchorsThemselves) {
    TreeViewPerson& brother = placedSibling(1, kMale, -300.0f);
    addPlacedSpouse(brother, 11, -220.0f);
    EXPECT_EQ(-300.0f - 27.5f - 80.0f, setOutFathersSiblings({101}));
    TreeViewPerson& sister = placedSibling(2, kFemale, 300.0f);
    addPlacedSpouse(sister, 12, 220.0f);
    EXPECT_EQ(300.0f + 105.0f + 80.0f, setOutMothersSiblings({201}));
}

TEST_F(AuntsAndUncles, earlierSiblingWinsATieOnTheLeft) {
    TreeViewPerson& earlier = placedSibling(1, kFemale, -80.0f);
    addPlacedSpouse(earlier, 11, -160.0f);
    TreeViewPerson& later = placedSibling(2, kFemale, -80.0f);
    addPlacedSpouse(later, 12, -999.0f);
    EXPECT_EQ(-160.0f - 27.5f - 80.0f, setOutFathersSiblings({101}));
}

TEST_F(AuntsAndUncles, earlierSiblingWinsATieOnTheRight) {
    TreeViewPerson& earlier = placedSibling(1, kMale, 80.0f);
    addPlacedSpouse(earlier, 11, 160.0f);
    TreeViewPerson& later = placedSibling(2, kMale, 80.0f);
    addPlacedSpouse(later, 12, 999.0f);
    EXPECT_EQ(160.0f + 105.0f + 80.0f, setOutMothersSiblings({201}));
}

// The x kept in the search is cut to a whole point: -80.9 is kept as -80, and -80.5 then lies left of it.
TEST_F(AuntsAndUncles, outermostSiblingIsKeptInWholePoints) {
    placedSibling(1, kMale, -80.875f);
    placedSibling(2, kMale, -80.5f);
    EXPECT_EQ(-80.5f - 27.5f - 80.0f, setOutFathersSiblings({101}));
    placedSibling(3, kMale, 80.875f);
    placedSibling(4, kMale, 80.5f);
    EXPECT_EQ(80.5f + 105.0f + 80.0f, setOutMothersSiblings({201}));
}

TEST_F(AuntsAndUncles, withoutASiblingListTheFocusIsTheAnchor) {
    focus.siblings.clear();
    place(focus, -300.0f, 0.0f);
    EXPECT_EQ(-300.0f - 27.5f - 80.0f, setOutFathersSiblings({101}));
    place(focus, 300.0f, 0.0f);
    addPlacedSpouse(focus, 11, 380.0f);
    EXPECT_EQ(380.0f + 105.0f + 80.0f, setOutMothersSiblings({201})) << "a man's last wife stands in for him";
}

TEST_F(AuntsAndUncles, fathersSideTouchesTheAnchorAndEachSiblingOnce) {
    placedSibling(1, kMale, -52.5f);
    setOutFathersSiblings({101, 100, 102});
    EXPECT_EQ((std::vector<int>{1, 102, 101}), data.touched);
}

TEST_F(AuntsAndUncles, mothersSideTouchesNobody) {
    setOutMothersSiblings({200, 201});
    EXPECT_TRUE(data.touched.empty());
}

TEST_F(AuntsAndUncles, fathersSideNeedsTheTouchAndTheMothersDoesNot) {
    adapter.touchPerson.clear();
    EXPECT_THROW(setOutFathersSiblings({101}), boost::bad_function_call);
    EXPECT_NO_THROW(setOutMothersSiblings({201}));
}

TEST_F(AuntsAndUncles, parentsAreThoseOfTheFocusForEveryPersonPassed) {
    father().addSibling(101, kMale);
    TreeViewPerson other(5);
    other.addSibling(5, kMale);
    EXPECT_EQ(-120.0f, layouter.layoutFatherSiblings(other, 0.0f, -110.0f));
}

TEST_F(FamilySiblings, parentsSidesFailWithoutTheParent) {
    EXPECT_THROW(layouter.layoutFatherSiblings(focus, 0.0f, 0.0f), std::out_of_range);
    EXPECT_THROW(layouter.layoutMotherSiblings(focus, 0.0f, 0.0f), std::out_of_range);
}

}  // namespace
