// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The pedigree view from end to end: which ancestors come onto the chart, where they stand, and in which
// order the data are asked for.

#include <gtest/gtest.h>

#include <cmath>
#include <stdexcept>
#include <string>
#include <vector>

#include <support/CaseRun.h>
#include <unit/family/LaidOutCase.h>

#include "HandMadePedigree.h"

namespace {

using views::LaidOutCase;
using views::placeOf;
using views::Point;
typedef std::vector<std::string> Questions;
typedef std::vector<int> Keys;

class PedigreeDriver : public views::HandMadePedigree {};

const std::string kThreeGenerations =
    "focus 1\nfather 1 2\nmother 1 3\nfather 2 4\nmother 2 5\nfather 3 6\nmother 3 7\n";

TEST_F(PedigreeDriver, keepsWhatItWasBuiltWith) {
    const SharedTreeViewer::TreeViewPedigreeLayouter made(&adapter, 7, 0, SharedTreeViewer::OptionMap(),
                                                          views::kSizes, 5, 2);
    EXPECT_EQ(5, made.maxGenerations);
    EXPECT_EQ(2, made.maxStackDepth);
    EXPECT_TRUE(made.stackedPersons.empty());
    EXPECT_EQ(7, made.focusPerson.personId);
    EXPECT_FALSE(made.focusPerson.gender);
}

TEST_F(PedigreeDriver, oneGenerationAsksForNoParents) {
    data.parents[0] = {1, 2};
    for (const int generations : {1, 0, -1}) {
        data.questions.clear();
        layOut(generations);
        EXPECT_EQ((Keys{0}), everybody()) << generations;
        EXPECT_FALSE(data.wasAsked("getParents 0")) << generations;
    }
}

TEST_F(PedigreeDriver, twoGenerationsEndWithTheParents) {
    data.parents = {{0, {1, 2}}, {1, {3, 4}}};
    layOut(2);
    EXPECT_EQ((Keys{0, 1, 2}), everybody());
    EXPECT_EQ((Point{27.5f, 0.0f}), placeOf(focus));
    EXPECT_EQ((Point{107.5f, -55.0f}), placeOf(father()));
    EXPECT_EQ((Point{107.5f, 55.0f}), placeOf(mother()));
    EXPECT_FALSE(data.wasAsked("getParents 1"));
}

TEST_F(PedigreeDriver, motherKnownAloneKeepsHerSlot) {
    data.parents[0] = {-1, 2};
    layOut(2);
    EXPECT_EQ((Keys{0, 2}), everybody());
    EXPECT_EQ((Point{107.5f, 55.0f}), placeOf(mother()));
}

TEST_F(PedigreeDriver, fatherKnownAloneKeepsHisSlot) {
    data.parents[0] = {1, -1};
    layOut(2);
    EXPECT_EQ((Point{107.5f, -55.0f}), placeOf(father()));
}

TEST_F(PedigreeDriver, everyAncestorHasTheSlotOfItsLine) {
    data.parents = {{0, {1, 2}}, {1, {3, 4}}, {2, {-1, 6}}, {6, {13, 14}}};
    layOut(4);
    EXPECT_EQ((Point{187.5f, -165.0f}), placeOf(father().getPreferredFather()));
    EXPECT_EQ((Point{187.5f, -55.0f}), placeOf(father().getPreferredMother()));
    TreeViewPerson& grandmother = mother().getPreferredMother();
    EXPECT_EQ((Point{187.5f, 165.0f}), placeOf(grandmother));
    EXPECT_EQ((Point{267.5f, 275.0f}), placeOf(grandmother.getPreferredFather()));
    EXPECT_EQ((Point{267.5f, 385.0f}), placeOf(grandmother.getPreferredMother()));
}

TEST_F(PedigreeDriver, theFathersWholeLineIsAskedForBeforeTheMothers) {
    data.parents = {{0, {1, 2}}, {1, {3, 4}}, {2, {5, 6}}};
    layouter.maxGenerations = 3;
    layouter.addAndLayoutParentsOfPerson(focus, 0, 0);
    EXPECT_EQ((Questions{"getParents 0", "getParents 1", "getParents 2"}), data.questions);
    layouter.maxGenerations = 4;
    data.questions.clear();
    TreeViewPerson other(0);
    layouter.addAndLayoutParentsOfPerson(other, 0, 0);
    EXPECT_EQ((Questions{"getParents 0", "getParents 1", "getParents 3", "getParents 4", "getParents 2",
                         "getParents 5", "getParents 6"}),
              data.questions);
}

TEST_F(PedigreeDriver, recordOfWhoIsShownStartsAgain) {
    layouter.shownPersons[99] = true;
    addWifeWithChildren(7, {8});
    data.parents[0] = {1, 2};
    layOut(2);
    Keys shown;
    for (const auto& [key, present] : layouter.shownPersons) {
        EXPECT_TRUE(present);
        shown.push_back(key);
    }
    EXPECT_EQ((Keys{0, 1, 2, 7, 8}), shown);
}

TEST_F(PedigreeDriver, dataAreAskedInAFixedOrder) {
    addWifeWithChildren(1, {2});
    layOut(1);
    EXPECT_EQ((Questions{"getSpouses 0", "getChildren 0", "getChildren 1", "getParents 2",  // growing
                         "getSpouses 2", "getChildren 2", "getParents 2",  // the child's flag
                         "getSpouses 1", "getParents 1"}),                 // the wife's flag
              data.questions);
}

// A parent is asked about spouses only for the flags; by then the lines stand.
TEST_F(PedigreeDriver, drawsLinesBeforeItSetsFlags) {
    data.parents[0] = {1, 2};
    adapter.getSpouses = [](int key, SpouseSet&) {
        if (key == 1) throw std::domain_error("no spouses today");
    };
    EXPECT_THROW(layOut(2), std::domain_error);
    EXPECT_EQ(3u, focus.lineSegments.size());
}

TEST_F(PedigreeDriver, failsOnACallbackThatWasLeftEmpty) {
    adapter.getSpouses.clear();
    EXPECT_THROW(layOut(2), boost::bad_function_call);
}

TEST(PedigreeChart, unknownParentsStandAsAddNodes) {
    LaidOutCase chart("focus 1\nview pedigree 2 4\nmother 1 3\n");
    EXPECT_EQ((Point{107.5f, 55.0f}), chart.at(3));
    EXPECT_EQ(2, chart.person(1).getParentCount());
    EXPECT_EQ((Point{107.5f, -55.0f}), placeOf(chart.person(1).getPreferredFather()));
    EXPECT_LT(chart.idOf(chart.person(1).getPreferredFather()), 0);
}

TEST(PedigreeChart, parentReportedAloneHasNoPartner) {
    LaidOutCase chart("focus 1\nview pedigree 3 4\nadapter bare\nmother 1 3\nmother 3 7\n");
    EXPECT_EQ((Keys{1, 3, 7}), chart.walk());
    EXPECT_EQ((Point{187.5f, 165.0f}), chart.at(7));
}

TEST(PedigreeChart, siblingsAreNotShown) {
    LaidOutCase chart("view pedigree 3 4\n" + kThreeGenerations + "children 2 1 8\nchildren 3 1 8\n");
    EXPECT_FALSE(chart.shows(8));
    EXPECT_TRUE(chart.shows(7));
}

TEST(PedigreeChart, readsNoOption) {
    const std::string family = "view pedigree 4 4\n" + kThreeGenerations +
                               "children 1 20\nfather 20 1\nspouses 20 21\nchildren 20 22\nspouses 1 30\n";
    const std::string plain = support::layoutText(support::parseCase(family));
    ASSERT_FALSE(plain.empty());
    std::string off;
    for (const char* key : {"AuntsUncles", "Cousins", "Siblings", "SiblingSpouses", "NeicesNephews",
                            "Grandchildren", "GreatGrandparents", "SpousesOfChildren"}) {
        off += std::string("option ACTV_Fam_Show") + key + " 0\n";
    }
    EXPECT_EQ(plain, support::layoutText(support::parseCase(off + family)));
}

// A father, the marriage line and the three pieces of the person's own line, as the host reads them.
TEST(PedigreeChart, reachesTheHostAsOneLineOfText) {
    EXPECT_EQ(
        "1:27:0:0:107,40,95,40|95,40,95,40|95,40,82,40|;"
        "2:107:-55:0:107,25,107,55|;"
        "3:107:55:0:;",
        support::layoutText(support::parseCase("focus 1\nview pedigree 2 4\nfather 1 2\nmother 1 3\n"
                                               "children 2 1\nchildren 3 1\n")));
}

TEST(PedigreeChart, ofALoneLineOfMothersFortyGenerationsDeepIsFinite) {
    std::string line = "focus 1\nview pedigree 41 4\nadapter bare\n";
    for (int child = 1; child <= 40; ++child) {
        line += "mother " + std::to_string(child) + " " + std::to_string(child + 1) + "\n";
    }
    LaidOutCase chart(line);
    EXPECT_EQ(41u, chart.walk().size());
    chart.layouter().graphIterator([](TreeViewPerson& person) {
        EXPECT_TRUE(std::isfinite(person.nodeCenter.x) && std::isfinite(person.nodeCenter.y));
    });
    EXPECT_EQ(27.5f + 80.0f * 40.0f, chart.at(41).x);
}

TEST(PedigreeChart, ofAPersonWhoIsTheirOwnAncestorEndsWithTheColumns) {
    LaidOutCase chart("focus 1\nview pedigree 5 4\nfather 1 1\nmother 1 1\nchildren 1 1\nspouses 1 1\n");
    EXPECT_GE(chart.nodesOf(1).size(), 31u);
}

TEST(PedigreeChart, ofAManWhoIsSaidToBeAMotherIsLaidOut) {
    LaidOutCase chart("focus 1\nview pedigree 2 4\nmother 1 2\nsex 2 0\n");
    EXPECT_EQ((Point{107.5f, 55.0f}), chart.at(2));
    EXPECT_FALSE(chart.person(2).gender);
}

}  // namespace
