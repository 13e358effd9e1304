// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The records of what a drawn line stands for: who owns an edge, who merely finds it, and what the couple's
// view of its children's edges promises.

#include <vector>

#include <gtest/gtest.h>

#include <boost/make_shared.hpp>
#include <boost/shared_ptr.hpp>
#include <boost/weak_ptr.hpp>

#include <olvane/graph/TreeViewPerson.h>
#include <unit/graph/Visits.h>

namespace {

using unit::failureOf;
using unit::kEmptyFunctionFailure;
using unit::Keys;

typedef boost::shared_ptr<TreeViewGenerationEdge> GenerationEdge;

TreeLine lineFrom(float x, float y) {
    return TreeLine(TreeLineSegment{x, y, x + 10.0f, y, false});
}

Keys ownedEdgesBySpouse(TreeViewPerson& person) {
    Keys keys;
    person.spouseEdgeIterator([&](TreeViewSpouseEdge* edge) {
        keys.push_back(edge->person == &person ? edge->spouse->personId : edge->person->personId);
    });
    return keys;
}

class CouplesEdge : public testing::Test {
protected:
    CouplesEdge() {
        man.setGender(true);
        woman.setGender(false);
    }

    // Destroyed in the reverse order: either may own the edge.
    TreeViewPerson man{1};
    TreeViewPerson woman{2};
    TreeViewPerson child{3};
    TreeViewPerson secondChild{4};
};

TEST(Edge, keepsACopyOfTheLineThatItIsMadeFrom) {
    TreeLine line = lineFrom(1.0f, 2.0f);
    const TreeViewEdge edge(line);
    line.pushPointBack(TreePoint{9.0f, 9.0f});
    EXPECT_EQ((std::vector<TreePoint>{{1.0f, 2.0f}, {11.0f, 2.0f}}), edge.line().points());
}

TEST_F(CouplesEdge, isMadeOnceAndKeepsItsFirstLine) {
    TreeViewSpouseEdge* const first = man.spouseEdge(&woman, lineFrom(1.0f, 2.0f));
    EXPECT_EQ(first, woman.spouseEdge(&man, lineFrom(8.0f, 9.0f)));
    EXPECT_EQ(first, man.spouseEdge(&woman, TreeLine()));
    ASSERT_EQ(2u, first->line().points().size());
    EXPECT_EQ(1.0f, first->line().first().x);
    EXPECT_EQ(&man, first->person);
    EXPECT_EQ(&woman, first->spouse);
    EXPECT_FALSE(first->isSpouseMale());
}

TEST_F(CouplesEdge, isOwnedByWhoWasAskedFirstAndFoundByTheOther) {
    TreeViewSpouseEdge* const edge = man.spouseEdge(&woman, TreeLine());
    EXPECT_EQ(edge, man.spouseEdges.at(2));
    EXPECT_EQ(edge, woman.unownedSpouseEdges.at(1));
    EXPECT_TRUE(man.unownedSpouseEdges.empty());
    EXPECT_TRUE(woman.spouseEdges.empty());
    EXPECT_EQ((Keys{2}), ownedEdgesBySpouse(man));
    EXPECT_EQ(Keys{}, ownedEdgesBySpouse(woman));
}

TEST_F(CouplesEdge, askedOfTheWomanFirstStillNamesTheManFirst) {
    TreeViewSpouseEdge* const edge = woman.spouseEdge(&man, TreeLine());
    EXPECT_EQ(&man, edge->person);
    EXPECT_EQ(&woman, edge->spouse);
    EXPECT_EQ(edge, woman.spouseEdges.at(1));
    EXPECT_EQ(edge, man.unownedSpouseEdges.at(2));
    EXPECT_EQ(edge, man.spouseEdge(&woman, TreeLine()));
    EXPECT_EQ(Keys{}, ownedEdgesBySpouse(man));
}

TEST_F(CouplesEdge, ofTwoMenNamesTheOneAskedFirst) {
    TreeViewPerson other(5);
    other.setGender(true);
    TreeViewSpouseEdge* const edge = man.spouseEdge(&other, TreeLine());
    EXPECT_EQ(&man, edge->person);
    EXPECT_EQ(&other, edge->spouse);
    EXPECT_TRUE(edge->isSpouseMale());
}

TEST_F(CouplesEdge, ofTwoWomenNamesTheOneAskedSecond) {
    TreeViewPerson other(5);
    TreeViewSpouseEdge* const edge = woman.spouseEdge(&other, TreeLine());
    EXPECT_EQ(&other, edge->person);
    EXPECT_EQ(&woman, edge->spouse);
    EXPECT_FALSE(edge->isSpouseMale());
}

TEST_F(CouplesEdge, unownedOneIsFoundAheadOfAnOwnedOne) {
    TreeViewPerson otherNodeOfTheWoman(2);
    TreeViewSpouseEdge* const owned = man.spouseEdge(&woman, TreeLine());
    TreeViewSpouseEdge unowned(&man, &otherNodeOfTheWoman);
    man.addUnownedSpouseEdge(&unowned, 2);
    EXPECT_EQ(&unowned, man.spouseEdge(&woman, TreeLine()));
    EXPECT_EQ(owned, man.spouseEdges.at(2));
}

TEST_F(CouplesEdge, unownedEntryIsReplacedByALaterOneOfTheSameKey) {
    TreeViewSpouseEdge first(&man, &woman);
    TreeViewSpouseEdge second(&man, &woman);
    woman.addUnownedSpouseEdge(&first, 1);
    woman.addUnownedSpouseEdge(&second, 1);
    EXPECT_EQ(1u, woman.unownedSpouseEdges.size());
    EXPECT_EQ(&second, woman.unownedSpouseEdges.at(1));
}

TEST_F(CouplesEdge, walkGoesByAscendingKeyWhateverTheOrderOfMaking) {
    TreeViewPerson ninth(9);
    TreeViewPerson fifth(5);
    for (TreeViewPerson* spouse : {&ninth, &woman, &fifth}) man.spouseEdge(spouse, TreeLine());
    EXPECT_EQ((Keys{2, 5, 9}), ownedEdgesBySpouse(man));
}

TEST_F(CouplesEdge, walkWithAnEmptyVisitorFailsByNameOnlyWhereThereIsAnEdge) {
    const TreeViewPerson::SpouseEdgeVisitor nobody;
    EXPECT_NO_THROW(man.spouseEdgeIterator(nobody));
    man.spouseEdge(&woman, TreeLine());
    EXPECT_EQ(kEmptyFunctionFailure,
              failureOf<boost::bad_function_call>([&] { man.spouseEdgeIterator(nobody); }));
}

TEST_F(CouplesEdge, goesWithItsOwnerAndTakesTheChildrensEdgesAlong) {
    boost::weak_ptr<TreeViewGenerationEdge> watched;
    {
        TreeViewPerson owner(5);
        TreeViewSpouseEdge* const edge = owner.spouseEdge(&man, TreeLine());
        const auto childEdge = boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, edge);
        edge->addChildEdge(childEdge);
        watched = childEdge;
    }
    EXPECT_TRUE(watched.expired());
}

