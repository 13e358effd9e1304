// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines down to a person's children: drop, bar and stem, each on the list of the person who holds it.
// Most families here are a man at (0, 0) beside a wife at (80, 0), with the child at (40, 110).

#include <gtest/gtest.h>

#include <stdexcept>
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

class FamilyChildLines : public views::HandMadeFamily {
protected:
    void addWife(int key, float x) { place(focus.addSpouse(key, kFemale), x, 0.0f); }
    void addChild(int key, int wife, float x) {
        place(focus.addChildWithSpouse(key, wife, kMale), x, 110.0f);
    }
    void addUnknownChild(TreeViewPerson& parent, int key, float x) {
        place(parent.addChildWithNoOtherSpouse(key, kMale), x, 110.0f);
    }
    TreeViewPerson& wife(std::size_t index = 0) { return focus.spouses.at(index); }
};

TEST_F(FamilyChildLines, personWithoutRelativesDrawsNothing) {
    drawLines();
    EXPECT_EQ(Segments{}, segmentsOf(focus));
    EXPECT_TRUE(focus.spouseEdges.empty());
    EXPECT_TRUE(focus.generationEdges.empty());
}

TEST_F(FamilyChildLines, ofACoupleDropFromTheMarriageLineBesideTheWife) {
    addWife(1, 80.0f);
    addChild(5, 1, 40.0f);
    drawLines();
    EXPECT_EQ((Segments{{55, 40, 80, 40, true}}), segmentsOf(focus));
    EXPECT_EQ((Segments{{67.5f, 40, 67.5f, 95, false}}), segmentsOf(wife()));
    EXPECT_EQ((Segments{{67, 95, 67.5f, 95, false}, {67, 110, 67, 95, false}}),
              segmentsOf(childUnder(focus, 1)));
}

TEST_F(FamilyChildLines, ofACoupleHangFromTheCouplesEdge) {
    addWife(1, 80.0f);
    addChild(5, 1, 40.0f);
    drawLines();
    TreeViewSpouseEdge& couple = onlySpouseEdge(focus);
    ASSERT_EQ(1u, couple.size());
    const TreeViewGenerationEdge& edge = *childEdgesOf(couple).front();
    EXPECT_EQ((Course{{67.5f, 40}, {67.5f, 95}, {67, 95}, {67, 110}}), courseOf(edge.line()));
    EXPECT_EQ(&childUnder(focus, 1), edge.child);
    EXPECT_EQ(&couple, edge.parentsEdge);
    EXPECT_TRUE(edge.hasMultipleParents());
    EXPECT_TRUE(focus.generationEdges.empty());
    EXPECT_EQ((Course{{55, 40}, {67.5f, 40}, {80, 40}}), courseOf(couple.line())) << "keeps its own course";
}

TEST_F(FamilyChildLines, ofAWomanDropBesideTheHusbandOnHisList) {
    focus.setGender(false);
    place(focus, 80.0f, 0.0f);
    place(focus.addSpouse(1, kMale), 0.0f, 0.0f);
    addChild(5, 1, 40.0f);
    drawLines();
    EXPECT_EQ((Segments{{67.5f, 40, 67.5f, 95, false}}), segmentsOf(focus.spouses[0]));
    EXPECT_EQ((Segments{{67, 95, 67.5f, 95, false}, {67, 110, 67, 95, false}}),
              segmentsOf(childUnder(focus, 1)));
}

TEST_F(FamilyChildLines, ofALoneParentDropFromTheMiddleOfItsBottomEdge) {
    addUnknownChild(focus, 5, 0.0f);
    drawLines();
    EXPECT_EQ((Segments{{27.5f, 80, 27.5f, 87.5f, false}}), segmentsOf(focus));
    EXPECT_EQ((Segments{{27, 87.5f, 27.5f, 87.5f, false}, {27, 110, 27, 87.5f, false}}),
              segmentsOf(unknownChild(focus)));
}

TEST_F(FamilyChildLines, ofALoneParentHangFromThatParentsOwnEdge) {
    addUnknownChild(focus, 5, 0.0f);
    drawLines();
    TreeViewGenerationEdge& edge = onlyGenerationEdge(focus);
    EXPECT_EQ((Course{{27.5f, 80}, {27.5f, 87.5f}, {27, 87.5f}, {27, 110}}), courseOf(edge.line()));
    EXPECT_TRUE(edge.hasSingleParent());
    EXPECT_EQ(&focus, edge.singleParent);
    EXPECT_EQ(&unknownChild(focus), edge.child);
    EXPECT_TRUE(focus.spouseEdges.empty());
}

TEST_F(FamilyChildLines, ofTwoWivesHangFromTheirOwnStackedLines) {
    addWife(1, 80.0f);
    addWife(2, 240.0f);
    addChild(5, 1, 40.0f);
    addChild(6, 2, 240.0f);
    drawLines();
    EXPECT_EQ((Segments{{67.5f, 45, 67.5f, 95, false}}), segmentsOf(wife(0)));
    EXPECT_EQ((Segments{{227.5f, 35, 227.5f, 95, false}}), segmentsOf(wife(1)));
    EXPECT_EQ(1u, focus.spouseEdges.at(1)->size());
    EXPECT_EQ(1u, focus.spouseEdges.at(2)->size());
}

