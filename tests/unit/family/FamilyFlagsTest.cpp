// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The flag of each person: the data source knows a relative who is not on the chart. The final pass has the
// last word on everybody but unknown parents, so what the passes before it decide is seen on persons whom the data
// call unknown parents.

#include <gtest/gtest.h>

#include <map>
#include <ostream>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include <olvane/layouter/HiddenRelativesInternal.h>

#include "HandMadeFamily.h"
#include "LaidOutCase.h"

namespace {

using views::kFemale;
using views::kMale;
using views::LaidOutCase;
typedef std::vector<std::string> Questions;

class FamilyFlags : public views::HandMadeFamily {
protected:
    void flagAll() { layouter.flagNonDisplayedRelationships(focus); }
    static bool flagOf(const TreeViewPerson& person) { return person.hasNonDisplayedRelationships; }
    TreeViewPerson& spouse() { return focus.spouses.front(); }
};

TEST(FamilyChartFlags, personWithEverybodyDrawnHasNone) {
    LaidOutCase chart(
        "focus 1\nspouses 1 2\nspouses 2 1\nchildren 1 3\nchildren 2 3\nfather 3 1\nmother 3 2\n"
        "father 1 10\nmother 1 11\nchildren 10 1\nchildren 11 1\nspouses 10 11\nspouses 11 10\n");
    for (const int id : {1, 2, 3, 10, 11}) EXPECT_FALSE(chart.flag(id)) << id;
}

TEST(FamilyChartFlags, greatGrandparentWithAParentHasOne) {
    const std::string line =
        "focus 1\nfather 1 10\nchildren 10 1\nfather 10 30\nchildren 30 10\nfather 30 40\nchildren 40 30\n";
    LaidOutCase withParent(line + "father 40 60\nchildren 60 40\n");
    EXPECT_TRUE(withParent.flag(40));
    EXPECT_FALSE(withParent.flag(30));
    LaidOutCase withoutParent(line);
    EXPECT_FALSE(withoutParent.flag(40));
}

TEST(FamilyChartFlags, childWithASpouseOffTheChartHasOne) {
    const std::string family = "focus 1\nchildren 1 3\nfather 3 1\nspouses 3 4\nspouses 4 3\n";
    LaidOutCase hidden("option ACTV_Fam_ShowSpousesOfChildren 0\n" + family);
    EXPECT_TRUE(hidden.flag(3));
    LaidOutCase shown(family);
    EXPECT_FALSE(shown.flag(3));
}

TEST(FamilyChartFlags, spouseWithAnotherMarriageHasOne) {
    LaidOutCase chart("focus 1\nspouses 1 2\nspouses 2 1 8\nspouses 8 2\n");
    EXPECT_TRUE(chart.flag(2));
    EXPECT_FALSE(chart.flag(1));
}

// The parents' nodes hold no children of their own: the focus stands below them all the same.
TEST(FamilyChartFlags, childThatStandsUnderAnotherNodeIsNotHidden) {
    LaidOutCase chart("focus 1\nfather 1 10\nmother 1 11\nchildren 10 1\nchildren 11 1\n");
    EXPECT_EQ(0, chart.person(10).getAllChildrenCount());
    EXPECT_FALSE(chart.flag(10));
    EXPECT_FALSE(chart.flag(11));
}

TEST(FamilyChartFlags, childThatStandsNowhereIsHidden) {
    LaidOutCase chart(
        "focus 1\noption ACTV_Fam_ShowSiblings 0\nfather 1 10\nmother 1 11\nchildren 10 1 2\nchildren 11 "
        "1\n");
    EXPECT_TRUE(chart.flag(10));
    EXPECT_FALSE(chart.flag(11));
}

TEST(FamilyChartFlags, addNodesHaveNone) {
    LaidOutCase chart("focus 1\nspouses 1 2\nspouses 2 1 9\nfather 1 10\nchildren 10 1 5\n");
    for (const int id : chart.walk()) {
        EXPECT_TRUE(id > 0 || !chart.flag(id)) << id;
    }
}

TEST(FamilyChartFlags, parentWhoIsNotKnownIsNotHidden) {
    LaidOutCase chart("focus 1\nfather 1 10\nchildren 10 1\n");
    EXPECT_FALSE(chart.flag(1));
    LaidOutCase bare("focus 1\nadapter bare\nfather 1 10\nchildren 10 1\n");
    EXPECT_FALSE(bare.flag(1));
    EXPECT_FALSE(bare.flag(10));
}

TEST(FamilyChartFlags, doNotDependOnTheOrderOfTheWalk) {
    const std::string same =
        "focus 1\nfather 1 10\nmother 1 11\nspouses 2 1 7\nspouses 3 1\nfather 20 10\nmother 20 11\n"
        "father 21 10\nmother 21 11\nspouses 21 22\nchildren 21 23\nfather 10 30\nfather 30 40\nfather 40 "
        "50\n";
    const auto flags = [](const std::string& text) {
        LaidOutCase chart(text);
        std::map<int, bool> answer;
        for (const int id : chart.walk()) {
            if (id > 0) answer[id] = chart.flag(id);
        }
        return answer;
    };
    const auto forward = flags(same + "spouses 1 2 3\nchildren 10 20 1 21 8\nchildren 11 20 1 21\n");
    const auto backward = flags(same + "spouses 1 3 2\nchildren 10 8 21 1 20\nchildren 11 21 1 20\n");
    EXPECT_EQ(forward, backward);
    EXPECT_TRUE(forward.at(2)) << "married again";
    EXPECT_TRUE(forward.at(40)) << "has a father off the chart";
    EXPECT_FALSE(forward.at(3));
}

// --- The final pass.

TEST_F(FamilyFlags, finalPassOverwritesWhatItFinds) {
    focus.hasNonDisplayedRelationships = true;
    flagAll();
    EXPECT_FALSE(flagOf(focus));
}

TEST_F(FamilyFlags, finalPassLeavesAnAddNodeAsItIs) {
    focus.setParents(1, 2);
    data.addNodes = {1, 2};
    focus.getPreferredFather().hasNonDisplayedRelationships = true;
    flagAll();
    EXPECT_TRUE(flagOf(focus.getPreferredFather()));
    EXPECT_FALSE(flagOf(focus.getPreferredMother()));
}

// As many drawn as known: nobody looks who they are.
TEST_F(FamilyFlags, equalCountsOfChildrenAreTakenForTheSameChildren) {
    focus.addChildWithNoOtherSpouse(5, kMale);
    data.children[0] = {6};
    flagAll();
    EXPECT_FALSE(flagOf(focus));
    focus.addChildWithNoOtherSpouse(8, kMale);
    flagAll();
    EXPECT_TRUE(flagOf(focus)) << "now 6 is looked for and stands nowhere";
}

TEST_F(FamilyFlags, childrenWithASpouseCountAmongThoseDrawn) {
    focus.addSpouse(2, kFemale);
    focus.addChildWithNoOtherSpouse(5, kMale);
    focus.addChildWithSpouse(7, 2, kMale);
    data.spouses[0] = {2};
    data.spouses[2] = {0};
    data.children[0] = {6, 8};
    flagAll();
    EXPECT_FALSE(flagOf(focus));
}

TEST_F(FamilyFlags, equalCountsOfSpousesAreTakenForTheSameSpouses) {
    focus.addSpouse(5, kFemale);
    data.spouses[0] = {6};
    data.spouses[5] = {0};
    flagAll();
    EXPECT_FALSE(flagOf(focus));
    data.spouses[0] = {6, 5};
    flagAll();
    EXPECT_TRUE(flagOf(focus));
}

TEST_F(FamilyFlags, fewerDrawnThanKnownIsNoMatterWhenAllStandSomewhere) {
    focus.setParentsFatherOnly(1);
    focus.addChildWithNoOtherSpouse(5, kMale);
    data.children[1] = {0, 5};
    flagAll();
    EXPECT_FALSE(flagOf(focus.getPreferredFather()));
}

TEST_F(FamilyFlags, parentsWithNodesAreNotAskedForAgain) {
    focus.setParents(1, 2);
    data.parents[0] = {8, 9};
    flagAll();
    EXPECT_FALSE(flagOf(focus));
    EXPECT_FALSE(data.wasAsked("getParents 0"));
}

TEST_F(FamilyFlags, answerAboutAMissingParentMayReplaceTheOneWithANode) {
    focus.setParentsFatherOnly(1);
    data.parents[0] = {8, -1};
    flagAll();
    EXPECT_TRUE(flagOf(focus));
}

TEST_F(FamilyFlags, fatherOffTheChartIsHiddenBesideAMotherOnIt) {
    focus.setParentsMotherOnly(2);
    data.parents[0] = {8, -1};
    flagAll();
    EXPECT_TRUE(flagOf(focus));
}

TEST_F(FamilyFlags, parentOffTheChartIsHidden) {
    focus.setParentsFatherOnly(1);
    data.parents[0] = {1, 9};
    flagAll();
    EXPECT_TRUE(flagOf(focus));
}

TEST_F(FamilyFlags, addNodeParentIsNotHidden) {
    data.parents[0] = {8, 9};
    data.addNodes = {8, 9};
    flagAll();
    EXPECT_FALSE(flagOf(focus));
}

TEST_F(FamilyFlags, dataAreAskedInAFixedOrder) {
    focus.addSpouse(1, kFemale);
    focus.addChildWithSpouse(2, 1, kMale);
    data.spouses = {{0, {1}}, {1, {0}}};
    data.children = {{0, {2}}, {1, {2}}};
    data.parents[2] = {0, 1};
    flagAll();
    EXPECT_EQ((Questions{"getParents 2",                                   // the child's parents
                         "getSpouses 1", "getParents 1",                   // the wife's other relatives
                         "getChildren 0", "getSpouses 0", "getParents 0",  // everybody against the display
                         "getChildren 1", "getSpouses 1", "getParents 1",  //
                         "getChildren 2", "getSpouses 2", "getParents 2"}),
              data.questions);
}

TEST_F(FamilyFlags, marksAndListsAreCleanAfterwards) {
    focus.setParents(1, 2);
    flagAll();
    EXPECT_TRUE(layouter.stackedPersons.empty());
    layouter.graphIterator([](TreeViewPerson& person) { EXPECT_FALSE(person.hasBeenVisited()); });
}

TEST_F(FamilyFlags, failureLeavesTheListAsItStands) {
    adapter.getSpouses = [](int, SpouseSet&) { throw std::domain_error("no spouses today"); };
    EXPECT_THROW(flagAll(), std::domain_error);
    EXPECT_EQ(1u, layouter.stackedPersons.size());
}

TEST_F(FamilyFlags, emptyCallbackFailsAtItsFirstUse) {
    adapter.getChildren.clear();
    EXPECT_THROW(flagAll(), boost::bad_function_call);
}

// --- Great-grandparents.

TEST_F(FamilyFlags, greatGrandparentsWithRealParentsAreFlagged) {
    focus.setParents(1, 2);
    focus.getPreferredFather().setParentsFatherOnly(3);
    TreeViewPerson& grandfather = focus.getPreferredFather().getPreferredFather();
    grandfather.setParents(4, 5);
    data.parents[4] = {8, -1};
    data.parents[5] = {9, -1};
    data.addNodes = {9};
    SharedTreeViewer::flagGreatGrandparentsWithParents(layouter, focus);
    EXPECT_TRUE(flagOf(grandfather.getPreferredFather()));
    EXPECT_FALSE(flagOf(grandfather.getPreferredMother())) << "her father is unknown";
    EXPECT_FALSE(flagOf(grandfather));
}

// --- Siblings, seen on a sibling (key 3) whom the final pass leaves alone.

struct SiblingRow {
    std::string name;
    std::pair<int, int> focusParents;
    std::pair<int, int> siblingParents;
    bool flag;
};
void PrintTo(const SiblingRow& row, std::ostream* out) {
    *out << row.name;
}

class FamilySiblingFlag : public FamilyFlags, public testing::WithParamInterface<SiblingRow> {};

TEST_P(FamilySiblingFlag, comparesItsParentsWithThoseOfTheFocus) {
    const SiblingRow& row = GetParam();
    if (row.focusParents.first != -1) focus.setParentsFatherOnly(row.focusParents.first);
    if (row.focusParents.second != -1) focus.setParentsMotherOnly(row.focusParents.second);
    focus.addSibling(3, kMale);
    data.parents[3] = row.siblingParents;
    data.addNodes = {3, 50, 51};
    flagAll();
    EXPECT_EQ(row.flag, flagOf(focus.siblings.front()));
}

INSTANTIATE_TEST_SUITE_P(
    Rows, FamilySiblingFlag,
    testing::Values(SiblingRow{"sameParents", {1, 2}, {1, 2}, false},
                    SiblingRow{"anotherFather", {1, 2}, {8, 2}, true},
                    SiblingRow{"anotherMother", {1, 2}, {1, 9}, true},
                    SiblingRow{"addNodeMother", {1, 2}, {1, 50}, false},
                    SiblingRow{"addNodeFatherAndSameMother", {1, 2}, {51, 2}, false},
                    SiblingRow{"addNodeFatherAndAnotherMother", {1, 2}, {51, 9}, true},
                    SiblingRow{"unsetFatherAndAnotherMother", {1, 2}, {-1, 9}, true},
                    SiblingRow{"anotherMotherWhereTheFocusHasNone", {1, -1}, {1, 9}, false},
                    SiblingRow{"anotherFatherWhereTheFocusHasNoMother", {1, -1}, {8, 9}, true},
                    SiblingRow{"anotherFatherWhereTheFocusHasNone", {-1, 2}, {8, 2}, false},
                    SiblingRow{"bothOthersWhereTheFocusHasNoFather", {-1, 2}, {8, 9}, true},
                    SiblingRow{"noParentsAtAll", {1, 2}, {-1, -1}, false}),
    [](const auto& row) { return row.param.name; });

TEST_F(FamilyFlags, flaggedSiblingIsNotAskedAboutItsParents) {
    focus.addSibling(3, kMale).hasNonDisplayedRelationships = true;
    data.addNodes = {3};
    flagAll();
    EXPECT_TRUE(flagOf(focus.siblings.front()));
    EXPECT_FALSE(data.wasAsked("getParents 3"));
}

TEST_F(FamilyFlags, spousesOfASiblingAreFlaggedOnlyWhenItsChildrenAreLoaded) {
    for (const bool loaded : {false, true}) {
        focus.siblings.clear();
        TreeViewPerson& sibling = focus.addSibling(3, kMale);
        sibling.allChildrenLoaded = loaded;
        sibling.addSpouse(4, kFemale);
        data.spouses[4] = {3, 9};
        data.addNodes = {4};
        flagAll();
        EXPECT_EQ(loaded, flagOf(sibling.spouses.front()));
    }
}

TEST_F(FamilyFlags, spouseOfASiblingIsFlaggedForAChildFromElsewhere) {
    TreeViewPerson& sibling = focus.addSibling(3, kMale);
    sibling.allChildrenLoaded = true;
    sibling.addSpouse(4, kFemale);
    data.children[4] = {5};
    data.parents[5] = {8, 4};
    data.addNodes = {4};
    layouter.shownPersons[4] = true;
    flagAll();
    EXPECT_TRUE(flagOf(sibling.spouses.front()));
}

TEST_F(FamilyFlags, childrenOfASiblingAreFlaggedForTheirOwnFamilies) {
    focus.addSibling(3, kMale).addChildWithNoOtherSpouse(5, kMale);
    data.children[5] = {6};
    data.addNodes = {5};
    flagAll();
    EXPECT_TRUE(flagOf(unknownChild(focus.siblings.front())));
}

// --- Children of the focus and their families.

TEST_F(FamilyFlags, childIsFlaggedForAParentOffTheChart) {
    focus.addChildWithNoOtherSpouse(5, kMale);
    data.parents[5] = {0, 9};
    data.addNodes = {5};
    flagAll();
    EXPECT_TRUE(flagOf(unknownChild(focus)));
}

TEST_F(FamilyFlags, spouseOfAChildIsFlaggedForAnotherMarriage) {
    focus.addChildWithNoOtherSpouse(5, kMale).addSpouse(6, kFemale);
    data.spouses[6] = {5, 8};
    data.addNodes = {6};
    flagAll();
    EXPECT_TRUE(flagOf(unknownChild(focus).spouses.front()));
}

TEST_F(FamilyFlags, spouseOfAChildIsFlaggedForAChildFromElsewhere) {
    focus.addChildWithNoOtherSpouse(5, kMale).addSpouse(6, kFemale);
    data.children[6] = {7};
    data.parents[7] = {8, 6};
    data.addNodes = {6};
    layouter.shownPersons[6] = true;
    flagAll();
    EXPECT_TRUE(flagOf(unknownChild(focus).spouses.front()));
}

TEST_F(FamilyFlags, grandchildIsFlaggedForAFamilyOfItsOwn) {
    focus.addChildWithNoOtherSpouse(5, kMale).addChildWithNoOtherSpouse(7, kMale);
    data.spouses[7] = {8};
    data.addNodes = {7};
    flagAll();
    EXPECT_TRUE(flagOf(unknownChild(unknownChild(focus))));
}

TEST_F(FamilyFlags, spouseOfTheFocusIsFlaggedWithoutALookAtItsChildren) {
    focus.addSpouse(1, kFemale);
    data.spouses[1] = {0, 9};
    data.addNodes = {1};
    flagAll();
    EXPECT_TRUE(flagOf(spouse()));
    EXPECT_FALSE(data.wasAsked("getChildren 1"));
}

// --- One operation alone: spouses.

class FamilySpouseFlags : public FamilyFlags {
protected:
    FamilySpouseFlags() { focus.addSpouse(1, kFemale); }
    bool flagAfter(bool checkChildren) {
        layouter.flagNonDisplayedRelationshipsForSpouses(focus, checkChildren);
        return flagOf(spouse());
    }
};

TEST_F(FamilySpouseFlags, theMarriageOnTheChartIsNoNews) {
    data.spouses[1] = {0};
    spouse().hasNonDisplayedRelationships = true;
    EXPECT_FALSE(flagAfter(false)) << "overwrites what was there";
}

TEST_F(FamilySpouseFlags, secondMarriageIsAndEndsTheQuestions) {
    data.spouses[1] = {0, 9};
    EXPECT_TRUE(flagAfter(false));
    EXPECT_EQ((Questions{"getSpouses 1"}), data.questions);
}

TEST_F(FamilySpouseFlags, realParentsAre) {
    data.parents[1] = {8, -1};
    EXPECT_TRUE(flagAfter(false));
    EXPECT_EQ((Questions{"getSpouses 1", "getParents 1"}), data.questions);
}

TEST_F(FamilySpouseFlags, addNodeParentsAreNot) {
    data.parents[1] = {8, 9};
    data.addNodes = {8, 9};
    EXPECT_FALSE(flagAfter(false));
}

TEST_F(FamilySpouseFlags, childOfAnotherCoupleIs) {
    data.children[1] = {5};
    data.parents[5] = {8, 1};
    layouter.shownPersons[1] = true;
    EXPECT_TRUE(flagAfter(true));
}

TEST_F(FamilySpouseFlags, childOfThisCoupleIsNot) {
    data.children[1] = {5};
    data.parents[5] = {0, 1};
    layouter.shownPersons[1] = true;
    EXPECT_FALSE(flagAfter(true));
}

TEST_F(FamilySpouseFlags, childOfWhomNobodyWasAdmittedIsNot) {
    data.children[1] = {5};
    data.parents[5] = {8, 9};
    EXPECT_FALSE(flagAfter(true));
}

TEST_F(FamilySpouseFlags, onlyTheFirstChildIsLookedAt) {
    data.children[1] = {5, 6};
    data.parents[5] = {0, 1};
    data.parents[6] = {8, 1};
    layouter.shownPersons[1] = true;
    EXPECT_FALSE(flagAfter(true));
    EXPECT_FALSE(data.wasAsked("getParents 6"));
}

TEST_F(FamilySpouseFlags, childrenAreLookedAtEvenWhenTheAnswerIsKnown) {
    data.spouses[1] = {0, 9};
    data.children[1] = {5};
    data.parents[5] = {0, 1};
    EXPECT_TRUE(flagAfter(true));
    EXPECT_EQ((Questions{"getSpouses 1", "getChildren 1", "getParents 5"}), data.questions);
}

// --- One operation alone: a child's parents.

struct ChildRow {
    std::string name;
    std::pair<int, int> childParents;
    bool flag;
};
void PrintTo(const ChildRow& row, std::ostream* out) {
    *out << row.name;
}

// The focus is 0, its shown wives are 1 and the unknown parent 50; the host also knows a wife 7 of the focus.
class FamilyChildFlag : public FamilyFlags, public testing::WithParamInterface<ChildRow> {};

TEST_P(FamilyChildFlag, showsAParentOffTheChart) {
    for (const bool before : {false, true}) {
        TreeViewPerson person(0);
        person.addSpouse(1, kFemale);
        person.addSpouse(50, kFemale);
        TreeViewPerson& child = person.addChildWithNoOtherSpouse(5, kMale);
        child.hasNonDisplayedRelationships = before;
        data.spouses[0] = {1, 7};
        data.parents[5] = GetParam().childParents;
        data.addNodes = {50, 51};
        layouter.checkChildForUnshownParents(person, child);
        EXPECT_EQ(GetParam().flag, flagOf(child)) << "flag before: " << before;
    }
}

INSTANTIATE_TEST_SUITE_P(Rows, FamilyChildFlag,
                         testing::Values(ChildRow{"ofAShownCouple", {0, 1}, false},
                                         ChildRow{"ofAShownCoupleTheOtherWayRound", {1, 0}, false},
                                         ChildRow{"ofAnUnshownWife", {0, 7}, true},
                                         ChildRow{"ofAStranger", {0, 9}, true},
                                         ChildRow{"ofTwoStrangers", {8, 9}, true},
                                         ChildRow{"ofTheWifeAndAStranger", {8, 1}, true},
                                         ChildRow{"withAnAddNodeMother", {0, 51}, false},
                                         ChildRow{"ofAShownAddNodeWife", {0, 50}, false},
                                         ChildRow{"withOneKnownParent", {0, -1}, false},
                                         ChildRow{"withAnAddNodeFather", {51, 1}, false}),
                         [](const auto& row) { return row.param.name; });

TEST_F(FamilyFlags, hostSpousesOfTheParentAreLoadedOnlyForAnUnshownCouple) {
    focus.addSpouse(1, kFemale);
    focus.addChildWithSpouse(5, 1, kMale);
    data.parents[5] = {0, 1};
    layouter.checkChildForUnshownParents(focus, childUnder(focus, 1));
    EXPECT_FALSE(focus.nonDisplayedSpousesLoaded);
    data.parents[5] = {0, 9};
    layouter.checkChildForUnshownParents(focus, childUnder(focus, 1));
    EXPECT_TRUE(focus.nonDisplayedSpousesLoaded);
}

// --- One operation alone: a person's children.

TEST_F(FamilyFlags, childrenWithFamiliesOfTheirOwnAreFlagged) {
    for (const int key : {5, 6, 7, 8}) focus.addChildWithNoOtherSpouse(key, kMale);
    data.spouses[5] = {9};
    unknownChild(focus, 1).addSpouse(9, kFemale);
    data.children[7] = {9};
    unknownChild(focus, 3).hasNonDisplayedRelationships = true;
    layouter.checkPersonsChildren(focus);
    EXPECT_TRUE(flagOf(unknownChild(focus, 0))) << "has a host spouse";
    EXPECT_TRUE(flagOf(unknownChild(focus, 1))) << "has a drawn spouse";
    EXPECT_TRUE(flagOf(unknownChild(focus, 2))) << "has a child";
    EXPECT_FALSE(flagOf(unknownChild(focus, 3))) << "has nobody, whatever was said before";
}

TEST_F(FamilyFlags, childrenOfASpouseCountAmongAPersonsChildren) {
    focus.addSpouse(1, kFemale).addChildWithNoOtherSpouse(5, kMale);
    data.spouses[5] = {9};
    layouter.checkPersonsChildren(focus);
    EXPECT_TRUE(flagOf(unknownChild(spouse())));
}

TEST_F(FamilyFlags, childrenAreNotAskedForWhereASpouseIsKnown) {
    focus.addChildWithNoOtherSpouse(5, kMale);
    data.spouses[5] = {9};
    layouter.checkPersonsChildren(focus);
    EXPECT_EQ((Questions{"getSpouses 5"}), data.questions);
}

}  // namespace
