// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The family view from end to end: who comes onto the chart, in which row, and in which order the data are
// asked for.

#include <gtest/gtest.h>

#include <cmath>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <support/CaseRun.h>

#include "HandMadeFamily.h"
#include "LaidOutCase.h"

namespace {

using views::LaidOutCase;
using views::Point;
using views::Segments;
using views::segmentsOf;
typedef std::vector<int> Ids;

class FamilyDriver : public views::HandMadeFamily {};

// A man with a wife, a child and two parents, and nobody else known.
const std::string kSmallFamily =
    "focus 17\nspouses 17 42\nspouses 42 17\nchildren 17 5\nchildren 42 5\nfather 5 17\nmother 5 42\n"
    "sex 42 1\nfather 17 8\nmother 17 9\nsex 9 1\nchildren 8 17\nchildren 9 17\nspouses 8 9\nspouses 9 8\n";

TEST(FamilyChart, ofAManWithWifeChildAndParentsStandsInFourRows) {
    LaidOutCase chart(kSmallFamily);
    EXPECT_EQ((Point{27.5f, 0.0f}), chart.at(17));
    EXPECT_EQ((Point{107.5f, 0.0f}), chart.at(42));
    EXPECT_EQ((Point{67.5f, 110.0f}), chart.at(5));
    EXPECT_EQ((Point{-12.5f, -110.0f}), chart.at(8));
    EXPECT_EQ((Point{67.5f, -110.0f}), chart.at(9));
    EXPECT_EQ(135.0f, chart.person(5).layoutWidth);
    EXPECT_EQ(135.0f, chart.family().familyUnitWidthForProximalPerson(chart.person(17)));
}

TEST(FamilyChart, unknownGrandparentsStandAsFourAddNodes) {
    LaidOutCase chart(kSmallFamily);
    const std::vector<int> walk = chart.walk();
    ASSERT_EQ(9u, walk.size());
    EXPECT_EQ(17, walk[0]);
    EXPECT_EQ(8, walk[1]);
    EXPECT_LT(walk[2], 0);
    EXPECT_LT(walk[3], 0);
    EXPECT_EQ(9, walk[4]);
    EXPECT_LT(walk[5], 0);
    EXPECT_LT(walk[6], 0);
    EXPECT_EQ(42, walk[7]);
    EXPECT_EQ(5, walk[8]);
    EXPECT_EQ((Point{-92.5f, -220.0f}), chart.at(walk[2]));
    EXPECT_EQ((Point{-12.5f, -220.0f}), chart.at(walk[3]));
    EXPECT_EQ((Point{67.5f, -220.0f}), chart.at(walk[5]));
    EXPECT_EQ((Point{147.5f, -220.0f}), chart.at(walk[6]));
}

TEST(FamilyChart, hasNoFlagWhenEverybodyIsOnIt) {
    LaidOutCase chart(kSmallFamily);
    for (const int id : chart.walk()) EXPECT_FALSE(chart.flag(id)) << id;
}

TEST(FamilyChart, marriageLineRunsAtMidHeightBetweenTheFacingEdges) {
    LaidOutCase chart(kSmallFamily);
    const Segments segments = segmentsOf(chart.person(17));
    ASSERT_FALSE(segments.empty());
    EXPECT_EQ((views::Segment{82, 40, 107, 40, true}), segments.front());
}

TEST(FamilyChart, reachesTheHostAsOneLineOfText) {
    EXPECT_EQ(
        "17:27:0:0:82,40,107,40|55,-15,55,-15|55,0,55,-15|;"
        "8:-12:-110:0:55,-70,55,-15|42,-70,67,-70|15,-125,-25,-125|15,-110,15,-125|;"
        "-1:-92:-220:0:-25,-180,-25,-125|-37,-180,-12,-180|:M:8;"
        "-2:-12:-220:0::F:8;"
        "9:67:-110:0:95,-125,135,-125|95,-110,95,-125|;"
        "-3:67:-220:0:135,-180,135,-125|122,-180,147,-180|:M:9;"
        "-4:147:-220:0::F:9;"
        "42:107:0:0:95,40,95,95|;"
        "5:67:110:0:95,95,95,95|95,110,95,95|;",
        support::layoutText(support::parseCase(kSmallFamily)));
}

TEST(FamilyChart, ofALoneFocusHasTwoAddNodesAboveIt) {
    LaidOutCase chart("focus 1\n");
    EXPECT_EQ((Ids{1, -1, -2}), chart.walk());
    EXPECT_EQ(55.0f, chart.person(1).layoutWidth);
    EXPECT_EQ((Point{27.5f, 0.0f}), chart.at(1));
    EXPECT_EQ((Point{-12.5f, -110.0f}), chart.at(-1));
    EXPECT_EQ((Point{67.5f, -110.0f}), chart.at(-2));
}

TEST(FamilyChart, ofALoneFocusDrawsOnlyTheLinesFromTheAddNodes) {
    LaidOutCase chart("focus 1\n");
    EXPECT_EQ((Segments{{55, -70, 55, -15, false}, {42.5f, -70, 67.5f, -70, true}}),
              segmentsOf(chart.person(-1)));
    EXPECT_EQ(Segments{}, segmentsOf(chart.person(-2)));
    EXPECT_EQ((Segments{{55, -15, 55, -15, false}, {55, 0, 55, -15, false}}), segmentsOf(chart.person(1)));
}

TEST(FamilyChart, oneKnownParentStandsBesideAnAddNode) {
    LaidOutCase chart("focus 1\nfather 1 10\nchildren 10 1\n");
    EXPECT_EQ(2, chart.person(1).getParentCount());
    EXPECT_EQ((Point{-12.5f, -110.0f}), chart.at(10));
    EXPECT_EQ((Point{67.5f, -110.0f}), chart.at(-1));
}

// The father's brother is set from the father's x of 27.5 and the focus's own entry at 0: 0 - 27.5 - 80.
TEST(FamilyChart, parentReportedAloneStandsRightAboveTheFocusWithHisSiblings) {
    LaidOutCase chart(
        "focus 1\nadapter bare\nfather 1 10\nchildren 10 1\nfather 10 30\nmother 10 31\n"
        "children 30 10 50\nchildren 31 10 50\nfather 50 30\nmother 50 31\n");
    EXPECT_EQ(1, chart.person(1).getParentCount());
    EXPECT_EQ((Point{27.5f, -110.0f}), chart.at(10));
    EXPECT_EQ((Point{-80.0f, -110.0f}), chart.at(50));
}

// The mother's sister: 27.5 + 55 + 50 = 132.5, and the middle of her box's span is 27.5 further.
TEST(FamilyChart, motherReportedAloneStandsRightAboveTheFocusWithHerSiblings) {
    LaidOutCase chart(
        "focus 1\nadapter bare\nmother 1 11\nchildren 11 1\nsex 11 1\nfather 11 30\nmother 11 31\n"
        "children 30 11 60\nchildren 31 11 60\nfather 60 30\nmother 60 31\nsex 60 1\n");
    EXPECT_EQ((Point{27.5f, -110.0f}), chart.at(11));
    EXPECT_EQ((Point{160.0f, -110.0f}), chart.at(60));
}

TEST(FamilyChart, everyGenerationHasItsRow) {
    LaidOutCase chart(
        "focus 1\nspouses 1 2\nspouses 2 1\nchildren 1 3\nchildren 2 3\nfather 3 1\nmother 3 2\n"
        "children 3 5\nfather 5 3\nfather 1 10\nmother 1 11\nchildren 10 1 20\nchildren 11 1 20\n"
        "father 20 10\nmother 20 11\nspouses 20 21\nspouses 21 20\nfather 10 30\nmother 10 31\n"
        "children 30 10 50\nchildren 31 10 50\nfather 50 30\nmother 50 31\nspouses 50 51\nspouses 51 50\n"
        "children 50 52\nchildren 51 52\nfather 52 50\nmother 52 51\nfather 30 40\nmother 30 41\n"
        "children 40 30\nchildren 41 30\n");
    const std::vector<std::pair<int, float>> rows{{1, 0.0f},     {2, 0.0f},     {20, 0.0f},    {21, 0.0f},
                                                  {3, 110.0f},   {5, 220.0f},   {10, -110.0f}, {11, -110.0f},
                                                  {50, -110.0f}, {51, -110.0f}, {52, 0.0f},    {30, -220.0f},
                                                  {31, -220.0f}, {40, -330.0f}, {41, -330.0f}};
    for (const auto& [id, y] : rows) EXPECT_EQ(y, chart.at(id).y) << id;
}

TEST(FamilyChart, rowsFollowTheSizesGiven) {
    LaidOutCase chart(
        "focus 1\nsize 100 40 20 10 10 0\nchildren 1 3\nfather 3 1\nfather 1 10\nmother 1 11\n");
    EXPECT_EQ((Point{50.0f, 0.0f}), chart.at(1));
    EXPECT_EQ((Point{50.0f, 50.0f}), chart.at(3));
    EXPECT_EQ((Point{-10.0f, -50.0f}), chart.at(10));
    EXPECT_EQ((Point{110.0f, -50.0f}), chart.at(11));
    EXPECT_EQ(-100.0f, chart.at(chart.idOf(chart.person(10).getPreferredFather())).y);
}

// The father is real and the mother unknown: his two parents are centred above the focus, not above him.
TEST(FamilyChart, grandparentsFormOneGroupAboveTheFocus) {
    LaidOutCase chart("focus 1\nfather 1 10\nchildren 10 1\nfather 10 30\nmother 10 31\n");
    EXPECT_EQ((Point{-12.5f, -110.0f}), chart.at(10));
    EXPECT_EQ((Point{-12.5f, -220.0f}), chart.at(30));
    EXPECT_EQ((Point{67.5f, -220.0f}), chart.at(31));
}

// Eight in a row, 80 apart, around 27.5: the outermost stand 280 from the middle.
TEST(FamilyChart, greatGrandparentsFormOneGroupAboveTheFocus) {
    LaidOutCase chart(
        "focus 1\nfather 1 10\nmother 1 11\nfather 10 30\nmother 10 31\nfather 11 32\nmother 11 33\n"
        "father 30 40\nmother 33 47\n");
    EXPECT_EQ((Point{-252.5f, -330.0f}), chart.at(40));
    EXPECT_EQ((Point{307.5f, -330.0f}), chart.at(47));
}

TEST(FamilyChart, focusStandsAtTheLeftOfItsUnitWhateverItsSiblings) {
    LaidOutCase chart("focus 1\nfather 1 10\nmother 1 11\nchildren 10 20 1 21\nchildren 11 20 1 21\n");
    EXPECT_EQ((Point{27.5f, 0.0f}), chart.at(1));
}

TEST(FamilyChart, stepChildrenComeThroughTheSpousesOfTheFocus) {
    LaidOutCase chart(
        "focus 1\nspouses 1 2\nspouses 2 1\nchildren 1 3\nchildren 2 3 6\nfather 3 1\nmother 3 2\n"
        "mother 6 2\n");
    ASSERT_TRUE(chart.shows(6));
    EXPECT_EQ(1, chart.person(2).getChildrenWithNoOtherParentCount());
    EXPECT_EQ(110.0f, chart.at(6).y);
}

TEST(FamilyChart, stepChildrenComeWithTheirSpousesAndChildren) {
    LaidOutCase chart(
        "focus 1\nspouses 1 2\nspouses 2 1\nchildren 2 6\nmother 6 2\nspouses 6 7\nspouses 7 6\n"
        "children 6 8\nchildren 7 8\nfather 8 6\nmother 8 7\n");
    EXPECT_TRUE(chart.shows(6));
    EXPECT_TRUE(chart.shows(7));
    EXPECT_TRUE(chart.shows(8));
}

TEST(FamilyChart, childrenOfASpousesOtherMarriageAreNoStepChildren) {
    LaidOutCase chart(
        "focus 1\nspouses 1 2\nspouses 2 1 8\nchildren 1 3\nchildren 2 3 9\nchildren 8 9\n"
        "father 3 1\nmother 3 2\nfather 9 8\nmother 9 2\n");
    EXPECT_TRUE(chart.shows(3));
    EXPECT_FALSE(chart.shows(9));
}

TEST(FamilyChart, childrensSpousesBringNoStepChildren) {
    LaidOutCase chart(
        "focus 1\nchildren 1 3\nfather 3 1\nspouses 3 4\nspouses 4 3\nchildren 3 5\nchildren 4 5 7\n"
        "father 5 3\nmother 5 4\nmother 7 4\n");
    EXPECT_TRUE(chart.shows(5));
    EXPECT_FALSE(chart.shows(7));
}

// Nobody's preference moves a spouse: a man stands beside the first of the host's list.
TEST(FamilyChart, coupleIsFormedByTheHostsOrderAndNotByPreference) {
    LaidOutCase chart("focus 1\nspouses 1 2 3\nspouses 2 1\nspouses 3 1\npreferred 1 3\n");
    EXPECT_EQ((Point{107.5f, 0.0f}), chart.at(2));
    EXPECT_EQ((Point{227.5f, 0.0f}), chart.at(3));
}

TEST(FamilyChart, aPersonMetTwiceStandsAsTwoNodes) {
    LaidOutCase chart("focus 1\nspouses 1 2 2\nspouses 2 1\n");
    EXPECT_EQ(2u, chart.nodesOf(2).size());
}

TEST(FamilyChart, ofAPersonWhoIsTheirOwnAncestorEnds) {
    LaidOutCase chart("focus 1\nfather 1 1\nmother 1 1\nchildren 1 1\nspouses 1 1\n");
    EXPECT_FALSE(chart.walk().empty());
    chart.layouter().graphIterator([](TreeViewPerson& person) {
        EXPECT_TRUE(std::isfinite(person.nodeCenter.x) && std::isfinite(person.nodeCenter.y));
    });
}

TEST_F(FamilyDriver, climbsFourGenerationsForTheFlags) {
    EXPECT_EQ(4, layouter.maxStackDepth);
    EXPECT_TRUE(layouter.stackedPersons.empty());
}

TEST_F(FamilyDriver, asksAboutALoneFocusInTheOrderOfTheWork) {
    layouter.layoutForFocusNID();
    EXPECT_EQ((std::vector<std::string>{"getSpouses 0", "getChildren 0", "getParents 0",  // growing
                                        "getSpouses 0", "getParents 0"}),                 // the flag
              data.questions);
}

TEST_F(FamilyDriver, addsSpousesOfAllChildrenBeforeAnyGrandchild) {
    data.children[0] = {1, 2};
    data.parents[1] = {0, -1};
    data.parents[2] = {0, -1};
    layouter.layoutForFocusNID();
    const std::vector<std::string> start(data.questions.begin(), data.questions.begin() + 7);
    EXPECT_EQ((std::vector<std::string>{"getSpouses 0", "getChildren 0", "getSpouses 1", "getSpouses 2",
                                        "getChildren 1", "getChildren 2", "getParents 0"}),
              start);
}

TEST_F(FamilyDriver, leavesTheMarksOfItsWalksClean) {
    data.parents[0] = {1, 2};
    data.parents[1] = {3, 4};
    data.children[1] = data.children[2] = {0};
    data.men = {0, 1, 3};
    layouter.layoutForFocusNID();
    EXPECT_TRUE(layouter.stackedPersons.empty());
    layouter.graphIterator([](TreeViewPerson& person) { EXPECT_FALSE(person.hasBeenVisited()); });
}

// The last question about the focus's spouses comes with the flags; by then nothing is drawn yet.
TEST_F(FamilyDriver, setsFlagsBeforeItDrawsLines) {
    data.parents[0] = {1, 2};
    int asked = 0;
    adapter.getSpouses = [&asked](int key, SpouseSet&) {
        if (key == 0 && ++asked == 2) throw std::domain_error("no spouses today");
    };
    EXPECT_THROW(layouter.layoutForFocusNID(), std::domain_error);
    EXPECT_EQ(Segments{}, segmentsOf(focus));
    EXPECT_EQ((Point{-12.5f, -110.0f}), views::placeOf(focus.getPreferredFather()));
}

TEST_F(FamilyDriver, failsOnACallbackThatWasLeftEmpty) {
    adapter.getSpouses.clear();
    try {
        layouter.layoutForFocusNID();
        FAIL() << "laid out without a way to ask for spouses";
    } catch (const boost::bad_function_call& failure) {
        EXPECT_STREQ("call to empty boost::function", failure.what());
    }
}

TEST_F(FamilyDriver, passesOnWhatTheDataSourceThrows) {
    adapter.getChildren = [](int, ChildrenSet&) { throw std::domain_error("no children today"); };
    EXPECT_THROW(layouter.layoutForFocusNID(), std::domain_error);
}

}  // namespace