TEST_F(FamilyChildLines, ofThreeChildrenRepeatTheDropThreeTimes) {
    addWife(1, 80.0f);
    for (const int key : {5, 6, 7}) addChild(key, 1, static_cast<float>(key * 80 - 400));
    drawLines();
    const views::Segment drop{67.5f, 40, 67.5f, 95, false};
    EXPECT_EQ((Segments{drop, drop, drop}), segmentsOf(wife()));
    std::vector<int> order;
    for (const TreeViewGenerationEdge* edge : childEdgesOf(onlySpouseEdge(focus))) {
        order.push_back(edge->child->personId);
    }
    EXPECT_EQ((std::vector<int>{5, 6, 7}), order);
}

TEST_F(FamilyChildLines, barOfALoneParentRunsAboveTheBarsOfItsCouples) {
    addWife(1, 80.0f);
    addChild(5, 1, 80.0f);
    addUnknownChild(focus, 6, 0.0f);
    drawLines();
    EXPECT_EQ(95.0f, childUnder(focus, 1).lineSegments.front().y1);
    EXPECT_EQ(87.5f, unknownChild(focus).lineSegments.front().y1);
}

TEST_F(FamilyChildLines, ofAStepChildHangFromTheSpouseAlone) {
    addWife(1, 80.0f);
    addUnknownChild(wife(), 5, 80.0f);
    drawLines();
    EXPECT_EQ((Segments{{107.5f, 80, 107.5f, 87.5f, false}}), segmentsOf(wife()));
    EXPECT_EQ(&wife(), onlyGenerationEdge(wife()).singleParent);
    EXPECT_EQ(0u, onlySpouseEdge(focus).size());
}

TEST_F(FamilyChildLines, stemRightBelowTheDropLeavesABusOfNoLength) {
    place(focus, 0.5f, 0.0f);
    addWife(1, 80.5f);
    addChild(5, 1, 40.5f);
    drawLines();
    EXPECT_EQ((Segments{{68, 95, 68, 95, false}, {68, 110, 68, 95, false}}),
              segmentsOf(childUnder(focus, 1)));
    EXPECT_EQ((Course{{68, 40}, {68, 95}, {68, 95}, {68, 110}}),
              courseOf(childEdgesOf(onlySpouseEdge(focus)).front()->line()));
}

// From above only the stem is cut to whole points: a box at y 0.75 keeps its fraction in the drop and the
// bar.
TEST_F(FamilyChildLines, cutOnlyTheStemsX) {
    place(focus, 0.0f, 0.75f);
    place(focus.addSpouse(1, kFemale), 80.25f, 0.75f);
    addChild(5, 1, 40.75f);
    addUnknownChild(focus, 6, 0.75f);
    drawLines();
    EXPECT_EQ((Segments{{67.75f, 40, 67.75f, 95.75f, false}}), segmentsOf(wife()));
    EXPECT_EQ((Segments{{68, 95.75f, 67.75f, 95.75f, false}, {68, 110, 68, 95.75f, false}}),
              segmentsOf(childUnder(focus, 1)));
    EXPECT_EQ((views::Segment{27.5f, 80.75f, 27.5f, 88.25f, false}), segmentsOf(focus).back());
}

TEST_F(FamilyChildLines, stemLeftOfZeroIsCutTowardZero) {
    addUnknownChild(focus, 5, -107.0f);
    drawLines();
    EXPECT_EQ(-79.0f, unknownChild(focus).lineSegments.front().x1);  // -79.5
}

TEST_F(FamilyChildLines, comeBehindTheMarriageLinesInAPersonsList) {
    addWife(1, 80.0f);
    addWife(2, 240.0f);
    addUnknownChild(focus, 6, 0.0f);
    drawLines();
    EXPECT_EQ((Segments{{55, 45, 80, 45, true}, {55, 35, 240, 35, true}, {27.5f, 80, 27.5f, 87.5f, false}}),
              segmentsOf(focus));
}

TEST_F(FamilyChildLines, ofACoupleNeedTheMarriageLineFirst) {
    addWife(1, 80.0f);
    addChild(5, 1, 40.0f);
    EXPECT_THROW(layouter.addLinesToPerson(focus), std::out_of_range);
}

TEST_F(FamilyChildLines, barHeightsFollowTheSizesGiven) {
    layouter.treeSize.vertPadding = 31.0f;
    addWife(1, 80.0f);
    addChild(5, 1, 40.0f);
    addUnknownChild(focus, 6, 0.0f);
    drawLines();
    EXPECT_EQ(95.5f, childUnder(focus, 1).lineSegments.front().y1);
    EXPECT_EQ(87.75f, unknownChild(focus).lineSegments.front().y1);
}

}  // namespace