TEST_F(CouplesEdge, staysWhenThePartnerWhoDoesNotOwnItGoes) {
    boost::weak_ptr<TreeViewGenerationEdge> watched;
    {
        TreeViewPerson partner(5);
        TreeViewSpouseEdge* const edge = man.spouseEdge(&partner, TreeLine());
        const auto childEdge = boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, edge);
        edge->addChildEdge(childEdge);
        watched = childEdge;
    }
    EXPECT_FALSE(watched.expired());
    EXPECT_EQ(1u, man.spouseEdges.at(5)->size());
}

// --- The children's edges of a couple.

TEST_F(CouplesEdge, startsWithoutChildren) {
    TreeViewSpouseEdge plain(&man, &woman);
    EXPECT_EQ(0u, plain.size());
    EXPECT_TRUE(plain.line().points().empty());
    TreeViewSpouseEdge withLine(lineFrom(1.0f, 2.0f), &man, &woman);
    EXPECT_EQ(0u, withLine.size());
    EXPECT_EQ(2u, withLine.line().points().size());
    EXPECT_EQ(withLine.begin(), withLine.end());
}

TEST_F(CouplesEdge, madeWithChildrensEdgesHoldsACopyOfTheList) {
    TreeViewSpouseEdge parents(&man, &woman);
    TreeViewSpouseEdge::ChildEdges edges{
        boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &parents)};
    TreeViewSpouseEdge edge(lineFrom(1.0f, 2.0f), &man, &woman, edges);
    EXPECT_EQ(2, edges[0].use_count());
    edges.clear();
    ASSERT_EQ(1u, edge.size());
    EXPECT_EQ(&child, edge.childEdges[0]->child);
}

