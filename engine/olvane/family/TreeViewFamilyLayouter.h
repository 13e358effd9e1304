// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <span>
#include <vector>

#include <olvane/Export.h>
#include <olvane/detail/KeySet.h>
#include <olvane/layouter/TreeViewLayouter.h>

namespace SharedTreeViewer {

// The family view: the focus in the middle of row 0 with spouses and siblings beside it, descendants in rows
// below, parents, grandparents and great-grandparents in rows above, aunts and uncles beside the parents.
//
// Units: points; x grows right, y grows down, and one generation is nodeHeight + vertPadding.
// Holds: men stand left of their spouses, women right. Boxes are set at the middle of their spans while lines
//        and hosts take the same point for the box's upper-left corner, so the whole drawing stands half a
//        nodeWidth to the right of the spans. All boxes alike: it is part of the picture.
// Fails: as the base; std::out_of_range where the data leave a line without the person that it should hang
//        from.
//
// The operations are public so that each act can be run and looked at alone. Hosts call layoutForFocusNID
// once, then graphIterator.
class OLVANE_API TreeViewFamilyLayouter : public TreeViewLayouter {
public:
    TreeViewFamilyLayouter(DataAdapter* data, int focusKey, int isMale, OptionMap optionValues,
                           const TreeSize& sizes);

    void layoutForFocusNID() override;
    void graphIterator(const Visitor& visitor) override;

    // --- Widths. A family unit is one proximal person (the focus, a sibling, a child), that person's spouses
    // and all that descends from them. layoutWidth of a proximal person is the block of its unknown children,
    // those under no second parent; layoutWidth of a spouse is the block of the children that hang below it.
    void calculateLayoutWidthForDescendantsOfProximalPerson(TreeViewPerson& person);
    // The whole unit, from the stored widths; changes nothing. Only after the operation above ran on the
    // person.
    float familyUnitWidthForProximalPerson(TreeViewPerson& person);
    float addWidthsForStepChildrenFromSpouse(TreeViewPerson& spouse);
    float horzPaddingForNodesCount(int count) const;

    // --- Placement of a unit, left to right from (x, y). Nothing is moved after it is placed, and nothing
    // looks out for collisions: a unit that measured narrower than it is may run under its neighbour.
    void layoutFamilyUnitOfProximalPerson(TreeViewPerson& person, float x, float y);
    // How far the first marriage line of a person stands from mid-height, in whole points.
    int getLineOffset(int spouseCount, bool isMale) const;
    float layoutTraditionalHusbandAndWife(TreeViewPerson& husband, TreeViewPerson& wife,
                                          const Iterator& children, float x, float y);
    void layoutSpouse(TreeViewPerson& spouse, const Iterator& children, float y, float* x, int* offset,
                      bool decrease);
    void layoutChildrenAndPersonWithNonCombinedSpouse(TreeViewPerson& spouse, const Iterator& children,
                                                      float x, float y);
    // These return the running x behind the last unit. Mind the order: y comes before x in the first.
    float layoutChildrenOfParents(const Iterator& children, float childY, float x);
    float layoutUnknownChildren(TreeViewPerson& person, float x, float y);  // y is the parent's row
    float layoutUnknownChildrenAndPerson(TreeViewPerson& person, float x, float y);

    // --- Placement of siblings beside the focus, and of the parents' siblings beside the parents.
    float layoutSiblings(TreeViewPerson& person);
    float layoutFatherSiblings(TreeViewPerson& person, float x, float y);
    float layoutMotherSiblings(TreeViewPerson& person, float x, float y);

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
    void checkChildForUnshownParents(TreeViewPerson& parent, TreeViewPerson& child);
    void checkPersonsChildren(TreeViewPerson& person);

    // --- Lines. The marriage lines of all persons come first: the other lines hang from them.
    void addSpouseLinesToPerson(TreeViewPerson& person);
    void addLinesToPerson(TreeViewPerson& person);

    int maxStackDepth = 4;                        // bounds traverseTreeForStacking
    std::vector<TreeViewPerson*> stackedPersons;  // not owned; filled and emptied while flags are set

private:
    // The vertical piece from which a child's bar and stem hang, and the parents whose it is.
    struct Drop {
        float x;
        float startY;
        float busY;
        TreeViewPerson* parent;
        TreeViewPerson* other = nullptr;  // null for a lone parent
    };

