// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <deque>
#include <vector>

#include <olvane/Export.h>
#include <olvane/layouter/TreeViewLayouter.h>

namespace SharedTreeViewer {

class LineCourse;

// The pedigree view: a chart lying on its side. The focus stands at the left with its spouses below it and
// its children in a column to its left; to its right one column for each generation of preferred ancestors,
// every column a stack of equal slots centred on y = 0, a father's slot above the mother's.
//
// Units: points; x grows right, y grows down. One column is nodeWidth + horzPadding, one slot nodeHeight +
//        vertPadding in every column, so parents are centred on their child in the first column only.
// Holds: siblings are not shown and no option is read. maxGenerations counts the columns with the focus's
//        own; with 1 or less nobody is asked for parents. Full ancestry of n columns makes 2^n - 1 persons.
//        The columns are walked by recursion, some hundred bytes of stack each: 1,000 are safe on any thread.
// Fails: as the base.
//
// The operations are public so that each act can be run and looked at alone. Hosts call layoutForFocusNID
// once, then graphIterator.
class OLVANE_API TreeViewPedigreeLayouter : public TreeViewLayouter {
public:
    TreeViewPedigreeLayouter(DataAdapter* data, int focusKey, int isMale, OptionMap optionValues,
                             const TreeSize& sizes, int generations, int stackDepth);

    void layoutForFocusNID() override;
    void graphIterator(const Visitor& visitor) override;

    // --- Geometry.
    float heightForNodeCount(int count) const;
    // The place of a slot, counted from 0 at the top. The slots of a deep column are as many as an int holds.
    TreePoint getCenterPointForGeneration(int generation, int index) const;

    // --- Growing and placing. The focus must have its place.
    void addAndLayoutChildrenAndSpousesOfFocusPerson(TreeViewPerson& focus);
    void addAndLayoutParentsOfPerson(TreeViewPerson& person, int generation, int index);

    // --- Lines.
    void addSpouseAndChildrenLinesForFocusPerson(TreeViewPerson& focus);
    void addParentLinesForPerson(TreeViewPerson& person);

    // --- Walks over the finished graph.
    void graphIteratorHelper(TreeViewPerson& person, const Visitor& visitor);
    void iterateDirectLineFromFocusPerson(const DirectLineVisitor& visitor);
    void directLineIterator(TreeViewPerson& person, const DirectLineVisitor& visitor, bool hasNeighbours,
                            const Iterator& neighbours);
    void directLineIteratorHelper(TreeViewPerson& person, const DirectLineVisitor& visitor);
    void traverseTreeForStacking(int depth, TreeViewPerson& person);

    // --- Flags.
    void flagNonDisplayedRelationships(TreeViewPerson& focus);
    void flagNonDisplayedRelationshipsForSpouses(TreeViewPerson& person, bool checkChildren);
    void checkParentsForOtherChildren(TreeViewPerson& person);
    void checkChildForUnshownParents(TreeViewPerson& parent, TreeViewPerson& child);
    void checkPersonsChildren(TreeViewPerson& person);  // offered to hosts; no step of this view calls it

    int maxGenerations;
    int maxStackDepth;                           // bounds traverseTreeForStacking
    std::deque<TreeViewPerson*> stackedPersons;  // not owned; filled and emptied while flags are set

private:
    class ChildrenStack;
    struct SpouseWithChildren;

    // The focus's family.
    std::vector<TreeViewPerson*> collectShown(const Iterator& walk);
    void placePreferredFamily(TreeViewPerson& focus, ChildrenStack& stack);
    void placeOtherFamilies(TreeViewPerson& focus, ChildrenStack& stack);
    std::vector<SpouseWithChildren> collectOtherFamilies(TreeViewPerson& focus);
    void placeChildrenWithoutSecondParent(TreeViewPerson& focus, const ChildrenStack& stack);
    float childrenX(const TreeViewPerson& focus) const;
    void placeAncestor(TreeViewPerson& ancestor, int generation, int index);

    // Lines.
    void addPedigreeSpouseLine(TreeViewPerson& focus, TreeViewPerson& spouse, int& spouseBaseX,
                               int spouseStep);
    void addPedigreeChildLine(TreeViewPerson& focus, TreeViewPerson& child, TreeViewPerson& spouse);
    void joinChild(LineCourse& course, TreeViewPerson& child, TreePoint junction) const;
    void addCoupleLines(TreeViewPerson& person, TreeViewPerson& father, TreeViewPerson& mother);
    void addSingleParentLines(TreeViewPerson& person, TreeViewPerson& parent);

    // Flags.
    void clearVisitedMarks();
    void flagChildren(TreeViewPerson& focus);
    bool hasChildOffTheChart(TreeViewPerson& spouse);
    bool parentHasSpouseBesideTheOther(TreeViewPerson& parent, int father, int mother);
};

}  // namespace SharedTreeViewer
