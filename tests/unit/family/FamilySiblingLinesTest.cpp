// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines from a person's parents to its siblings, and the edge of the parents that they hang from. The
// father (key 1) stands at (0, 0), the mother (key 2) at (80, 0), the person at (40, 110) and its sibling
// (key 3) at (120, 110).

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

#include "HandMadeFamily.h"

namespace {

using views::childEdgesOf;
using views::Course;
using views::courseOf;
using views::kMale;
using views::onlyGenerationEdge;
using views::onlySpouseEdge;
using views::place;
using views::Segments;
using views::segmentsOf;

class FamilySiblingLines : public views::HandMadeFamily {
protected:
    FamilySiblingLines() { place(focus, 40.0f, 110.0f); }
    void addBothParents() {
        focus.setParents(1, 2);
        place(mother(), 80.0f, 0.0f);
    }
    void addSibling(int key = 3) { place(focus.addSibling(key, kMale), 120.0f, 110.0f); }
    void addHalfSibling(int parent) { place(focus.addHalfSibling(3, parent, kMale), 120.0f, 110.0f); }
    TreeViewPerson& father() { return focus.getPreferredFather(); }
    TreeViewPerson& mother() { return focus.getPreferredMother(); }
    TreeViewPerson& sibling() { return focus.siblings.back(); }
    // The points of the parents' edge that a sibling of the focus leaves on the mother.
    Course parentsCourse() {
        addSibling();
        layouter.addLinesToPerson(focus);
        return courseOf(onlySpouseEdge(mother()).line());
    }
};

const Course kFromFather{{55, 40}, {67.5f, 40}, {80, 40}};
const Course kFromMother{{80, 40}, {67.5f, 40}, {55, 40}};

TEST_F(FamilySiblingLines, ofAFullSiblingDropInTheGapRightOfTheFather) {
    addBothParents();
    addSibling();
    drawLines();
    EXPECT_EQ((Segments{{147, 95, 67.5f, 95, false}, {147, 110, 147, 95, false}}), segmentsOf(sibling()));
    EXPECT_EQ((Segments{{67.5f, 40, 67.5f, 95, false},  // for the sibling
                        {67.5f, 40, 67.5f, 95, false},  // for the person
                        {55, 40, 80, 40, true}}),
              segmentsOf(father()));
}

TEST_F(FamilySiblingLines, repeatTheDropForEachSibling) {
    addBothParents();
    for (const int key : {3, 4, 0, 5}) addSibling(key);
    drawLines();
    EXPECT_EQ(3u + 1u + 1u, father().lineSegments.size()) << "siblings, the person, the marriage line";
    std::vector<int> order;
    for (const TreeViewGenerationEdge* edge : childEdgesOf(onlySpouseEdge(mother()))) {
        order.push_back(edge->child->personId);
    }
    EXPECT_EQ((std::vector<int>{3, 4, 5, 0}), order) << "in list order, the person last";
}

TEST_F(FamilySiblingLines, skipThePersonsOwnEntry) {
    addBothParents();
    addSibling(0);
    drawLines();
    EXPECT_EQ(Segments{}, segmentsOf(sibling()));
    EXPECT_EQ(2u, father().lineSegments.size());
    EXPECT_TRUE(mother().spouseEdges.empty());
}

TEST_F(FamilySiblingLines, ofAHalfSiblingThroughTheFatherDropFromHisBottomEdge) {
    addBothParents();
    addHalfSibling(1);
    drawLines();
    EXPECT_EQ((views::Segment{27.5f, 80, 27.5f, 87, false}), segmentsOf(father()).front());
    EXPECT_EQ((Segments{{147, 87, 27.5f, 87, false}, {147, 110, 147, 87, false}}), segmentsOf(sibling()));
}

TEST_F(FamilySiblingLines, ofAHalfSiblingThroughTheMotherDropFromHerBottomEdge) {
    addBothParents();
    addHalfSibling(2);
    drawLines();
    EXPECT_EQ((Segments{{107.5f, 80, 107.5f, 87, false}}), segmentsOf(mother()));
    EXPECT_EQ((Segments{{147, 87, 107.5f, 87, false}, {147, 110, 147, 87, false}}), segmentsOf(sibling()));
}

TEST_F(FamilySiblingLines, ofAHalfSiblingHangFromTheCoupleAllTheSame) {
    addBothParents();
    addHalfSibling(1);
    drawLines();
    TreeViewSpouseEdge& couple = onlySpouseEdge(mother());
    const TreeViewGenerationEdge& edge = *childEdgesOf(couple).front();
    EXPECT_EQ(&sibling(), edge.child);
    EXPECT_EQ(&couple, edge.parentsEdge);
    EXPECT_EQ((Course{{27.5f, 80}, {27.5f, 87}, {147, 87}, {147, 110}}), courseOf(edge.line()));
    EXPECT_TRUE(father().generationEdges.empty());
    EXPECT_TRUE(focus.generationEdges.empty());
}

TEST_F(FamilySiblingLines, ofALoneMotherLeaveTheirEdgeOnThePerson) {
    focus.setParentsMotherOnly(2);
    addHalfSibling(2);
    drawLines();
    TreeViewGenerationEdge& edge = onlyGenerationEdge(focus);
    EXPECT_EQ(&sibling(), edge.child);
    EXPECT_EQ(&mother(), edge.singleParent);
    EXPECT_EQ(&focus, onlyGenerationEdge(mother()).child) << "the person's own edge is on the parent";
}

TEST_F(FamilySiblingLines, ofALoneFatherLeaveTheirEdgeOnThePerson) {
    focus.setParentsFatherOnly(1);
    addHalfSibling(1);
    drawLines();
    EXPECT_EQ(&sibling(), onlyGenerationEdge(focus).child);
    EXPECT_EQ(&father(), onlyGenerationEdge(focus).singleParent);
    EXPECT_EQ(&focus, onlyGenerationEdge(father()).child);
}

TEST_F(FamilySiblingLines, throughAParentWhoIsNotThereFail) {
    focus.setParentsFatherOnly(1);
    addHalfSibling(9);
    EXPECT_THROW(layouter.addLinesToPerson(focus), std::out_of_range);
}

TEST_F(FamilySiblingLines, ofAFullSiblingNeedAFather) {
    focus.setParentsMotherOnly(2);
    addSibling();
    EXPECT_THROW(layouter.addLinesToPerson(focus), std::out_of_range);
}

TEST_F(FamilySiblingLines, needToAskForAddNodes) {
    addBothParents();
    addSibling();
    adapter.isAddNode.clear();
    EXPECT_THROW(layouter.addLinesToPerson(focus), boost::bad_function_call);
}

TEST_F(FamilySiblingLines, cutTheHeightsOfTheDropAndTheStem) {
    addBothParents();
    place(father(), 0.25f, 0.75f);
    place(focus.addSibling(3, kMale), -120.0f, 110.0f);
    layouter.addLinesToPerson(focus);
    EXPECT_EQ((views::Segment{67.75f, 40, 67.75f, 95, false}), segmentsOf(father()).front());
    EXPECT_EQ((Segments{{-92, 95, 67.75f, 95, false}, {-92, 110, -92, 95, false}}), segmentsOf(sibling()));
}

TEST_F(FamilySiblingLines, makeTheParentsEdgeTheMothersAndTheFirstOneStays) {
    addBothParents();
    addSibling();
    drawLines();
    TreeViewSpouseEdge& couple = onlySpouseEdge(mother());
    EXPECT_TRUE(father().spouseEdges.empty());
    EXPECT_EQ(&father(), couple.person);
    EXPECT_EQ(&mother(), couple.spouse);
    EXPECT_EQ(kFromMother, courseOf(couple.line())) << "the person's own parent line would run the other way";
    ASSERT_EQ(2u, couple.size());
    EXPECT_EQ(&sibling(), childEdgesOf(couple)[0]->child);
    EXPECT_EQ(&focus, childEdgesOf(couple)[1]->child);
}

TEST_F(FamilySiblingLines, parentsEdgeRunsFromTheFatherWhenTheMotherStandsTooNear) {
    addBothParents();
    place(mother(), 40.0f, 0.0f);
    EXPECT_EQ((Course{{55, 40}, {27.5f, 40}, {40, 40}}), parentsCourse());
    EXPECT_FALSE(data.wasAsked("getSpouses 1"));
}

TEST_F(FamilySiblingLines, parentsEdgeRunsFromTheFatherWhenTheBoxesTouch) {
    addBothParents();
    place(mother(), 55.0f, 0.0f);
    EXPECT_EQ((Course{{55, 40}, {42.5f, 40}, {55, 40}}), parentsCourse());
    EXPECT_FALSE(data.wasAsked("getSpouses 1"));
}

TEST_F(FamilySiblingLines, parentsEdgeRunsFromTheMotherWhenTheFatherHasNoSpouses) {
    addBothParents();
    EXPECT_EQ(kFromMother, parentsCourse());
    EXPECT_TRUE(data.wasAsked("getSpouses 1"));
}

TEST_F(FamilySiblingLines, parentsEdgeRunsFromTheMotherWhenSheIsHisFirstSpouse) {
    addBothParents();
    data.spouses[1] = {2, 9};
    EXPECT_EQ(kFromMother, parentsCourse());
}

TEST_F(FamilySiblingLines, parentsEdgeRunsFromTheFatherWhenSheIsNotHisFirstSpouse) {
    addBothParents();
    data.spouses[1] = {9, 2};
    EXPECT_EQ(kFromFather, parentsCourse());
}

TEST_F(FamilySiblingLines, parentsEdgeRunsFromAnAddNodeMotherOfAMarriedFather) {
    addBothParents();
    data.spouses[1] = {9};
    data.addNodes = {2};
    EXPECT_EQ(kFromMother, parentsCourse());
}

TEST_F(FamilySiblingLines, parentsEdgeHasNoPointsWhenTheSecondAnswerAboutTheMotherDiffers) {
    addBothParents();
    data.spouses[1] = {9};
    int asked = 0;
    adapter.isAddNode = [&asked](int key) { return key < 0 || (key == 2 && ++asked == 1); };
    EXPECT_EQ(Course{}, parentsCourse());
    EXPECT_EQ(2, asked);
}

TEST_F(FamilySiblingLines, parentsEdgeBendsRightOfTheMotherWhenTheFatherIsNoMan) {
    addBothParents();
    father().setGender(false);
    addSibling();
    layouter.addLinesToPerson(focus);
    // Two women: the one asked, the mother, is the second of the pair.
    EXPECT_EQ((Course{{80, 40}, {147.5f, 40}, {55, 40}}), courseOf(onlySpouseEdge(mother()).line()));
}

TEST_F(FamilySiblingLines, parentsEdgeKeepsFractionsInXAndCutsItsHeight) {
    addBothParents();
    place(father(), 0.25f, 0.75f);
    EXPECT_EQ((Course{{80, 40}, {67.5f, 40}, {55.25f, 40}}), parentsCourse());
}

TEST_F(FamilySiblingLines, hostSpousesOfTheFatherAreLoadedOnce) {
    addBothParents();
    addSibling(3);
    addSibling(4);
    layouter.addLinesToPerson(focus);
    EXPECT_EQ((std::vector<std::string>{"getSpouses 1"}), data.questions);
}

TEST_F(FamilySiblingLines, comeBetweenTheLinesToChildrenAndToParents) {
    focus.setParentsFatherOnly(1);
    addHalfSibling(1);
    place(focus.addChildWithNoOtherSpouse(5, kMale), 40.0f, 220.0f);
    layouter.addLinesToPerson(focus);
    ASSERT_EQ(2u, focus.generationEdges.size());
    EXPECT_EQ(5, focus.generationEdges[0]->child->personId);
    EXPECT_EQ(3, focus.generationEdges[1]->child->personId);
}

}  // namespace
