// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What both views share: how a layouter starts, its options, and the few placements.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <unit/layouter/BareLayouter.h>

namespace {

using SharedTreeViewer::OptionMap;
using unit::BareLayouter;
using unit::failureOf;
using unit::kEmptyFunctionFailure;

constexpr TreeSize kSize{55.0f, 80.0f, 25.0f, 30.0f, 10.0f, 0.0f};

class LayouterBase : public testing::Test {
protected:
    BareLayouter layouterWith(const OptionMap& options) {
        return BareLayouter(&adapter, 0, 1, options, kSize);
    }

    DataAdapter adapter{{}, {}, {}, {}, {}, {}};
};

TEST_F(LayouterBase, startsWithTheFocusAloneAndNobodyAdmitted) {
    const BareLayouter layouter(&adapter, 7, 0, {}, kSize);
    EXPECT_EQ(7, layouter.focusPerson.personId);
    EXPECT_EQ(0, layouter.focusPerson.getParentCount());
    EXPECT_EQ(0, layouter.focusPerson.getSpouseCount());
    EXPECT_EQ(-1, layouter.focusPerson.preferredFatherIndex);
    EXPECT_EQ(0.0f, layouter.focusPerson.getNodeCenter().x);
    EXPECT_TRUE(layouter.shownPersons.empty());
    EXPECT_EQ(&adapter, layouter.dataAdapter);
}

TEST_F(LayouterBase, focusIsMaleForEveryNumberButZero) {
    EXPECT_FALSE(BareLayouter(&adapter, 0, 0, {}, kSize).focusPerson.gender);
    for (const int isMale : {1, 2, -1}) {
        EXPECT_TRUE(BareLayouter(&adapter, 0, isMale, {}, kSize).focusPerson.gender) << isMale;
    }
}

TEST_F(LayouterBase, keepsCopiesOfOptionsAndSizes) {
    OptionMap options{{"key", true}};
    TreeSize size{1.0f, 2.0f, 3.0f, 4.0f, 5.0f, 6.0f};
    const BareLayouter layouter(&adapter, 0, 1, options, size);
    options["key"] = false;
    size = kSize;
    EXPECT_TRUE(layouter.boolOptionForKey("key", false));
    EXPECT_EQ(1.0f, layouter.treeSize.nodeWidth);
    EXPECT_EQ(2.0f, layouter.treeSize.nodeHeight);
    EXPECT_EQ(3.0f, layouter.treeSize.horzPadding);
    EXPECT_EQ(4.0f, layouter.treeSize.vertPadding);
    EXPECT_EQ(5.0f, layouter.treeSize.spouseLineStep);
    EXPECT_EQ(6.0f, layouter.treeSize.lineInset);
}

// --- Options.

TEST_F(LayouterBase, absentOptionYieldsTheDefaultAndIsNotEntered) {
    const BareLayouter layouter = layouterWith({});
    EXPECT_TRUE(layouter.boolOptionForKey("key", true));
    EXPECT_FALSE(layouter.boolOptionForKey("key", false));
    EXPECT_TRUE(layouter.options.empty());
}

TEST_F(LayouterBase, presentOptionYieldsItsValueWhateverTheDefault) {
    const BareLayouter layouter = layouterWith({{"no", false}, {"yes", true}});
    for (const bool defaultValue : {false, true}) {
        EXPECT_FALSE(layouter.boolOptionForKey("no", defaultValue));
        EXPECT_TRUE(layouter.boolOptionForKey("yes", defaultValue));
    }
}

// --- Placement.

void expectAt(const TreeViewPerson& person, float x, float y) {
    EXPECT_EQ(x, person.getNodeCenter().x);
    EXPECT_EQ(y, person.getNodeCenter().y);
}

TEST_F(LayouterBase, personStandsInTheMiddleOfItsSpan) {
    const BareLayouter layouter = layouterWith({});
    TreeViewPerson person(1);
    layouter.centerPerson(person, 135.0f, 10.0f, 110.0f);
    expectAt(person, 77.5f, 110.0f);
    layouter.centerPerson(person, 55.0f, -55.0f, -110.0f);
    expectAt(person, -27.5f, -110.0f);
}

TEST_F(LayouterBase, coupleStandsEightyApartAroundTheMiddleHusbandLeft) {
    const BareLayouter layouter = layouterWith({});
    TreeViewPerson husband(1);
    TreeViewPerson wife(2);
    layouter.centerHusbandAndWife(husband, wife, 135.0f, 0.0f, 5.0f);
    expectAt(husband, 27.5f, 5.0f);
    expectAt(wife, 107.5f, 5.0f);
    layouter.centerHusbandAndWife(husband, wife, 215.0f, 100.0f, 5.0f);
    expectAt(husband, 167.5f, 5.0f);
    expectAt(wife, 247.5f, 5.0f);
}

TEST_F(LayouterBase, coupleIsFirstPersonLeftWhateverTheSexes) {
    const BareLayouter layouter = layouterWith({});
    TreeViewPerson first(1);
    TreeViewPerson second(2);
    second.setGender(true);
    layouter.centerHusbandAndWife(first, second, 0.0f, 0.0f, 0.0f);
    EXPECT_LT(first.getNodeCenter().x, second.getNodeCenter().x);
}

TEST_F(LayouterBase, distancesFollowTheSizesOfTheLayouter) {
    const BareLayouter layouter(&adapter, 0, 1, {}, TreeSize{10.0f, 20.0f, 4.0f, 0.0f, 0.0f, 0.0f});
    TreeViewPerson husband(1);
    TreeViewPerson wife(2);
    layouter.centerHusbandAndWife(husband, wife, 24.0f, 0.0f, 0.0f);
    expectAt(husband, 5.0f, 0.0f);
    expectAt(wife, 19.0f, 0.0f);
}

// The x of everybody in a row of visited persons that was set out for count of them.
std::vector<float> rowOf(const BareLayouter& layouter, int visited, float centerX, int count) {
    TreeViewPerson owner(1);
    for (int i = 0; i < visited; ++i) owner.addParent(10 + i, true);
    layouter.initializeParentsXAndYCenteredAboveChild(owner.getParentIterator(), -110.0f, centerX, count);
    std::vector<float> xs;
    for (const TreeViewPerson& parent : owner.parents) {
        xs.push_back(parent.getNodeCenter().x);
        EXPECT_EQ(-110.0f, parent.getNodeCenter().y);
    }
    return xs;
}

typedef std::vector<float> Xs;

TEST_F(LayouterBase, rowIsEvenAroundItsCenterInTheOrderOfTheWalk) {
    const BareLayouter layouter = layouterWith({});
    EXPECT_EQ((Xs{27.5f}), rowOf(layouter, 1, 27.5f, 1));
    EXPECT_EQ((Xs{-12.5f, 67.5f}), rowOf(layouter, 2, 27.5f, 2));
    EXPECT_EQ((Xs{-80.0f, 0.0f, 80.0f}), rowOf(layouter, 3, 0.0f, 3));
    EXPECT_EQ((Xs{-92.5f, -12.5f, 67.5f, 147.5f}), rowOf(layouter, 4, 27.5f, 4));
}

// Half a stride is 40; it is the same however many are missing.
TEST_F(LayouterBase, rowOfFewerThanCountedStandsHalfAStrideToTheLeft) {
    const BareLayouter layouter = layouterWith({});
    EXPECT_EQ((Xs{-40.0f}), rowOf(layouter, 1, 0.0f, 2));
    EXPECT_EQ((Xs{-40.0f}), rowOf(layouter, 1, 0.0f, 5));
    EXPECT_EQ((Xs{-80.0f, 0.0f}), rowOf(layouter, 2, 0.0f, 3));  // -40 and 40, were the count right
}

TEST_F(LayouterBase, rowOfCountZeroDoesNotWalk) {
    const BareLayouter layouter = layouterWith({});
    int walks = 0;
    layouter.initializeParentsXAndYCenteredAboveChild([&](const TreeViewPerson::Visitor&) { ++walks; }, 0.0f,
                                                      0.0f, 0);
    EXPECT_EQ(0, walks);
    EXPECT_NO_THROW(layouter.initializeParentsXAndYCenteredAboveChild(TreeViewPerson::Iterator(), 0, 0, 0));
}

TEST_F(LayouterBase, rowIsWalkedTwice) {
    const BareLayouter layouter = layouterWith({});
    int walks = 0;
    layouter.initializeParentsXAndYCenteredAboveChild([&](const TreeViewPerson::Visitor&) { ++walks; }, 0.0f,
                                                      0.0f, 1);
    EXPECT_EQ(2, walks);
}

TEST_F(LayouterBase, emptyWalkOfARowFailsByName) {
    const BareLayouter layouter = layouterWith({});
    EXPECT_EQ(kEmptyFunctionFailure, failureOf<boost::bad_function_call>([&] {
                  layouter.initializeParentsXAndYCenteredAboveChild(TreeViewPerson::Iterator(), 0, 0, 1);
              }));
}

}  // namespace
