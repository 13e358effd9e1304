// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include <support/plain/PlainLayouter.h>

namespace plain {

// The family view: the focus's family in the middle, ancestors in rows above, siblings beside.
//
// Holds: positions are final before flags are set, and flags before lines are laid. What no reader of a
//        result can see (line offsets and marks kept on nodes) is not kept here.
class FamilyLayouter : public Layouter {
public:
    using Layouter::Layouter;

    void layOut() override;

private:
    void walkFrom(Person& person, const Visit& visit) override;

    void addFocusFamily();
    void addSiblingRow();
    void placeAncestors(float rightEdge);
    void placeAuntsAndUncles(float rightEdge, float parentY);
    void addSiblingFamilies(Person& parent);
    void placeGreatGrandparents(float grandparentY);
    void placeAncestorRow(const Walk& row, float y, float centerX, int count);

    // Widths: bottom-up, before anything of the unit is placed.
    void measure(Person& person);
    void measureSpouse(Person& person, Person& spouse);
    float sharedChildrenWidth(Person& person, Person& spouse);
    float stepChildrenWidth(Person& spouse);
    float unknownChildrenWidth(Person& person);
    float unitWidth(Person& person);
    float gaps(int blockCount) const;
    float coupleWidth() const;

    // Placement of one unit into the span that starts at x.
    void placeUnit(Person& person, float x, float y);
    void placeManBesideSpouses(Person& man, float x, float y);
    void placeWomanBesideSpouses(Person& woman, float x, float y);
    void placeManInCouple(Person& man, float x, float y);
    void placeWomanInCouple(Person& woman, float x, float y);
    float placeCouple(Person& husband, Person& wife, const Walk& children, float x, float y);
    float placeSpouse(Person& person, Person& spouse, float x, float y);
    float placeChildren(const Walk& children, float childY, float x);
    float placeUnknownChildren(Person& person, float x, float y);
    float placePersonAndUnknownChildren(Person& person, float x, float y);
    void centerPerson(Person& person, float width, float left, float y) const;
    void centerCouple(Person& husband, Person& wife, float width, float left, float y) const;

    float placeSiblings(Person& person);
    float placeFatherSiblings(Person& person, float x, float y);
    float placeMotherSiblings(Person& person, float x, float y);

    void flagHiddenRelatives();
    void flagSiblings();
    void flagSiblingByParents(Person& sibling);
    void flagSpouses(Person& person, bool checkChildren);
    void flagChildByParents(Person& parent, Person& child);
    void flagByDisplay(Person& person, const std::vector<Person*>& displayed);
    bool hidesChildren(Person& person, const std::vector<Person*>& displayed);
    bool hidesSpouses(Person& person, const std::vector<Person*>& displayed);
    bool hidesParent(int parentKey, const std::vector<Person*>& displayed) const;

    void addSpouseLines(Person& person);
    int lineOffset(int spouseCount, bool male) const;
    void addLines(Person& person);
    void addChildLine(Person& person, Person& child, Person& spouse);
    void addSiblingLine(Person& person, Person& sibling);
    void addSiblingEdge(Person& person, Person& sibling, const Line& line);
    Line parentsLineSeenBySibling(Person& father, Person& mother);
    void addParentLines(Person& person);
    void addCoupleLines(Person& person, Person& father, Person& mother);
    void addLoneParentLines(Person& person, Person& parent);
    void addBarAndStem(Person& lower, Line& line, float dropX, float busY) const;
    float loneParentBusY(float startY) const;
};

}  // namespace plain