    // The acts of the driver.
    void readOptions();
    void addFocusFamily();
    void addStepChildrenOfFocus();
    void addFamiliesOfChildren();
    void placeFocusFamily();
    void addSiblingsOfFocus();
    void placeParents();
    void placeGrandparents();
    void placeAuntsAndUncles();
    void placeGreatGrandparents();
    void drawLines();
    std::vector<TreeViewPerson*> everyPerson();  // in the order of the result; good while no list grows
    float parentY() const;
    float grandparentY() const;
    float greatGrandparentY() const;

    // Widths.
    float couplesWidth() const;
    void measureSpouse(TreeViewPerson& person, TreeViewPerson& spouse);
    void measureSpouseWithSharedChildren(TreeViewPerson& person, TreeViewPerson& spouse);
    void measureSpouseWithoutSharedChildren(TreeViewPerson& spouse);
    float sharedChildrenWidth(TreeViewPerson& person, TreeViewPerson& spouse);
    float widthWithoutSecondParent(TreeViewPerson& person);

    // Placement.
    void placeManAndNonCombinedSpouses(TreeViewPerson& man, float x, float y, int offset);
    void placeNonCombinedSpousesAndWoman(TreeViewPerson& woman, float x, float y, int offset);
    void placeCoupleAndLaterSpouses(TreeViewPerson& man, float x, float y, int offset);
    void placeEarlierSpousesAndCouple(TreeViewPerson& woman, float x, float y, int offset);
    void measureAndPlaceSibling(TreeViewPerson& sibling, float x, float y);

    // Flags.
    void flagSiblings(TreeViewPerson& focus);
    bool siblingHasAnotherParent(TreeViewPerson& sibling, TreeViewPerson& focus);
    void flagChildren(TreeViewPerson& focus);
    void clearVisitedMarks();
    void collectShownPersons();
    void flagAgainstWholeDisplay();

    // Lines.
    void addLinesToChildrenOfLoneParent(TreeViewPerson& person, TreeViewPerson& holder,
                                        std::span<TreeViewPerson> children);
    void addLinesToChildrenOfCouple(TreeViewPerson& person, TreeViewPerson& spouse,
                                    std::span<TreeViewPerson> children);
    void addSiblingLine(TreeViewPerson& person, TreeViewPerson& sibling);
    void addParentLines(TreeViewPerson& person);
    Drop dropToChildOfCouple(TreeViewPerson& person, TreeViewPerson& spouse) const;
    Drop dropToChildOfLoneParent(TreeViewPerson& parent) const;
    Drop dropFromCouple(TreeViewPerson& father, TreeViewPerson* mother) const;
    Drop dropFromSingleParent(TreeViewPerson& parent) const;
    TreeLine drawDropBarAndStem(const Drop& drop, TreeViewPerson& holder, TreeViewPerson& child) const;
    void drawParentsMarriageLine(TreeViewPerson& father, TreeViewPerson& mother, const Drop& drop);
    void addSiblingEdge(TreeViewPerson& person, TreeViewPerson& sibling, TreeLine line);
    TreeViewSpouseEdge* siblingParentsEdge(TreeViewPerson& father, TreeViewPerson& mother);
    // Which way the three points of a parents' line made for a sibling run.
    enum class ParentsCourse { fromFather, fromMother, none };
    ParentsCourse courseOfParentsLine(TreeViewPerson& father, TreeViewPerson& mother);

    // The eight options, read once at the start.
    struct Options {
        bool auntsUncles = true;
        bool cousins = true;
        bool siblings = true;
        bool siblingSpouses = true;
        bool niecesNephews = true;
        bool grandchildren = true;
        bool greatGrandparents = true;
        bool spousesOfChildren = true;
    };
    Options show;
    float rightEdge = 0.0f;                  // of what the last placement of siblings reached
    KeySet shownKeys;                        // the keys of stackedPersons while the whole display is in it
    std::vector<TreeViewPerson*> everybody;  // the whole display, from the flags to the lines
};

}  // namespace SharedTreeViewer