TEST_F(CouplesEdge, sizeIsRightAtOnceAndTheEndIsStaleUntilTheNextBegin) {
    TreeViewSpouseEdge edge(&man, &woman);
    edge.addChildEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &edge));
    EXPECT_EQ(1u, edge.size());
    EXPECT_EQ(0, edge.end() - edge.childEdgeList.begin());  // no begin was asked yet
    EXPECT_EQ(1, [&] {
        const auto begin = edge.begin();
        return edge.end() - begin;
    }());
    edge.addChildEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &secondChild, &edge));
    EXPECT_EQ(2u, edge.size());
    EXPECT_EQ(1, edge.end() - edge.childEdgeList.begin());
    const auto begin = edge.begin();
    EXPECT_EQ(2, edge.end() - begin);
    EXPECT_EQ(&child, (*begin)->child);
    EXPECT_EQ(&secondChild, (*(begin + 1))->child);
}

TEST_F(CouplesEdge, walkOverAConstantEdgeTakesTheViewAgainToo) {
    TreeViewSpouseEdge edge(&man, &woman);
    edge.addChildEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &edge));
    const TreeViewSpouseEdge& constant = edge;
    const auto begin = constant.cbegin();
    ASSERT_EQ(1, constant.cend() - begin);
    EXPECT_EQ(edge.childEdges[0].get(), *begin);
    EXPECT_EQ(1, constant.cend() - constant.cbegin());  // not appended once more
}

TEST_F(CouplesEdge, sharedPointersHaveAWalkOfTheirOwn) {
    TreeViewSpouseEdge edge(&man, &woman);
    edge.addChildEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &edge));
    const TreeViewSpouseEdge& constant = edge;
    ASSERT_EQ(1, edge.send() - edge.sbegin());
    ASSERT_EQ(1, constant.csend() - constant.csbegin());
    EXPECT_EQ(edge.childEdges[0], *edge.sbegin());
    EXPECT_EQ(edge.childEdges[0], *constant.csbegin());
}

TEST_F(CouplesEdge, insertedChildStandsLastWhateverThePosition) {
    TreeViewPerson third(5);
    TreeViewSpouseEdge edge(&man, &woman);
    edge.addChildEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &edge));
    edge.addChildEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &secondChild, &edge));
    edge.insertChildEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &third, &edge),
                         edge.csbegin());
    ASSERT_EQ(3u, edge.size());
    EXPECT_EQ(&child, edge.childEdges[0]->child);
    EXPECT_EQ(&third, edge.childEdges[2]->child);
}

TEST_F(CouplesEdge, addedChildsEdgeIsSharedWithItsOtherHolders) {
    TreeViewSpouseEdge edge(&man, &woman);
    const auto childEdge = boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &edge);
    edge.addChildEdge(childEdge);
    EXPECT_EQ(2, childEdge.use_count());
}

