// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines of the pedigree view, from the focus down to its spouses and children, then up through all
// ancestors. The chart lies on its side: a line runs sideways first and then up or down.
//
//                           +--[father]
//                           |   |             marriage line between the two boxes
//      [child]--+   [focus]-+---|
//               |   |           |
//               +---|        [mother]
//                   |
//                  [spouse]
//
// Each child repeats the first piece of its couple, and the repetition reaches the host, as in the family
// view. Nothing here reads the lines on edges back.

#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

#include <olvane/graph/WholePointInternal.h>
#include <olvane/layouter/LineCourseInternal.h>
#include <olvane/layouter/LineRecordInternal.h>

#include <algorithm>
#include <cstdint>
#include <utility>

namespace SharedTreeViewer {

using olvane::cutToWholePoint;
using olvane::wholePoint;

// Marriage lines step to the right from the left inset; many spouses share what is left of the box's width.
// Without a spouse the division gives an infinity, and the ordinary step stands.
void TreeViewPedigreeLayouter::addSpouseAndChildrenLinesForFocusPerson(TreeViewPerson& focus) {
    int spouseBaseX = wholePoint(treeSize.lineInset);
    const float roomForEach =
        (treeSize.nodeWidth - treeSize.lineInset) / static_cast<float>(focus.getSpouseCount());
    const int spouseStep = wholePoint(std::min(roomForEach, treeSize.spouseLineStep));
    focus.spouseIterator(
        [&](TreeViewPerson& spouse) { addPedigreeSpouseLine(focus, spouse, spouseBaseX, spouseStep); });
    focus.childAndSpouseIterator(
        [&](TreeViewPerson& child, TreeViewPerson& spouse) { addPedigreeChildLine(focus, child, spouse); });
}

namespace {

// Whole numbers that go round instead of overflowing: sizes may be anything that a float can be.
int addWhole(int a, int b) {
    return static_cast<int>(static_cast<std::uint32_t>(a) + static_cast<std::uint32_t>(b));
}

}  // namespace

void TreeViewPedigreeLayouter::addPedigreeSpouseLine(TreeViewPerson& focus, TreeViewPerson& spouse,
                                                     int& spouseBaseX, int spouseStep) {
    const TreePoint own = focus.getNodeCenter();
    const float x = cutToWholePoint(own.x + static_cast<float>(spouseBaseX));
    const float y1 = cutToWholePoint(own.y + treeSize.nodeHeight);
    const float y2 = cutToWholePoint(spouse.getNodeCenter().y);
    focus.addLineSegment(x, y1, x, y2, true);
    if (lineRecord != nullptr) lineRecord->addMarriage(focus, focus, spouse);
    focus.addSpouseLine(spouse.personId, x, y1, x, y2);
    const TreePoint turn{x, y2 + treeSize.vertPadding * -0.5f};
    focus.spouseEdge(&spouse, TreeLine({TreePoint{x, y1}, turn, TreePoint{x, y2}}));
    spouseBaseX = addWhole(spouseBaseX, spouseStep);
}

void TreeViewPedigreeLayouter::addPedigreeChildLine(TreeViewPerson& focus, TreeViewPerson& child,
                                                    TreeViewPerson& spouse) {
    const TreePoint at = spouse.getNodeCenter();
    TreeLine line;
    LineCourse course(line);
    if (spouse.personId == focus.personId) {
        const TreePoint junction{at.x + treeSize.horzPadding * -0.25f, at.y + treeSize.nodeHeight * 0.5f};
        course.draw(spouse, at.x, junction.y, junction.x, junction.y);
        joinChild(course, child, junction);
        if (lineRecord != nullptr) lineRecord->addChildLines(spouse, child, spouse, nullptr);
        focus.addGenerationEdge(makeGenerationEdge(std::move(line), child, &focus));
    } else {
        const TreePoint junction{at.x + treeSize.horzPadding * -0.5f, at.y + treeSize.vertPadding * -0.5f};
        const float lineX = focus.getSpouseLine(spouse.personId).x1;
        course.draw(spouse, lineX, junction.y, junction.x, junction.y);
        joinChild(course, child, junction);
        if (lineRecord != nullptr) lineRecord->addChildLines(spouse, child, focus, &spouse);
        TreeViewSpouseEdge* const couple = spouse.spouseEdge(&focus, TreeLine());
        couple->addChildEdge(makeGenerationEdge(std::move(line), child, couple));
    }
}

void TreeViewPedigreeLayouter::joinChild(LineCourse& course, TreeViewPerson& child,
                                         TreePoint junction) const {
    const TreePoint at = child.getNodeCenter();
    const float middleY = cutToWholePoint(at.y + treeSize.nodeHeight * 0.5f);
    course.draw(child, junction.x, middleY, junction.x, junction.y);
    course.draw(child, at.x + treeSize.nodeWidth, middleY, junction.x, middleY);
}

void TreeViewPedigreeLayouter::addParentLinesForPerson(TreeViewPerson& person) {
    const bool hasFather = person.preferredFatherIndex != -1;
    const bool hasMother = person.preferredMotherIndex != -1;
    if (hasFather && hasMother) {
        addCoupleLines(person, person.getPreferredFather(), person.getPreferredMother());
    } else if (hasFather) {
        addSingleParentLines(person, person.getPreferredFather());
    } else if (hasMother) {
        addSingleParentLines(person, person.getPreferredMother());
    }
}

void TreeViewPedigreeLayouter::addCoupleLines(TreeViewPerson& person, TreeViewPerson& father,
                                              TreeViewPerson& mother) {
    const TreePoint own = person.getNodeCenter();
    const TreePoint fatherAt = father.getNodeCenter();
    const float x = cutToWholePoint(fatherAt.x + treeSize.lineInset);
    const float y1 = cutToWholePoint(fatherAt.y + treeSize.nodeHeight);
    const float y2 = cutToWholePoint(mother.getNodeCenter().y);
    father.addLineSegment(x, y1, x, y2, true);
    if (lineRecord != nullptr) lineRecord->addMarriage(father, father, mother);
    // Stored under the line's own x, with the numbers one place on. Hosts that read the marriage lines of a
    // pedigree look them up in this form; filed under the mother they would meet a second line where there is
    // one marriage.
    father.addSpouseLine(wholePoint(x), y1, x, y2, 1.0f);
    const TreePoint turn{x, y2 + treeSize.vertPadding * -0.5f};
    TreeViewSpouseEdge* const couple =
        father.spouseEdge(&mother, TreeLine({TreePoint{x, y1}, turn, TreePoint{x, y2}}));

    const std::int64_t sumOfEnds = static_cast<std::int64_t>(wholePoint(y1)) + wholePoint(y2);
    const std::int64_t halfOfSum = sumOfEnds / 2;  // toward zero: -9 gives -4
    const float middleY = static_cast<float>(halfOfSum);
    const float middleX = cutToWholePoint((fatherAt.x + own.x + treeSize.nodeWidth) * 0.5f);
    const float ownY = cutToWholePoint(own.y + treeSize.nodeHeight * 0.5f);
    const float ownRight = cutToWholePoint(own.x + treeSize.nodeWidth);
    TreeLine line;
    LineCourse course(line);
    course.draw(person, x, middleY, middleX, middleY);
    course.draw(person, middleX, middleY, middleX, ownY);
    course.draw(person, middleX, ownY, ownRight, ownY);
    if (lineRecord != nullptr) lineRecord->addChildLines(person, person, father, &mother);
    couple->addChildEdge(makeGenerationEdge(std::move(line), person, couple));
    addParentLinesForPerson(father);
    addParentLinesForPerson(mother);
}

// The line runs into the parent's left edge at mid-height.
void TreeViewPedigreeLayouter::addSingleParentLines(TreeViewPerson& person, TreeViewPerson& parent) {
    const TreePoint own = person.getNodeCenter();
    const TreePoint parentAt = parent.getNodeCenter();
    const float parentY = cutToWholePoint(parentAt.y + treeSize.nodeHeight * 0.5f);
    const float parentX = cutToWholePoint(parentAt.x);
    const float stubX = cutToWholePoint(treeSize.horzPadding * -0.25 + parentX);
    const float ownY = cutToWholePoint(own.y + treeSize.nodeHeight * 0.5f);
    TreeLine line;
    LineCourse course(line);
    course.draw(parent, parentX, parentY, stubX, parentY);
    course.draw(person, stubX, ownY, stubX, parentY);
    course.draw(person, own.x + treeSize.nodeWidth, ownY, stubX, ownY);
    if (lineRecord != nullptr) lineRecord->addChildLines(parent, person, parent, nullptr);
    parent.addGenerationEdge(makeGenerationEdge(std::move(line), person, &parent));
    addParentLinesForPerson(parent);
}

}  // namespace SharedTreeViewer
