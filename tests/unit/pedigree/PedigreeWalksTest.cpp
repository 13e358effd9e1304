// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The walks of the pedigree view: as in the family view, but for siblings, whom this chart does not have.

#include <gtest/gtest.h>

#include <utility>
#include <vector>

#include "HandMadePedigree.h"

namespace {

using views::kFemale;
using views::kMale;
typedef std::vector<int> Keys;

class PedigreeWalks : public views::HandMadePedigree {
protected:
    // Parents 1 and 2 with the father's mother 3, a wife 4 with a child 9 of her own, a child 5 alone and 6
    // with her, and a sibling 7 that the walks are to pass over.
    void buildOneOfEachKind() {
        focus.setParents(1, 2);
        father().setParentsMotherOnly(3);
        focus.addSpouse(4, kFemale).addChildWithNoOtherSpouse(9, kMale);
        focus.addChildWithNoOtherSpouse(5, kMale);
        focus.addChildWithSpouse(6, 4, kMale);
        focus.addSibling(7, kMale);
    }
    Keys stackedFromFocus() {
        layouter.traverseTreeForStacking(0, focus);
        Keys keys;
        for (const TreeViewPerson* person : layouter.stackedPersons) keys.push_back(person->personId);
        return keys;
    }
};

TEST_F(PedigreeWalks, everybodyIsMetParentsFirstThenSpousesAndChildrenButNoSiblings) {
    buildOneOfEachKind();
    EXPECT_EQ((Keys{0, 1, 3, 2, 4, 9, 5, 6}), everybody());
}

TEST_F(PedigreeWalks, directLinesLeadUpAndDownOnly) {
    buildOneOfEachKind();
    std::vector<std::pair<int, Keys>> visits;
    layouter.iterateDirectLineFromFocusPerson(
        [&visits](TreeViewPerson& person, bool hasNeighbours, const TreeViewPerson::Iterator& neighbours) {
            EXPECT_EQ(hasNeighbours, !neighbours.empty());
            visits.emplace_back(person.personId, hasNeighbours ? views::keysOf(neighbours) : Keys{});
        });
    EXPECT_EQ((std::vector<std::pair<int, Keys>>{{1, {}}, {3, {}}, {2, {}}, {5, {0, 4}}, {6, {0, 4}}}),
              visits);
}

TEST_F(PedigreeWalks, directLinesOfALoneFocusAreNone) {
    layouter.iterateDirectLineFromFocusPerson(
        [](TreeViewPerson&, bool, const TreeViewPerson::Iterator&) { FAIL() << "nobody is on a line"; });
    EXPECT_EQ((Keys{0}), everybody());
}

TEST_F(PedigreeWalks, emptyVisitorFails) {
    EXPECT_THROW(layouter.graphIterator(TreeViewPerson::Visitor()), boost::bad_function_call);
}

TEST_F(PedigreeWalks, climbGoesAsDeepAsTheHostAllows) {
    focus.setParents(1, 2);
    father().setParents(3, 4);
    layouter.maxStackDepth = 2;
    EXPECT_EQ((Keys{0, 1, 2}), stackedFromFocus());
}

TEST_F(PedigreeWalks, climbTakesTheFathersLineFirst) {
    focus.setParents(1, 2);
    father().setParents(3, 4);
    EXPECT_EQ((Keys{0, 1, 3, 4, 2}), stackedFromFocus());
}

TEST_F(PedigreeWalks, climbStopsAtAddNodesAndMarkedPersons) {
    focus.setParents(1, 2);
    data.addNodes = {1};
    mother().setHasBeenVisited(true);
    EXPECT_EQ((Keys{0}), stackedFromFocus());
}

TEST_F(PedigreeWalks, climbFlagsAPartnerWithAnotherSpouse) {
    focus.setParents(1, 2);
    data.spouses = {{1, {2, 9}}, {2, {1}}};
    stackedFromFocus();
    EXPECT_TRUE(father().hasNonDisplayedRelationships);
    EXPECT_FALSE(mother().hasNonDisplayedRelationships);
}

TEST_F(PedigreeWalks, climbFlagsNobodyWhereOneParentIsKnown) {
    focus.setParentsMotherOnly(2);
    data.spouses[2] = {8, 9};
    stackedFromFocus();
    EXPECT_FALSE(mother().hasNonDisplayedRelationships);
}

}  // namespace