// --- Generation edges.

TEST_F(CouplesEdge, childsEdgeHangsFromTheCoupleOrFromOneParent) {
    TreeViewSpouseEdge couple(&man, &woman);
    const TreeViewGenerationEdge fromCouple(lineFrom(1.0f, 2.0f), &child, &couple);
    EXPECT_EQ(&child, fromCouple.child);
    EXPECT_EQ(&couple, fromCouple.parentsEdge);
    EXPECT_EQ(nullptr, fromCouple.singleParent);
    EXPECT_FALSE(fromCouple.hasSingleParent());
    EXPECT_TRUE(fromCouple.hasMultipleParents());
    const TreeViewGenerationEdge fromOne(lineFrom(1.0f, 2.0f), &child, &man);
    EXPECT_EQ(&man, fromOne.singleParent);
    EXPECT_EQ(nullptr, fromOne.parentsEdge);
    EXPECT_TRUE(fromOne.hasSingleParent());
    EXPECT_FALSE(fromOne.hasMultipleParents());
}

TEST_F(CouplesEdge, lineIsHandedOutAsACopy) {
    const TreeViewGenerationEdge edge(lineFrom(1.0f, 2.0f), &child, &man);
    TreeLine copy = edge.line();
    copy.pushPointBack(TreePoint{5.0f, 5.0f});
    EXPECT_EQ(2u, edge.line().points().size());
}

TEST_F(CouplesEdge, lineIsCopiedInWhenTheEdgeIsMade) {
    TreeLine line = lineFrom(1.0f, 2.0f);
    const TreeViewGenerationEdge edge(line, &child, &man);
    line.pushPointBack(TreePoint{5.0f, 5.0f});
    EXPECT_EQ(2u, edge.line().points().size());
}

TEST_F(CouplesEdge, loneParentsEdgesAreWalkedInTheOrderAdded) {
    man.addGenerationEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &secondChild, &man));
    man.addGenerationEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &man));
    Keys keys;
    man.generationEdgeIterator([&](TreeViewGenerationEdge* edge) { keys.push_back(edge->child->personId); });
    EXPECT_EQ((Keys{4, 3}), keys);
}

TEST_F(CouplesEdge, loneParentsEdgeIsHeldWhileItIsVisited) {
    const boost::weak_ptr<TreeViewGenerationEdge> watched = [&] {
        const auto edge = boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &man);
        man.addGenerationEdge(edge);
        return boost::weak_ptr<TreeViewGenerationEdge>(edge);
    }();
    bool heldInside = false;
    man.generationEdgeIterator([&](TreeViewGenerationEdge*) {
        man.generationEdges[0].reset();
        heldInside = !watched.expired();
    });
    EXPECT_TRUE(heldInside);
    EXPECT_TRUE(watched.expired());
}

TEST_F(CouplesEdge, walkOfLoneParentsEdgesWithAnEmptyVisitorFailsByNameOnlyWhereThereIsOne) {
    EXPECT_NO_THROW(man.generationEdgeIterator(TreeViewPerson::GenerationEdgeVisitor()));
    man.addGenerationEdge(boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &man));
    EXPECT_EQ(kEmptyFunctionFailure, failureOf<boost::bad_function_call>([&] {
                  man.generationEdgeIterator(TreeViewPerson::GenerationEdgeVisitor());
              }));
}

TEST_F(CouplesEdge, childsEdgeGoesWithItsLastHolder) {
    boost::weak_ptr<TreeViewGenerationEdge> watched;
    {
        TreeViewPerson parent(5);
        GenerationEdge edge = boost::make_shared<TreeViewGenerationEdge>(TreeLine(), &child, &parent);
        parent.addGenerationEdge(edge);
        watched = edge;
        edge.reset();
        EXPECT_FALSE(watched.expired());
    }
    EXPECT_TRUE(watched.expired());
}

}  // namespace
