// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The marriage lines of one person, drawn by the first pass. Boxes are 55 by 80 with their upper-left corner
// at the given place, and neighbours stand 80 apart.

#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <vector>

#include "HandMadeFamily.h"

namespace {

using views::Course;
using views::courseOf;
using views::kFemale;
using views::kMale;
using views::onlySpouseEdge;
using views::place;
using views::Segments;
using views::segmentsOf;

class FamilySpouseLines : public views::HandMadeFamily {
protected:
    void makeFocusAWoman() { focus.setGender(false); }
    // Spouses of keys 1, 2, ... at 80, 160, ... right of a man at 0, or left of a woman.
    void addSpousesInARow(int count) {
        const float side = focus.gender ? 80.0f : -80.0f;
        for (int key = 1; key <= count; ++key) {
            place(focus.addSpouse(key, !focus.gender), side * static_cast<float>(key), 0.0f);
        }
    }
    void drawSpouseLines() { layouter.addSpouseLinesToPerson(focus); }
    std::vector<float> distancesFromMidHeight() {
        std::vector<float> distances;
        for (const TreeLineSegment& line : focus.lineSegments) distances.push_back(line.y1 - 40.0f);
        return distances;
    }
};

struct StackRow {
    int spouseCount;
    std::vector<float> ofAMan;
    std::vector<float> ofAWoman;
};
void PrintTo(const StackRow& row, std::ostream* out) {
    *out << row.spouseCount << " spouses";
}
const std::vector<StackRow> kStacks{
    {1, {0}, {0}},
    {2, {5, -5}, {-5, 5}},
    {3, {10, 0, -10}, {-10, 0, 10}},
    {4, {20, 10, 0, -10}, {-20, -10, 0, 10}},
    {5, {20, 10, 0, -10, -20}, {-20, -10, 0, 10, 20}},
};

class FamilySpouseLineStack : public FamilySpouseLines, public testing::WithParamInterface<StackRow> {};

TEST_P(FamilySpouseLineStack, ofAManStepsUpward) {
    addSpousesInARow(GetParam().spouseCount);
    drawSpouseLines();
    EXPECT_EQ(GetParam().ofAMan, distancesFromMidHeight());
}

TEST_P(FamilySpouseLineStack, ofAWomanStepsDownward) {
    makeFocusAWoman();
    addSpousesInARow(GetParam().spouseCount);
    drawSpouseLines();
    EXPECT_EQ(GetParam().ofAWoman, distancesFromMidHeight());
}

INSTANTIATE_TEST_SUITE_P(ForOneToFiveSpouses, FamilySpouseLineStack, testing::ValuesIn(kStacks),
                         [](const auto& row) { return std::to_string(row.param.spouseCount); });

TEST_F(FamilySpouseLines, runFromAMansRightEdgeToHisWifesLeftEdge) {
    addSpousesInARow(1);
    drawSpouseLines();
    EXPECT_EQ((Segments{{55, 40, 80, 40, true}}), segmentsOf(focus));
    EXPECT_EQ(Segments{}, segmentsOf(focus.spouses[0]));
}

TEST_F(FamilySpouseLines, runFromAWomansLeftEdgeToHerHusbandsRightEdge) {
    makeFocusAWoman();
    addSpousesInARow(1);
    drawSpouseLines();
    EXPECT_EQ((Segments{{0, 40, -25, 40, true}}), segmentsOf(focus));
}

TEST_F(FamilySpouseLines, edgeOfAManPassesThroughTheGapBesideHisWife) {
    addSpousesInARow(1);
    drawSpouseLines();
    TreeViewSpouseEdge& edge = onlySpouseEdge(focus);
    EXPECT_EQ((Course{{55, 40}, {67.5f, 40}, {80, 40}}), courseOf(edge.line()));
    EXPECT_EQ(&focus, edge.person);
    EXPECT_EQ(&focus.spouses[0], edge.spouse);
}

TEST_F(FamilySpouseLines, edgeOfAWomanNamesTheManFirstAndIsHersAllTheSame) {
    makeFocusAWoman();
    addSpousesInARow(1);
    drawSpouseLines();
    TreeViewSpouseEdge& edge = onlySpouseEdge(focus);
    EXPECT_EQ((Course{{0, 40}, {-12.5f, 40}, {-25, 40}}), courseOf(edge.line()));
    EXPECT_EQ(&focus.spouses[0], edge.person);
    EXPECT_EQ(&focus, edge.spouse);
}

TEST_F(FamilySpouseLines, canBeFoundAgainByTheSpouse) {
    addSpousesInARow(2);
    drawSpouseLines();
    EXPECT_EQ(45.0f, focus.getSpouseLine(1).y1);
    EXPECT_EQ(35.0f, focus.getSpouseLine(2).y1);
    EXPECT_EQ(55.0f, focus.getSpouseLine(2).x1);
    EXPECT_EQ(160.0f, focus.getSpouseLine(2).x2);
    EXPECT_TRUE(focus.getSpouseLine(2).isSpouseLine);
}

TEST_F(FamilySpouseLines, allStartAtOneEdgeAndPassBehindTheNearerSpouse) {
    addSpousesInARow(2);
    drawSpouseLines();
    EXPECT_EQ((Segments{{55, 45, 80, 45, true}, {55, 35, 160, 35, true}}), segmentsOf(focus));
}

TEST_F(FamilySpouseLines, endsAreCutTowardZeroAndTheDropPointIsNot) {
    place(focus, -132.5f, -110.0f);
    place(focus.addSpouse(1, kFemale), -52.5f, -110.0f);
    drawSpouseLines();
    EXPECT_EQ((Segments{{-77, -70, -52, -70, true}}), segmentsOf(focus));
    EXPECT_EQ((Course{{-77, -70}, {-65, -70}, {-52, -70}}), courseOf(onlySpouseEdge(focus).line()));
}

TEST_F(FamilySpouseLines, dropPointKeepsItsFraction) {
    place(focus.addSpouse(1, kFemale), 80.25f, 0.0f);
    drawSpouseLines();
    EXPECT_EQ((Course{{55, 40}, {67.75f, 40}, {80, 40}}), courseOf(onlySpouseEdge(focus).line()));
}

TEST_F(FamilySpouseLines, heightIsCutAfterTheOffsetIsAdded) {
    layouter.treeSize.nodeHeight = 81.0f;
    addSpousesInARow(2);
    drawSpouseLines();
    EXPECT_EQ(45.0f, focus.getSpouseLine(1).y1);
    EXPECT_EQ(35.0f, focus.getSpouseLine(2).y1);
}

TEST_F(FamilySpouseLines, offsetIsCutAtEveryStep) {
    layouter.treeSize.spouseLineStep = 7.5f;
    addSpousesInARow(3);
    drawSpouseLines();
    EXPECT_EQ((std::vector<float>{7, 0, -7}), distancesFromMidHeight());  // 7.5, 7 - 7.5, 0 - 7.5
}

TEST_F(FamilySpouseLines, childlessSpouseGetsALineAndAnEdgeButNoDrop) {
    addSpousesInARow(1);
    drawLines();
    EXPECT_EQ(1u, focus.lineSegments.size());
    EXPECT_EQ(1u, focus.spouseEdges.size());
    EXPECT_EQ(0u, onlySpouseEdge(focus).size());
    EXPECT_EQ(Segments{}, segmentsOf(focus.spouses[0]));
}

TEST_F(FamilySpouseLines, ofAPersonWithoutSpousesAreNone) {
    focus.addNonDisplayedSpouse(1);
    drawSpouseLines();
    EXPECT_EQ(Segments{}, segmentsOf(focus));
    EXPECT_TRUE(focus.spouseEdges.empty());
}

}  // namespace
