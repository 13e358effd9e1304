// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines from a person up to its own parents. Most families here are a father at (0, 0), a mother at
// (80, 0) and the person at (40, 110).

#include <gtest/gtest.h>

#include <vector>

#include "HandMadeFamily.h"

namespace {

using views::childEdgesOf;
using views::Course;
using views::courseOf;
using views::kFemale;
using views::kMale;
using views::onlyGenerationEdge;
using views::onlySpouseEdge;
using views::place;
using views::Segments;
using views::segmentsOf;

class FamilyParentLines : public views::HandMadeFamily {
protected:
    FamilyParentLines() { place(focus, 40.0f, 110.0f); }
    void addBothParents() {
        focus.setParents(1, 2);
        place(mother(), 80.0f, 0.0f);
    }
    TreeViewPerson& father() { return focus.getPreferredFather(); }
    TreeViewPerson& mother() { return focus.getPreferredMother(); }
};

TEST_F(FamilyParentLines, ofTwoParentsDropInTheGapRightOfTheFather) {
    addBothParents();
    drawLines();
    EXPECT_EQ((Segments{{67.5f, 40, 67.5f, 95, false}, {55, 40, 80, 40, true}}), segmentsOf(father()));
    EXPECT_EQ((Segments{{67, 95, 67.5f, 95, false}, {67, 110, 67, 95, false}}), segmentsOf(focus));
    EXPECT_EQ(Segments{}, segmentsOf(mother()));
}

TEST_F(FamilyParentLines, ofTwoParentsHangFromTheFathersEdge) {
    addBothParents();
    drawLines();
    TreeViewSpouseEdge& couple = onlySpouseEdge(father());
    EXPECT_EQ((Course{{55, 40}, {67.5f, 40}, {80, 40}}), courseOf(couple.line()));
    EXPECT_EQ(&father(), couple.person);
    EXPECT_EQ(&mother(), couple.spouse);
    ASSERT_EQ(1u, couple.size());
    const TreeViewGenerationEdge& edge = *childEdgesOf(couple).front();
    EXPECT_EQ((Course{{67.5f, 40}, {67.5f, 95}, {67, 95}, {67, 110}}), courseOf(edge.line()));
    EXPECT_EQ(&focus, edge.child);
    EXPECT_EQ(&couple, edge.parentsEdge);
    EXPECT_TRUE(mother().spouseEdges.empty());
    EXPECT_EQ(&couple, mother().unownedSpouseEdges.at(1));
}

TEST_F(FamilyParentLines, ofALoneFatherDropFromHisBottomEdgeInWholePoints) {
    focus.setParentsFatherOnly(1);
    drawLines();
    EXPECT_EQ((Segments{{27.5f, 80, 27.5f, 87, false}}), segmentsOf(father()));
    EXPECT_EQ((Segments{{67, 87, 27.5f, 87, false}, {67, 110, 67, 87, false}}), segmentsOf(focus));
}

TEST_F(FamilyParentLines, ofALoneMotherDropFromHerBottomEdge) {
    focus.setParentsMotherOnly(2);
    place(mother(), 80.0f, 0.0f);
    drawLines();
    EXPECT_EQ((Segments{{107.5f, 80, 107.5f, 87, false}}), segmentsOf(mother()));
    EXPECT_EQ((Segments{{67, 87, 107.5f, 87, false}, {67, 110, 67, 87, false}}), segmentsOf(focus));
}

TEST_F(FamilyParentLines, ofALoneParentHangFromThatParent) {
    focus.setParentsMotherOnly(2);
    drawLines();
    TreeViewGenerationEdge& edge = onlyGenerationEdge(mother());
    EXPECT_EQ((Course{{27.5f, 80}, {27.5f, 87}, {67, 87}, {67, 110}}), courseOf(edge.line()));
    EXPECT_EQ(&mother(), edge.singleParent);
    EXPECT_EQ(&focus, edge.child);
    EXPECT_TRUE(focus.generationEdges.empty());
    EXPECT_TRUE(mother().spouseEdges.empty());
}

// A box at y 0.75: seen from below the drop's two heights are cut as well, unlike seen from above.
TEST_F(FamilyParentLines, cutTheHeightsOfTheDrop) {
    addBothParents();
    place(father(), 0.25f, 0.75f);
    drawLines();
    EXPECT_EQ((Segments{{67.75f, 40, 67.75f, 95, false}, {55.25f, 40, 80, 40, true}}), segmentsOf(father()));
}

TEST_F(FamilyParentLines, cutTheHeightsOfALoneParentsDrop) {
    focus.setParentsFatherOnly(1);
    place(father(), 0.25f, 0.75f);
    drawLines();
    EXPECT_EQ((Segments{{27.75f, 80, 27.75f, 87, false}}), segmentsOf(father()));
}

TEST_F(FamilyParentLines, negativeBarIsCutTowardZero) {
    addBothParents();
    place(father(), 0.0f, -167.5f);  // the bar at -72.5, mid-height at -127.5
    drawLines();
    EXPECT_EQ((Segments{{67.5f, -127, 67.5f, -72, false}, {55, -127, 80, -127, true}}), segmentsOf(father()));
}

TEST_F(FamilyParentLines, marriageLineOfParentsKeepsItsFractionsInX) {
    addBothParents();
    place(father(), -12.5f, -110.0f);
    place(mother(), 67.5f, -110.0f);
    drawLines();
    EXPECT_EQ((views::Segment{42.5f, -70, 67.5f, -70, true}), segmentsOf(father()).back());
}

TEST_F(FamilyParentLines, areTheSameForAnAddNodeFather) {
    addBothParents();
    drawLines();
    const Segments ofARealFather = segmentsOf(father());
    const Course course = courseOf(onlySpouseEdge(father()).line());

    TreeViewPerson other(0);
    place(other, 40.0f, 110.0f);
    other.setParents(1, 2);
    place(other.getPreferredMother(), 80.0f, 0.0f);
    data.addNodes = {1};
    layouter.addLinesToPerson(other);
    EXPECT_EQ(ofARealFather, segmentsOf(other.getPreferredFather()));
    EXPECT_EQ(course, courseOf(onlySpouseEdge(other.getPreferredFather()).line()));
}

TEST_F(FamilyParentLines, askWhetherTheFatherIsAnAddNode) {
    addBothParents();
    std::vector<int> asked;
    adapter.isAddNode = [&asked](int key) {
        asked.push_back(key);
        return false;
    };
    drawLines();
    EXPECT_EQ((std::vector<int>{1}), asked);
}

TEST_F(FamilyParentLines, ofNobodyEndAtOnce) {
    layouter.addLinesToPerson(focus);
    EXPECT_EQ(Segments{}, segmentsOf(focus));
    EXPECT_TRUE(focus.generationEdges.empty());
}

TEST_F(FamilyParentLines, areNotDrawnForAChildThatHangsUnderThePerson) {
    place(focus.addChildWithNoOtherSpouse(5, kMale), 40.0f, 220.0f);
    drawLines();
    EXPECT_EQ(2u, unknownChild(focus).lineSegments.size()) << "bar and stem, once";
}

TEST_F(FamilyParentLines, comeBehindTheLinesToChildrenInAPersonsList) {
    addBothParents();
    place(focus.addSpouse(7, kFemale), 120.0f, 110.0f);
    place(focus.addChildWithNoOtherSpouse(5, kMale), 40.0f, 220.0f);
    drawLines();
    EXPECT_EQ((Segments{{95, 150, 120, 150, true},           // to the wife
                        {67.5f, 190, 67.5f, 197.5f, false},  // to the child
                        {67, 95, 67.5f, 95, false},          // to the parents
                        {67, 110, 67, 95, false}}),
              segmentsOf(focus));
}

// How deep below a box's bottom edge the bar runs, in the four shapes.
TEST_F(FamilyParentLines, barOfACoupleRunsTwiceAsDeepAsThatOfALoneParent) {
    addBothParents();
    drawLines();
    EXPECT_EQ(80.0f + 15.0f, focus.lineSegments.front().y1);
    TreeViewPerson other(9);
    other.setParentsFatherOnly(1);
    layouter.addLinesToPerson(other);
    EXPECT_EQ(80.0f + 7.0f, other.lineSegments.front().y1);
}

}  // namespace
