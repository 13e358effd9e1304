// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The flags of the pedigree view. No pass over the whole chart has the last word here: each flag is what the
// passes leave on it.

#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <utility>
#include <vector>

#include <unit/family/LaidOutCase.h>

#include "HandMadePedigree.h"

namespace {

using views::kFemale;
using views::kMale;
using views::LaidOutCase;
typedef std::vector<std::string> Questions;

class PedigreeFlags : public views::HandMadePedigree {
protected:
    void flagAll() { layouter.flagNonDisplayedRelationships(focus); }
    static bool flagOf(const TreeViewPerson& person) { return person.hasNonDisplayedRelationships; }
};

// --- Parents with other children.

TEST_F(PedigreeFlags, fatherWithASecondChildIsFlagged) {
    focus.setParents(1, 2);
    data.children = {{1, {0, 9}}, {2, {0}}};
    layouter.checkParentsForOtherChildren(focus);
    EXPECT_TRUE(flagOf(father()));
    EXPECT_FALSE(flagOf(mother()));
}

TEST_F(PedigreeFlags, secondChildIsFoundOnEitherSideOfThePerson) {
    for (const int other : {3, 9}) {
        TreeViewPerson person(5);
        person.setParentsFatherOnly(1);
        data.children[1] = {5, other};
        layouter.checkParentsForOtherChildren(person);
        EXPECT_TRUE(flagOf(person.getPreferredFather())) << other;
    }
}

TEST_F(PedigreeFlags, flagOfAParentIsNeverTakenBack) {
    focus.setParentsFatherOnly(1);
    father().hasNonDisplayedRelationships = true;
    data.children[1] = {0};
    layouter.checkParentsForOtherChildren(focus);
    EXPECT_TRUE(flagOf(father()));
}

TEST_F(PedigreeFlags, otherChildrenCountForThreeGenerationsOfAncestors) {
    focus.setParentsFatherOnly(1);
    father().setParentsFatherOnly(2);
    TreeViewPerson& grandfather = father().getPreferredFather();
    grandfather.setParentsFatherOnly(3);
    TreeViewPerson& great = grandfather.getPreferredFather();
    great.setParentsFatherOnly(4);
    data.children = {{1, {0, 10}}, {2, {1, 20}}, {3, {2, 30}}, {4, {3, 40}}};
    flagAll();
    EXPECT_TRUE(flagOf(father()));
    EXPECT_TRUE(flagOf(grandfather));
    EXPECT_TRUE(flagOf(great));
    EXPECT_FALSE(flagOf(great.getPreferredFather()));
}

// --- Ancestors.

TEST_F(PedigreeFlags, greatGrandparentWithAParentIsFlagged) {
    focus.setParentsFatherOnly(1);
    father().setParentsFatherOnly(2);
    father().getPreferredFather().setParents(3, 4);
    data.parents[3] = {8, -1};
    flagAll();
    EXPECT_TRUE(flagOf(father().getPreferredFather().getPreferredFather()));
    EXPECT_FALSE(flagOf(father().getPreferredFather().getPreferredMother()));
}

TEST_F(PedigreeFlags, ancestorMarriedTwiceIsFlagged) {
    focus.setParents(1, 2);
    data.spouses = {{1, {2, 9}}, {2, {1}}};
    flagAll();
    EXPECT_TRUE(flagOf(father()));
    EXPECT_FALSE(flagOf(mother()));
}

TEST_F(PedigreeFlags, marksAndListsAreCleanAfterwards) {
    focus.setParents(1, 2);
    flagAll();
    EXPECT_TRUE(layouter.stackedPersons.empty());
    EXPECT_FALSE(focus.hasBeenVisited());
    EXPECT_FALSE(father().hasBeenVisited());
    EXPECT_FALSE(mother().hasBeenVisited());
}

// Unlike the family view's, no pass asks whether everybody stands on the chart.
TEST_F(PedigreeFlags, focusWithParentsAndSpousesOffTheChartIsNotFlagged) {
    data.parents[0] = {1, 2};
    data.spouses[0] = {3};
    data.children[0] = {4};
    flagAll();
    EXPECT_FALSE(flagOf(focus));
}

TEST_F(PedigreeFlags, siblingsAreNotWalked) {
    focus.addSibling(7, kMale).addChildWithNoOtherSpouse(8, kMale);
    data.parents[7] = {1, 2};
    flagAll();
    EXPECT_TRUE(data.questions.empty());
}

// --- Children of the focus.

TEST_F(PedigreeFlags, childWithASpouseIsFlaggedWithoutFurtherQuestions) {
    focus.addChildWithNoOtherSpouse(5, kMale);
    data.spouses[5] = {6};
    flagAll();
    EXPECT_TRUE(flagOf(unknownChild()));
    EXPECT_EQ((Questions{"getSpouses 5"}), data.questions);
}

TEST_F(PedigreeFlags, childWithChildrenIsFlagged) {
    focus.addChildWithNoOtherSpouse(5, kMale);
    data.children[5] = {6};
    flagAll();
    EXPECT_TRUE(flagOf(unknownChild()));
    EXPECT_FALSE(data.wasAsked("getParents 5"));
}

TEST_F(PedigreeFlags, childOfTheCoupleWithNobodyElseIsNotFlagged) {
    focus.addSpouse(1, kFemale);
    focus.addChildWithSpouse(5, 1, kMale);
    data.parents[5] = {0, 1};
    childUnder(1).hasNonDisplayedRelationships = true;
    flagAll();
    EXPECT_FALSE(flagOf(childUnder(1)));
}

TEST_F(PedigreeFlags, childrenOfASpouseCountAmongTheChildren) {
    focus.addSpouse(1, kFemale).addChildWithNoOtherSpouse(5, kMale);
    data.spouses[5] = {6};
    flagAll();
    EXPECT_TRUE(flagOf(spouse().children[-1].front()));
}

struct ChildRow {
    std::string name;
    std::vector<int> hostSpousesOfTheFocus;
    std::pair<int, int> childParents;
    bool flag;
};
void PrintTo(const ChildRow& row, std::ostream* out) {
    *out << row.name;
}

// The focus is 0, its shown wives are 1 and the unknown parent 50.
class PedigreeChildFlag : public PedigreeFlags, public testing::WithParamInterface<ChildRow> {};

TEST_P(PedigreeChildFlag, showsAParentOffTheChart) {
    for (const bool before : {false, true}) {
        TreeViewPerson person(0);
        person.addSpouse(1, kFemale);
        person.addSpouse(50, kFemale);
        TreeViewPerson& child = person.addChildWithNoOtherSpouse(5, kMale);
        child.hasNonDisplayedRelationships = before;
        data.spouses[0] = GetParam().hostSpousesOfTheFocus;
        data.parents[5] = GetParam().childParents;
        data.addNodes = {50, 51};
        layouter.checkChildForUnshownParents(person, child);
        EXPECT_EQ(GetParam().flag, flagOf(child)) << "flag before: " << before;
    }
}

INSTANTIATE_TEST_SUITE_P(
    Rows, PedigreeChildFlag,
    testing::Values(ChildRow{"ofAShownCouple", {1}, {0, 1}, false},
                    ChildRow{"ofAShownCoupleTheOtherWayRound", {1}, {1, 0}, false},
                    ChildRow{"withAnAddNodeMotherOfAnUnmarriedFather", {}, {0, 51}, false},
                    ChildRow{"withAnAddNodeMotherOfAMarriedFather", {7}, {0, 51}, false},
                    ChildRow{"withAnAddNodeFatherOfAMarriedMother", {7}, {51, 0}, false},
                    ChildRow{"withOneKnownParent", {7}, {0, -1}, false},
                    ChildRow{"withNoKnownParent", {7}, {-1, -1}, false},
                    ChildRow{"ofAnUnshownWife", {7}, {0, 7}, true},
                    ChildRow{"ofAStrangerAndAMarriedFather", {7}, {0, 9}, true},
                    ChildRow{"ofAStrangerAndAnUnmarriedFather", {}, {0, 9}, true},
                    ChildRow{"ofAStrangerAndAMarriedMother", {7}, {9, 0}, true},
                    ChildRow{"ofTheWifeAndAStranger", {1}, {8, 1}, true},
                    ChildRow{"ofAStrangerAlone", {}, {8, 51}, true},
                    ChildRow{"ofAStrangeMotherAlone", {}, {51, 9}, true},
                    // Said to be both father and mother: only a host spouse besides that one parent decides.
                    ChildRow{"ofOnePersonTwiceUnmarried", {}, {0, 0}, false},
                    ChildRow{"ofOnePersonTwiceMarried", {7}, {0, 0}, true}),
    [](const auto& row) { return row.param.name; });

// --- Spouses of the focus.

class PedigreeSpouseFlags : public PedigreeFlags {
protected:
    PedigreeSpouseFlags() { focus.addSpouse(1, kFemale); }
    bool flagAfter(bool checkChildren) {
        layouter.flagNonDisplayedRelationshipsForSpouses(focus, checkChildren);
        return flagOf(spouse());
    }
};

TEST_F(PedigreeSpouseFlags, spouseWithEverybodyShownIsNotFlaggedWhateverStoodThere) {
    data.spouses[1] = {0};
    data.children[1] = {5, 6};
    layouter.shownPersons = {{5, true}, {6, true}};
    spouse().hasNonDisplayedRelationships = true;
    EXPECT_FALSE(flagAfter(true));
}

TEST_F(PedigreeSpouseFlags, anyChildNotShownIsNews) {
    data.spouses[1] = {0};
    data.children[1] = {5, 6};
    layouter.shownPersons = {{5, true}};
    EXPECT_TRUE(flagAfter(true));
}

TEST_F(PedigreeSpouseFlags, childrenAreLeftOutWhenNotAskedFor) {
    data.children[1] = {5};
    EXPECT_FALSE(flagAfter(false));
    EXPECT_FALSE(data.wasAsked("getChildren 1"));
}

TEST_F(PedigreeSpouseFlags, secondMarriageIsNewsAndTheChildrenAreLoadedAllTheSame) {
    data.spouses[1] = {0, 9};
    EXPECT_TRUE(flagAfter(true));
    EXPECT_EQ((Questions{"getSpouses 1", "getChildren 1"}), data.questions);
}

TEST_F(PedigreeSpouseFlags, realParentsAreNews) {
    data.parents[1] = {8, -1};
    EXPECT_TRUE(flagAfter(true));
}

TEST_F(PedigreeSpouseFlags, noQuestionIsAskedAboutTheCoupleOfAChild) {
    data.children[1] = {5};
    layouter.shownPersons = {{5, true}};
    flagAfter(true);
    EXPECT_FALSE(data.wasAsked("getParents 5"));
}

TEST_F(PedigreeSpouseFlags, spousesAreFlaggedLastAndWithTheirChildren) {
    data.children[1] = {5};
    flagAll();
    EXPECT_TRUE(flagOf(spouse()));
    layouter.shownPersons = {{5, true}};
    flagAll();
    EXPECT_FALSE(flagOf(spouse()));
}

// --- The operation that no step calls.

TEST_F(PedigreeFlags, childrenWithFamiliesOfTheirOwnAreFlaggedOnRequest) {
    for (const int key : {5, 6, 7, 8}) focus.addChildWithNoOtherSpouse(key, kMale);
    data.spouses[5] = {9};
    unknownChild(1).addSpouse(9, kFemale);
    data.children[7] = {9};
    unknownChild(3).hasNonDisplayedRelationships = true;
    layouter.checkPersonsChildren(focus);
    EXPECT_TRUE(flagOf(unknownChild(0)));
    EXPECT_TRUE(flagOf(unknownChild(1)));
    EXPECT_TRUE(flagOf(unknownChild(2)));
    EXPECT_FALSE(flagOf(unknownChild(3)));
}

// --- Whole charts.

TEST(PedigreeChartFlags, fatherWithAnotherChildHasOne) {
    LaidOutCase chart("focus 1\nview pedigree 3 4\nfather 1 2\nmother 1 3\nchildren 2 9 1\nchildren 3 1\n");
    EXPECT_TRUE(chart.flag(2));
    EXPECT_FALSE(chart.flag(3));
    EXPECT_FALSE(chart.flag(1));
}

TEST(PedigreeChartFlags, addNodesHaveNone) {
    LaidOutCase chart("focus 1\nview pedigree 4 4\nfather 1 2\nchildren 2 1\n");
    for (const int id : chart.walk()) EXPECT_FALSE(chart.flag(id)) << id;
}

TEST(PedigreeChartFlags, childOfAFocusWithAnUnknownPartnerHasNone) {
    LaidOutCase chart("focus 1\nview pedigree 2 4\nchildren 1 5\nfather 5 1\n");
    EXPECT_FALSE(chart.flag(5));
}

TEST(PedigreeChartFlags, spouseWithAChildFromElsewhereHasOne) {
    LaidOutCase chart(
        "focus 1\nview pedigree 2 4\nspouses 1 2\nspouses 2 1\nchildren 1 5\nchildren 2 5 6\n"
        "father 5 1\nmother 5 2\nmother 6 2\n");
    EXPECT_TRUE(chart.flag(2));
    EXPECT_FALSE(chart.flag(5));
}

}  // namespace
