// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The walks over the finished graph: everybody, the direct lines from the focus, and the climb through the
// preferred ancestors that marks persons and flags couples.

#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <vector>

#include "HandMadeFamily.h"

namespace {

using views::kFemale;
using views::kMale;
typedef std::vector<int> Keys;

// One visit of the direct-line walk: who, and beside which neighbours; none for an empty walk.
struct Visit {
    int key;
    bool hasNeighbours;
    Keys neighbours;
    bool operator==(const Visit&) const = default;
};
std::ostream& operator<<(std::ostream& out, const Visit& visit) {
    out << visit.key << (visit.hasNeighbours ? " beside" : " alone");
    for (const int key : visit.neighbours) out << " " << key;
    return out;
}

class FamilyTraversal : public views::HandMadeFamily {
protected:
    Keys everybody() {
        return views::keysOf([this](const TreeViewPerson::Visitor& visit) { layouter.graphIterator(visit); });
    }
    std::vector<Visit> directLines() {
        std::vector<Visit> visits;
        layouter.iterateDirectLineFromFocusPerson([&visits](TreeViewPerson& person, bool hasNeighbours,
                                                            const TreeViewPerson::Iterator& neighbours) {
            EXPECT_EQ(hasNeighbours, !neighbours.empty());
            visits.push_back(
                {person.personId, hasNeighbours, hasNeighbours ? views::keysOf(neighbours) : Keys{}});
        });
        return visits;
    }
    // The parents 1 and 2 with the father's father 3, the wife 4 with a child 9 of her own, a child 5 alone
    // and 6 with her, and the siblings 10, 7 and 8 around the focus's own entry.
    void buildOneOfEachKind() {
        focus.setParents(1, 2);
        focus.getPreferredFather().setParentsFatherOnly(3);
        focus.addSpouse(4, kFemale).addChildWithNoOtherSpouse(9, kMale);
        focus.addChildWithNoOtherSpouse(5, kMale);
        focus.addChildWithSpouse(6, 4, kMale);
        for (const int key : {10, 7, 0, 8}) focus.addSibling(key, kMale);
    }
};

class FamilyStacking : public FamilyTraversal {
protected:
    Keys stackedFromFocus(int depth = 0) {
        layouter.traverseTreeForStacking(depth, focus);
        Keys keys;
        for (const TreeViewPerson* person : layouter.stackedPersons) keys.push_back(person->personId);
        return keys;
    }
    TreeViewPerson& father() { return focus.getPreferredFather(); }
    TreeViewPerson& mother() { return focus.getPreferredMother(); }
};

TEST_F(FamilyTraversal, loneFocusIsVisitedOnce) {
    EXPECT_EQ((Keys{0}), everybody());
    EXPECT_TRUE(directLines().empty());
}

TEST_F(FamilyTraversal, everybodyIsMetParentsFirstThenSpousesChildrenAndSiblings) {
    buildOneOfEachKind();
    EXPECT_EQ((Keys{0, 1, 3, 2, 4, 9, 5, 6, 10, 7, 8}), everybody());
}

TEST_F(FamilyTraversal, secondWalkMeetsTheSamePersonsInTheSameOrder) {
    buildOneOfEachKind();
    const Keys first = everybody();
    EXPECT_EQ(first, everybody());
}

TEST_F(FamilyTraversal, marksOfOtherWalksAreNotAskedFor) {
    buildOneOfEachKind();
    const Keys before = everybody();
    layouter.graphIterator([](TreeViewPerson& person) { person.setHasBeenVisited(true); });
    EXPECT_EQ(before, everybody());
}

TEST_F(FamilyTraversal, spousesThatAreNotDrawnAreNotVisited) {
    focus.addNonDisplayedSpouse(1);
    EXPECT_EQ((Keys{0}), everybody());
}

TEST_F(FamilyTraversal, onePersonInTwoPlacesIsVisitedTwice) {
    focus.addSpouse(1, kFemale);
    focus.addSpouse(1, kFemale);
    EXPECT_EQ((Keys{0, 1, 1}), everybody());
}

TEST_F(FamilyTraversal, ownEntryIsSkippedAtEverySiblingList) {
    focus.setParents(1, 2);
    focus.getPreferredFather().addSibling(1, kMale);
    focus.getPreferredFather().addSibling(3, kMale);
    EXPECT_EQ((Keys{0, 1, 3, 2}), everybody());
}

TEST_F(FamilyTraversal, directLinesLeadUpAndDownAndAsideButToNoSpouse) {
    buildOneOfEachKind();
    EXPECT_EQ((std::vector<Visit>{{1, false, {}},
                                  {3, false, {}},
                                  {2, false, {}},
                                  {5, true, {0, 4}},
                                  {6, true, {0, 4}},
                                  {10, true, {1, 2}},
                                  {7, true, {1, 2}},
                                  {8, true, {1, 2}}}),
              directLines());
}

TEST_F(FamilyTraversal, directLinesGoOnThroughChildrenAndParentsSiblings) {
    focus.setParentsFatherOnly(1);
    focus.getPreferredFather().setParentsMotherOnly(2);
    focus.getPreferredFather().addSibling(3, kMale).addChildWithNoOtherSpouse(4, kMale);
    focus.addChildWithNoOtherSpouse(5, kFemale).addChildWithNoOtherSpouse(6, kMale);
    EXPECT_EQ(
        (std::vector<Visit>{
            {1, false, {}}, {2, false, {}}, {3, true, {2}}, {4, true, {3}}, {5, true, {0}}, {6, true, {5}}}),
        directLines());
}

TEST_F(FamilyTraversal, emptyVisitorFailsAtTheFirstPerson) {
    EXPECT_THROW(layouter.graphIterator(TreeViewPerson::Visitor()), boost::bad_function_call);
    EXPECT_NO_THROW(layouter.iterateDirectLineFromFocusPerson(SharedTreeViewer::DirectLineVisitor()));
    focus.setParentsFatherOnly(1);
    EXPECT_THROW(layouter.iterateDirectLineFromFocusPerson(SharedTreeViewer::DirectLineVisitor()),
                 boost::bad_function_call);
}

TEST_F(FamilyStacking, climbsTheFathersWholeLineBeforeTheMothers) {
    focus.setParents(1, 2);
    father().setParents(3, 4);
    mother().setParents(5, 6);
    EXPECT_EQ((Keys{0, 1, 3, 4, 2, 5, 6}), stackedFromFocus());
    for (const TreeViewPerson* person : layouter.stackedPersons) EXPECT_TRUE(person->hasBeenVisited());
}

TEST_F(FamilyStacking, climbsFourLevelsAtMost) {
    focus.setParentsFatherOnly(1);
    father().setParentsFatherOnly(2);
    father().getPreferredFather().setParentsMotherOnly(3);
    father().getPreferredFather().getPreferredMother().setParentsFatherOnly(4);
    EXPECT_EQ((Keys{0, 1, 2, 3}), stackedFromFocus());
}

TEST_F(FamilyStacking, startsNotAtAllAtTheGreatestDepth) {
    EXPECT_EQ(Keys{}, stackedFromFocus(4));
    EXPECT_FALSE(focus.hasBeenVisited());
    EXPECT_EQ((Keys{0}), stackedFromFocus(3));
}

TEST_F(FamilyStacking, entersAMarkedPersonNotAgain) {
    focus.setParents(1, 2);
    focus.setHasBeenVisited(true);
    EXPECT_EQ(Keys{}, stackedFromFocus());
}

TEST_F(FamilyStacking, climbsNoAddNode) {
    focus.setParents(1, 2);
    father().setParents(3, 4);
    data.addNodes = {1};
    EXPECT_EQ((Keys{0, 2}), stackedFromFocus());
}

TEST_F(FamilyStacking, asksAnAddNodeForItsSpousesAllTheSame) {
    focus.setParents(1, 2);
    data.addNodes = {1};
    stackedFromFocus();
    EXPECT_EQ((std::vector<std::string>{"getSpouses 1", "getSpouses 2"}), data.questions);
}

TEST_F(FamilyStacking, flagsAPartnerWithASpouseOtherThanTheCoParent) {
    focus.setParents(1, 2);
    data.spouses[1] = {2, 9};
    data.spouses[2] = {1};
    stackedFromFocus();
    EXPECT_TRUE(father().hasNonDisplayedRelationships);
    EXPECT_FALSE(mother().hasNonDisplayedRelationships);
}

TEST_F(FamilyStacking, flagsAMotherWithAnotherHusband) {
    focus.setParents(1, 2);
    data.spouses[1] = {2};
    data.spouses[2] = {9};
    stackedFromFocus();
    EXPECT_FALSE(father().hasNonDisplayedRelationships);
    EXPECT_TRUE(mother().hasNonDisplayedRelationships);
}

TEST_F(FamilyStacking, flagsNobodyWhereOneParentIsKnown) {
    data.spouses[1] = {8, 9};
    focus.setParentsFatherOnly(1);
    stackedFromFocus();
    EXPECT_FALSE(father().hasNonDisplayedRelationships);
    EXPECT_TRUE(data.questions.empty());
}

TEST_F(FamilyStacking, flagsNobodyWhereOnlyAMotherIsKnown) {
    data.spouses[2] = {8, 9};
    focus.setParentsMotherOnly(2);
    EXPECT_EQ((Keys{0, 2}), stackedFromFocus());
    EXPECT_FALSE(mother().hasNonDisplayedRelationships);
}

TEST_F(FamilyStacking, finishesAncestorsBeforeTheirChildrensCouple) {
    focus.setParents(1, 2);
    father().setParents(3, 4);
    stackedFromFocus();
    EXPECT_EQ((std::vector<std::string>{"getSpouses 3", "getSpouses 4", "getSpouses 1", "getSpouses 2"}),
              data.questions);
}

TEST_F(FamilyStacking, placesNobody) {
    focus.setParents(1, 2);
    stackedFromFocus();
    EXPECT_EQ((views::Point{0.0f, 0.0f}), views::placeOf(father()));
}

TEST_F(FamilyStacking, needsToAskForAddNodes) {
    adapter.isAddNode.clear();
    EXPECT_THROW(layouter.traverseTreeForStacking(0, focus), boost::bad_function_call);
}

}  // namespace
