// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines of the pedigree view. The focus stands at (27.5, 0), so its box reaches from x 27.5 to 82.5 and
// down to y 80.

#include <gtest/gtest.h>

#include <utility>
#include <vector>

#include "HandMadePedigree.h"

namespace {

using views::childEdgesOf;
using views::Course;
using views::courseOf;
using views::kFemale;
using views::kMale;
using views::onlyGenerationEdge;
using views::onlySpouseEdge;
using views::place;
using views::Segment;
using views::Segments;
using views::segmentsOf;

class PedigreeLines : public views::HandMadePedigree {
protected:
    void addWife(int key, float y) { place(focus.addSpouse(key, kFemale), 27.5f, y); }
    void addChild(int key, int wife, float y) {
        place(focus.addChildWithSpouse(key, wife, kMale), -52.5f, y);
    }
    void addUnknownChild(int key, float y) { place(focus.addChildWithNoOtherSpouse(key, kMale), -52.5f, y); }
    void addBothParents(float fatherY, float motherY) {
        focus.setParents(1, 2);
        place(father(), 107.5f, fatherY);
        place(mother(), 107.5f, motherY);
    }
    void drawFamilyLines() { layouter.addSpouseAndChildrenLinesForFocusPerson(focus); }
    void drawParentLines() { layouter.addParentLinesForPerson(focus); }
    std::vector<float> marriageLineXs() {
        std::vector<float> xs;
        for (const TreeLineSegment& line : focus.lineSegments) {
            if (line.isSpouseLine) xs.push_back(line.x1);
        }
        return xs;
    }
};

// --- To spouses.

TEST_F(PedigreeLines, ofALoneFocusAreNone) {
    drawFamilyLines();
    drawParentLines();
    EXPECT_EQ(Segments{}, segmentsOf(focus));
    EXPECT_TRUE(focus.spouseEdges.empty());
    EXPECT_TRUE(focus.generationEdges.empty());
}

TEST_F(PedigreeLines, withoutSpousesNoMarriageLineIsDrawn) {
    addUnknownChild(5, -80.0f);
    drawFamilyLines();
    EXPECT_TRUE(marriageLineXs().empty());
    EXPECT_TRUE(focus.spouseLines.empty());
}

TEST_F(PedigreeLines, marriageLineRunsDownFromTheLeftOfTheFocus) {
    addWife(1, 110.0f);
    drawFamilyLines();
    EXPECT_EQ((Segments{{27, 80, 27, 110, true}}), segmentsOf(focus));
    TreeViewSpouseEdge& edge = onlySpouseEdge(focus);
    EXPECT_EQ((Course{{27, 80}, {27, 95}, {27, 110}}), courseOf(edge.line()));
    EXPECT_EQ(&focus, edge.person);
    EXPECT_EQ(&spouse(), edge.spouse);
    EXPECT_EQ(27.0f, focus.getSpouseLine(1).x1);
    EXPECT_EQ(110.0f, focus.getSpouseLine(1).y2);
}

struct StepRow {
    int spouseCount;
    float step;
};

TEST_F(PedigreeLines, marriageLinesStepRightAsFarAsTheBoxAllows) {
    const std::vector<StepRow> rows{{2, 10}, {3, 10}, {4, 10}, {5, 10}, {6, 9}, {7, 7}, {11, 5}, {56, 0}};
    for (const StepRow& row : rows) {
        TreeViewPerson person(0);
        person.setGender(true);
        for (int key = 1; key <= row.spouseCount; ++key) person.addSpouse(key, kFemale);
        layouter.addSpouseAndChildrenLinesForFocusPerson(person);
        for (int key = 1; key <= row.spouseCount; ++key) {
            EXPECT_EQ(row.step * static_cast<float>(key - 1), person.getSpouseLine(key).x1)
                << row.spouseCount << " spouses, line " << key;
        }
    }
}

TEST_F(PedigreeLines, marriageLinesStartAtTheInset) {
    layouter.treeSize.lineInset = 5.75f;
    place(focus, 0.0f, 0.0f);
    for (int key = 1; key <= 6; ++key) addWife(key, 110.0f);
    drawFamilyLines();
    EXPECT_EQ((std::vector<float>{5, 13, 21, 29, 37, 45}), marriageLineXs());  // (55 - 5.75) / 6 is 8.2
}

TEST_F(PedigreeLines, marriageLineIsCutTowardZeroButForItsMiddle) {
    layouter.treeSize.vertPadding = 31.0f;
    place(focus, -0.5f, -100.5f);
    place(focus.addSpouse(1, kFemale), -0.5f, 10.75f);
    drawFamilyLines();
    EXPECT_EQ((Segments{{0, -20, 0, 10, true}}), segmentsOf(focus));
    EXPECT_EQ((Course{{0, -20}, {0, -5.5f}, {0, 10}}), courseOf(onlySpouseEdge(focus).line()));
}

// --- To children.

TEST_F(PedigreeLines, childOfACoupleHangsFromTheMarriageLineAboveTheSpouse) {
    addWife(1, 110.0f);
    addChild(5, 1, 0.0f);
    drawFamilyLines();
    EXPECT_EQ((Segments{{27, 95, 15, 95, false}}), segmentsOf(spouse()));
    EXPECT_EQ((Segments{{15, 40, 15, 95, false}, {2.5f, 40, 15, 40, false}}), segmentsOf(childUnder(1)));
}

TEST_F(PedigreeLines, childOfACoupleHasItsEdgeOnTheCouple) {
    addWife(1, 110.0f);
    addChild(5, 1, 0.0f);
    drawFamilyLines();
    TreeViewSpouseEdge& couple = onlySpouseEdge(focus);
    ASSERT_EQ(1u, couple.size());
    const TreeViewGenerationEdge& edge = *childEdgesOf(couple).front();
    EXPECT_EQ((Course{{27, 95}, {15, 95}, {15, 40}, {2.5f, 40}}), courseOf(edge.line()));
    EXPECT_EQ(&childUnder(1), edge.child);
    EXPECT_EQ(&couple, edge.parentsEdge);
    EXPECT_TRUE(spouse().spouseEdges.empty());
    EXPECT_TRUE(focus.generationEdges.empty());
}

TEST_F(PedigreeLines, childOfALoneParentHangsFromAStubAtItsLeft) {
    addUnknownChild(5, -80.0f);
    drawFamilyLines();
    EXPECT_EQ((Segments{{27.5f, 40, 21.25f, 40, false}}), segmentsOf(focus));
    EXPECT_EQ((Segments{{21.25f, -40, 21.25f, 40, false}, {2.5f, -40, 21.25f, -40, false}}),
              segmentsOf(unknownChild()));
}

TEST_F(PedigreeLines, childOfALoneParentHasItsEdgeOnThatParent) {
    addUnknownChild(5, -80.0f);
    drawFamilyLines();
    TreeViewGenerationEdge& edge = onlyGenerationEdge(focus);
    EXPECT_EQ((Course{{27.5f, 40}, {21.25f, 40}, {21.25f, -40}, {2.5f, -40}}), courseOf(edge.line()));
    EXPECT_EQ(&focus, edge.singleParent);
    EXPECT_EQ(&unknownChild(), edge.child);
}

TEST_F(PedigreeLines, childrenOfOneCoupleShareTheJunctionAndRepeatTheRun) {
    addWife(1, 110.0f);
    for (const int key : {5, 6, 7}) addChild(key, 1, static_cast<float>(key * 110 - 605));
    drawFamilyLines();
    const Segment run{27, 95, 15, 95, false};
    EXPECT_EQ((Segments{run, run, run}), segmentsOf(spouse()));
    EXPECT_EQ(3u, onlySpouseEdge(focus).size());
}

TEST_F(PedigreeLines, childrenOfTheSecondSpouseHangFromTheSecondLine) {
    addWife(1, 110.0f);
    addWife(2, 220.0f);
    addChild(5, 2, 165.0f);
    drawFamilyLines();
    EXPECT_EQ((Segments{{37, 205, 15, 205, false}}), segmentsOf(spouse(1)));
    EXPECT_EQ(Segments{}, segmentsOf(spouse(0)));
}

TEST_F(PedigreeLines, childLevelWithTheJunctionGetsALineOfNoLength) {
    addWife(1, 110.0f);
    addChild(5, 1, 55.0f);
    drawFamilyLines();
    EXPECT_EQ((Segments{{15, 95, 15, 95, false}, {2.5f, 95, 15, 95, false}}), segmentsOf(childUnder(1)));
    EXPECT_EQ((Course{{27, 95}, {15, 95}, {15, 95}, {2.5f, 95}}),
              courseOf(childEdgesOf(onlySpouseEdge(focus)).front()->line()));
}

TEST_F(PedigreeLines, onlyTheChildsMidHeightIsCut) {
    place(focus, 27.5f, 0.75f);
    addUnknownChild(5, -80.75f);
    drawFamilyLines();
    EXPECT_EQ((Segments{{27.5f, 40.75f, 21.25f, 40.75f, false}}), segmentsOf(focus));
    EXPECT_EQ((Segments{{21.25f, -40, 21.25f, 40.75f, false}, {2.5f, -40, 21.25f, -40, false}}),
              segmentsOf(unknownChild()));
}

TEST_F(PedigreeLines, marriageLinesComeBeforeTheStubs) {
    addWife(1, 110.0f);
    addUnknownChild(5, -80.0f);
    drawFamilyLines();
    EXPECT_EQ((Segments{{27, 80, 27, 110, true}, {27.5f, 40, 21.25f, 40, false}}), segmentsOf(focus));
}

// --- To two parents.

TEST_F(PedigreeLines, ofTwoParentsMeetTheirMarriageLineAtItsMiddle) {
    addBothParents(-100.0f, 10.0f);
    drawParentLines();
    EXPECT_EQ((Segments{{107, -20, 107, 10, true}}), segmentsOf(father()));
    EXPECT_EQ((Segments{{107, -5, 95, -5, false}, {95, -5, 95, 40, false}, {95, 40, 82, 40, false}}),
              segmentsOf(focus));
    EXPECT_EQ(Segments{}, segmentsOf(mother()));
}

TEST_F(PedigreeLines, ofTwoParentsHangFromTheFathersEdge) {
    addBothParents(-100.0f, 10.0f);
    drawParentLines();
    TreeViewSpouseEdge& couple = onlySpouseEdge(father());
    EXPECT_EQ((Course{{107, -20}, {107, -5}, {107, 10}}), courseOf(couple.line()));
    EXPECT_EQ(&father(), couple.person);
    EXPECT_EQ(&mother(), couple.spouse);
    ASSERT_EQ(1u, couple.size());
    EXPECT_EQ(&focus, childEdgesOf(couple).front()->child);
    EXPECT_EQ((Course{{107, -5}, {95, -5}, {95, 40}, {82, 40}}),
              courseOf(childEdgesOf(couple).front()->line()));
    EXPECT_TRUE(mother().spouseEdges.empty());
}

// The entry for looking the line up stands under its x and not under the mother, with its numbers shifted.
TEST_F(PedigreeLines, parentsLineIsKeptUnderItsXWithShiftedNumbers) {
    addBothParents(-100.0f, 10.0f);
    drawParentLines();
    ASSERT_EQ(1u, father().spouseLines.size());
    const TreeLineSegment& kept = father().getSpouseLine(107);
    EXPECT_EQ(-20.0f, kept.x1);
    EXPECT_EQ(107.0f, kept.y1);
    EXPECT_EQ(10.0f, kept.x2);
    EXPECT_EQ(1.0f, kept.y2);
    EXPECT_TRUE(kept.isSpouseLine);
}

TEST_F(PedigreeLines, middleOfTheParentsLineIsCutTowardZero) {
    addBothParents(-100.0f, 11.0f);  // -20 and 11: the half of -9
    drawParentLines();
    EXPECT_EQ((Segment{107, -4, 95, -4, false}), segmentsOf(focus).front());
}

TEST_F(PedigreeLines, ofTwoParentsAreCutTowardZeroThroughout) {
    place(focus, 27.5f, 0.75f);
    addBothParents(-99.25f, 10.75f);
    father().nodeCenter.x = 108.5f;
    drawParentLines();
    EXPECT_EQ((Segments{{108, -19, 108, 10, true}}), segmentsOf(father()));
    EXPECT_EQ((Segments{{108, -4, 95, -4, false}, {95, -4, 95, 40, false}, {95, 40, 82, 40, false}}),
              segmentsOf(focus));
}

TEST_F(PedigreeLines, parentsLineStandsAtTheInset) {
    layouter.treeSize.lineInset = 6.0f;
    addBothParents(-100.0f, 10.0f);
    drawParentLines();
    EXPECT_EQ((Segments{{113, -20, 113, 10, true}}), segmentsOf(father()));
    EXPECT_EQ((Segment{113, -5, 95, -5, false}), segmentsOf(focus).front());
}

TEST_F(PedigreeLines, parentsAreReachedWithoutAQuestion) {
    adapter.isAddNode.clear();
    adapter.getSpouses.clear();
    addBothParents(-100.0f, 10.0f);
    drawParentLines();
    EXPECT_EQ(3u, focus.lineSegments.size());
    EXPECT_TRUE(data.questions.empty());
}

// --- To one parent.

TEST_F(PedigreeLines, ofALoneParentRunIntoItsLeftEdge) {
    focus.setParentsFatherOnly(1);
    place(father(), 107.5f, 0.0f);
    drawParentLines();
    EXPECT_EQ((Segments{{107, 40, 100, 40, false}}), segmentsOf(father()));
    EXPECT_EQ((Segments{{100, 40, 100, 40, false}, {82.5f, 40, 100, 40, false}}), segmentsOf(focus));
}

TEST_F(PedigreeLines, ofALoneParentHangFromThatParent) {
    focus.setParentsFatherOnly(1);
    place(father(), 107.5f, 0.0f);
    drawParentLines();
    TreeViewGenerationEdge& edge = onlyGenerationEdge(father());
    EXPECT_EQ((Course{{107, 40}, {100, 40}, {100, 40}, {82.5f, 40}}), courseOf(edge.line()));
    EXPECT_EQ(&father(), edge.singleParent);
    EXPECT_EQ(&focus, edge.child);
    EXPECT_TRUE(focus.generationEdges.empty());
    EXPECT_TRUE(father().spouseEdges.empty());
}

TEST_F(PedigreeLines, ofAMotherAloneTakeTheSameShape) {
    focus.setParentsMotherOnly(2);
    place(mother(), 107.5f, 55.0f);
    drawParentLines();
    EXPECT_EQ((Segments{{107, 95, 100, 95, false}}), segmentsOf(mother()));
    EXPECT_EQ((Segments{{100, 40, 100, 95, false}, {82.5f, 40, 100, 40, false}}), segmentsOf(focus));
}

TEST_F(PedigreeLines, ofALoneParentAreCutButForThePersonsRightEdge) {
    place(focus, 27.5f, 0.75f);
    focus.setParentsFatherOnly(1);
    place(father(), 107.75f, 20.75f);
    drawParentLines();
    EXPECT_EQ((Segments{{107, 60, 100, 60, false}}), segmentsOf(father()));
    EXPECT_EQ((Segments{{100, 40, 100, 60, false}, {82.5f, 40, 100, 40, false}}), segmentsOf(focus));
}

// --- Up through the ancestors.

TEST_F(PedigreeLines, goOnThroughBothParents) {
    addBothParents(-55.0f, 55.0f);
    father().setParents(3, 4);
    mother().setParentsMotherOnly(5);
    place(father().getPreferredFather(), 187.5f, -165.0f);
    place(father().getPreferredMother(), 187.5f, -55.0f);
    place(mother().getPreferredMother(), 187.5f, 165.0f);
    drawParentLines();
    EXPECT_EQ((Segments{{107, 25, 107, 55, true},  // the marriage line, drawn for the focus
                        {187, -70, 175, -70, false},
                        {175, -70, 175, -15, false},
                        {175, -15, 162, -15, false}}),
              segmentsOf(father()));
    EXPECT_EQ((Segments{{180, 95, 180, 205, false}, {162.5f, 95, 180, 95, false}}), segmentsOf(mother()));
}

TEST_F(PedigreeLines, goOnThroughALoneParent) {
    focus.setParentsMotherOnly(2);
    place(mother(), 107.5f, 55.0f);
    mother().setParentsFatherOnly(3);
    place(mother().getPreferredFather(), 187.5f, 55.0f);
    drawParentLines();
    EXPECT_EQ((Segments{{187, 95, 180, 95, false}}), segmentsOf(mother().getPreferredFather()));
    EXPECT_EQ(&mother(), onlyGenerationEdge(mother().getPreferredFather()).child);
}

TEST_F(PedigreeLines, ofThePedigreeHaveNoSiblings) {
    addBothParents(-55.0f, 55.0f);
    focus.addSibling(7, kMale);
    drawFamilyLines();
    drawParentLines();
    EXPECT_EQ(Segments{}, segmentsOf(focus.siblings.front()));
}

TEST_F(PedigreeLines, ofTheFocussFamilyAreDrawnBeforeThoseToItsParents) {
    addWifeWithChildren(7, {8});
    data.parents[0] = {1, 2};
    layOut(2);
    const Segments segments = segmentsOf(focus);
    ASSERT_EQ(4u, segments.size());
    EXPECT_EQ((Segment{27, 80, 27, 110, true}), segments[0]);
    EXPECT_EQ((Segment{107, 40, 95, 40, false}), segments[1]);
}

TEST_F(PedigreeLines, ofTheFocussChildrenEndAtTheChildren) {
    addUnknownChild(5, -80.0f);
    unknownChild().addChildWithNoOtherSpouse(6, kMale);
    drawFamilyLines();
    EXPECT_EQ(2u, unknownChild().lineSegments.size());
    EXPECT_TRUE(unknownChild().generationEdges.empty());
}

}  // namespace
