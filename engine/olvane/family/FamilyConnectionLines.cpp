// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines of the family view, in two passes over the whole graph: first every person's marriage lines, then
// the lines to children, siblings and parents, which hang from them.
//
//        [F]---+---[M]      marriage line at mid-height, the drop in the gap between the two
//              |
//        +-----+-----+      the bar, at half the gap between generations
//        |           |
//       [P]         [B]     a stem for each child
//
// A child of one parent hangs from the bottom centre of that parent, and its bar runs at a quarter of the
// gap, which keeps it apart from the bars of the couples. The shapes seen from below (a person's own
// parents, its siblings) cut more of their numbers to whole points than those seen from above; hosts know the
// lines by these numbers.
//
// Each child repeats the drop of its couple, and the repetition reaches the host: it is how a host counts the
// lines that hang from a couple. Nothing here reads the lines on edges back.

#include <olvane/family/TreeViewFamilyLayouter.h>
#include <olvane/graph/PersonWalksInternal.h>
#include <olvane/graph/WholePointInternal.h>
#include <olvane/layouter/LineCourseInternal.h>
#include <olvane/layouter/LineRecordInternal.h>

#include <span>
#include <utility>

namespace SharedTreeViewer {

using olvane::cutToWholePoint;

// A man's spouses stand at his right, a woman's at her left. All lines of a person start at one edge, stacked
// about mid-height, and a line to a farther spouse passes behind the nearer ones. With an even number of
// spouses above two the stack is not symmetric about mid-height; drops and hosts' marriage labels hang from
// it as it is.
void TreeViewFamilyLayouter::addSpouseLinesToPerson(TreeViewPerson& person) {
    const bool male = person.gender;
    const float ownEdgeX = male ? treeSize.nodeWidth : 0.0f;
    const float spouseEdgeX = male ? 0.0f : treeSize.nodeWidth;
    const float offsetStep = male ? -1.0f : 1.0f;
    int lineOffset = getLineOffset(person.getSpouseCount(), male);

    for (TreeViewPerson& spouse : person.spouses) {
        const TreePoint own = person.getNodeCenter();
        const TreePoint other = spouse.getNodeCenter();
        const float dropX = male ? other.x - treeSize.horzPadding * 0.5f
                                 : (other.x + treeSize.horzPadding * 0.5f) + treeSize.nodeWidth;
        const float x1 = cutToWholePoint(own.x + ownEdgeX);
        const float y = cutToWholePoint(own.y + treeSize.nodeHeight * 0.5f + static_cast<float>(lineOffset));
        const float x2 = cutToWholePoint(other.x + spouseEdgeX);
        person.addLineSegment(x1, y, x2, y, true);
        if (lineRecord != nullptr) lineRecord->addMarriage(person, person, spouse);
        person.spouseEdge(&spouse, TreeLine({TreePoint{x1, y}, TreePoint{dropX, y}, TreePoint{x2, y}}));
        person.addSpouseLine(spouse.personId, x1, y, x2, y);
        lineOffset =
            olvane::wholePoint(treeSize.spouseLineStep * offsetStep + static_cast<float>(lineOffset));
    }
}

// The order of the three stages is the order of the segments in every list.
void TreeViewFamilyLayouter::addLinesToPerson(TreeViewPerson& person) {
    visitChildrenBySpouse(person, [&](std::span<TreeViewPerson> children, TreeViewPerson& spouse) {
        if (children.empty()) return;
        if (spouse.personId == person.personId) {
            addLinesToChildrenOfLoneParent(person, spouse, children);
        } else {
            addLinesToChildrenOfCouple(person, spouse, children);
        }
    });
    for (TreeViewPerson& sibling : person.siblings) addSiblingLine(person, sibling);
    addParentLines(person);
}

// A person married to itself hangs its children from the spouse's box.
void TreeViewFamilyLayouter::addLinesToChildrenOfLoneParent(TreeViewPerson& person, TreeViewPerson& holder,
                                                            std::span<TreeViewPerson> children) {
    const Drop drop = dropToChildOfLoneParent(holder);
    for (TreeViewPerson& child : children) {
        TreeLine line = drawDropBarAndStem(drop, holder, child);
        person.addGenerationEdge(makeGenerationEdge(std::move(line), child, &person));
    }
}

// All children hang from one drop and one edge, so both are looked up once.
void TreeViewFamilyLayouter::addLinesToChildrenOfCouple(TreeViewPerson& person, TreeViewPerson& spouse,
                                                        std::span<TreeViewPerson> children) {
    const Drop drop = dropToChildOfCouple(person, spouse);
    TreeViewSpouseEdge* const couple = person.spouseEdge(&spouse, TreeLine());
    couple->reserveChildEdges(children.size());
    for (TreeViewPerson& child : children) {
        TreeLine line = drawDropBarAndStem(drop, spouse, child);
        couple->addChildEdge(makeGenerationEdge(std::move(line), child, couple));
    }
}

TreeViewFamilyLayouter::Drop TreeViewFamilyLayouter::dropToChildOfLoneParent(TreeViewPerson& parent) const {
    const TreePoint at = parent.getNodeCenter();
    Drop drop;
    drop.parent = &parent;
    drop.x = at.x + treeSize.nodeWidth * 0.5f;
    drop.startY = at.y + treeSize.nodeHeight;
    drop.busY = static_cast<float>(treeSize.vertPadding * 0.25 + drop.startY);
    return drop;
}

TreeViewFamilyLayouter::Drop TreeViewFamilyLayouter::dropToChildOfCouple(TreeViewPerson& person,
                                                                         TreeViewPerson& spouse) const {
    const TreePoint at = spouse.getNodeCenter();
    Drop drop;
    drop.parent = &person;
    drop.other = &spouse;
    drop.x = person.gender ? at.x + treeSize.horzPadding * -0.5f
                           : treeSize.nodeWidth + (at.x + treeSize.horzPadding * 0.5f);
    drop.startY = person.getSpouseLine(spouse.personId).y1;
    drop.busY = at.y + treeSize.nodeHeight + treeSize.vertPadding * 0.5f;
    return drop;
}

// Drop, bar and stem in this order: each joins the course at its end. A stem right below the drop gives a bar
// of no length, which is drawn like any other.
TreeLine TreeViewFamilyLayouter::drawDropBarAndStem(const Drop& drop, TreeViewPerson& holder,
                                                    TreeViewPerson& child) const {
    const TreePoint at = child.getNodeCenter();
    const float stemX = cutToWholePoint(at.x + treeSize.nodeWidth * 0.5f);
    TreeLine line;
    LineCourse course(line);
    course.draw(holder, drop.x, drop.startY, drop.x, drop.busY);
    course.draw(child, stemX, drop.busY, drop.x, drop.busY);
    course.draw(child, stemX, at.y, stemX, drop.busY);
    if (lineRecord != nullptr) lineRecord->addChildLines(holder, child, *drop.parent, drop.other);
    return line;
}

// From a father's mid-height, in the gap at his right, down to the bar of a couple's children.
TreeViewFamilyLayouter::Drop TreeViewFamilyLayouter::dropFromCouple(TreeViewPerson& father,
                                                                    TreeViewPerson* mother) const {
    const TreePoint at = father.getNodeCenter();
    Drop drop;
    drop.parent = &father;
    drop.other = mother;
    drop.x = treeSize.nodeWidth + (at.x + treeSize.horzPadding * 0.5f);
    drop.startY = cutToWholePoint(at.y + treeSize.nodeHeight * 0.5f);
    drop.busY = cutToWholePoint(at.y + treeSize.nodeHeight + treeSize.vertPadding * 0.5f);
    return drop;
}

// From a parent's bottom centre, for a person with one parent and for a half sibling.
TreeViewFamilyLayouter::Drop TreeViewFamilyLayouter::dropFromSingleParent(TreeViewPerson& parent) const {
    const TreePoint at = parent.getNodeCenter();
    Drop drop;
    drop.parent = &parent;
    drop.x = at.x + treeSize.nodeWidth * 0.5f;
    drop.startY = cutToWholePoint(at.y + treeSize.nodeHeight);
    drop.busY = cutToWholePoint(treeSize.vertPadding * 0.25 + drop.startY);
    return drop;
}

// A full sibling names no parent of its own; a half sibling names the one that it shares.
void TreeViewFamilyLayouter::addSiblingLine(TreeViewPerson& person, TreeViewPerson& sibling) {
    if (sibling.personId == person.personId) return;
    const int sharedParent = sibling.getParentId();
    if (dataAdapter->isAddNode(sharedParent)) {
        TreeViewPerson& father = person.getPreferredFather();
        TreeViewPerson* const mother =
            person.preferredMotherIndex != -1 ? &person.getPreferredMother() : nullptr;
        addSiblingEdge(person, sibling, drawDropBarAndStem(dropFromCouple(father, mother), father, sibling));
    } else {
        const bool throughFather =
            person.preferredFatherIndex != -1 && person.getPreferredFather().personId == sharedParent;
        TreeViewPerson& parent = throughFather ? person.getPreferredFather() : person.getPreferredMother();
        addSiblingEdge(person, sibling, drawDropBarAndStem(dropFromSingleParent(parent), parent, sibling));
    }
}

// With both parents drawn the edge goes to the couple, a half sibling's too, although its line begins under
// one parent: a host that walks a couple's edges meets all of its row. With a single parent the edge goes to
// the person and not to the parent, unlike at the other places that make one; a host finds a sibling's edge
// beside the person.
void TreeViewFamilyLayouter::addSiblingEdge(TreeViewPerson& person, TreeViewPerson& sibling, TreeLine line) {
    const bool hasFather = person.preferredFatherIndex != -1;
    const bool hasMother = person.preferredMotherIndex != -1;
    if (hasFather && hasMother) {
        TreeViewSpouseEdge* const couple =
            siblingParentsEdge(person.getPreferredFather(), person.getPreferredMother());
        couple->addChildEdge(makeGenerationEdge(std::move(line), sibling, couple));
        return;
    }
    const bool throughFather = hasFather && person.getPreferredFather().personId == sibling.getParentId();
    TreeViewPerson& parent = throughFather ? person.getPreferredFather() : person.getPreferredMother();
    person.addGenerationEdge(makeGenerationEdge(std::move(line), sibling, &parent));
}

// The points count only when this call is the one that makes the edge.
TreeViewSpouseEdge* TreeViewFamilyLayouter::siblingParentsEdge(TreeViewPerson& father,
                                                               TreeViewPerson& mother) {
    const TreePoint fatherAt = father.getNodeCenter();
    const TreePoint motherAt = mother.getNodeCenter();
    const float y = cutToWholePoint(fatherAt.y + treeSize.nodeHeight * 0.5f);
    const float middleX = father.gender ? motherAt.x + treeSize.horzPadding * -0.5f
                                        : treeSize.nodeWidth + (motherAt.x + treeSize.horzPadding * 0.5f);
    const TreePoint fatherEnd{fatherAt.x + treeSize.nodeWidth, y};
    const TreePoint middle{middleX, y};
    const TreePoint motherEnd{motherAt.x, y};
    TreeLine line;
    switch (courseOfParentsLine(father, mother)) {
        case ParentsCourse::fromFather:
            line = TreeLine({fatherEnd, middle, motherEnd});
            break;
        case ParentsCourse::fromMother:
            line = TreeLine({motherEnd, middle, fatherEnd});
            break;
        case ParentsCourse::none:
            break;
    }
    return mother.spouseEdge(&father, std::move(line));
}

// The mother is asked about twice with the same question: a data source may answer differently the second
// time, and then the edge has no points. Asking for the father's host spouses loads them once and is needed
// for that.
TreeViewFamilyLayouter::ParentsCourse TreeViewFamilyLayouter::courseOfParentsLine(TreeViewPerson& father,
                                                                                  TreeViewPerson& mother) {
    const float fatherEndX = father.getNodeCenter().x + treeSize.nodeWidth;
    if (!(mother.getNodeCenter().x > fatherEndX)) return ParentsCourse::fromFather;
    father.getNonDisplayedSpouses(dataAdapter->getSpouses);
    if (father.getNonDisplayedSpouseCount() == 0) return ParentsCourse::fromMother;
    if (father.nonDisplayedSpouses.front().personId == mother.personId) return ParentsCourse::fromMother;
    if (!dataAdapter->isAddNode(mother.personId)) return ParentsCourse::fromFather;
    if (dataAdapter->isAddNode(mother.personId)) return ParentsCourse::fromMother;
    return ParentsCourse::none;
}

// Only where parents were added: children and siblings that hang under a person get their lines from above.
void TreeViewFamilyLayouter::addParentLines(TreeViewPerson& person) {
    const int parentCount = person.getParentCount();
    if (parentCount == 0) return;
    if (parentCount == 1) {
        TreeViewPerson& parent =
            person.preferredFatherIndex != -1 ? person.getPreferredFather() : person.getPreferredMother();
        TreeLine line = drawDropBarAndStem(dropFromSingleParent(parent), parent, person);
        parent.addGenerationEdge(makeGenerationEdge(std::move(line), person, &parent));
        return;
    }
    TreeViewPerson& father = person.getPreferredFather();
    TreeViewPerson& mother = person.getPreferredMother();
    const Drop drop = dropFromCouple(father, &mother);
    TreeLine line = drawDropBarAndStem(drop, father, person);
    drawParentsMarriageLine(father, mother, drop);
    TreeViewSpouseEdge* const couple = father.spouseEdge(&mother, TreeLine());
    couple->addChildEdge(makeGenerationEdge(std::move(line), person, couple));
}

// The one marriage line of a couple that stands on the chart as somebody's parents and not as each other's
// spouses. Its ends keep their fractions in x. Whether the father is an unknown parent is asked and changes
// nothing: the look-up that it makes fails on a key that was never handed out.
void TreeViewFamilyLayouter::drawParentsMarriageLine(TreeViewPerson& father, TreeViewPerson& mother,
                                                     const Drop& drop) {
    const float fatherEndX = father.getNodeCenter().x + treeSize.nodeWidth;
    const float motherEndX = mother.getNodeCenter().x;
    father.addLineSegment(fatherEndX, drop.startY, motherEndX, drop.startY, true);
    if (lineRecord != nullptr) lineRecord->addMarriage(father, father, mother);
    dataAdapter->isAddNode(father.personId);
    father.spouseEdge(&mother, TreeLine({TreePoint{fatherEndX, drop.startY}, TreePoint{drop.x, drop.startY},
                                         TreePoint{motherEndX, drop.startY}}));
}

}  // namespace SharedTreeViewer
