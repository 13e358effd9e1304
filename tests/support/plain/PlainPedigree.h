// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <utility>
#include <vector>

#include <support/plain/PlainLayouter.h>

namespace plain {

// The pedigree view: a chart on its side, one column of slots for each generation of ancestors to the right
// of the focus, its spouses below it and its children in one stack to its left.
class PedigreeLayouter : public Layouter {
public:
    using Layouter::Layouter;

    void layOut() override;

private:
    // The other spouses, in list order, each with the children shared with it.
    using SpouseBlocks = std::vector<std::pair<Person*, std::vector<Person*>>>;

    void walkFrom(Person& person, const Visit& visit) override;

    void placeFocusFamily();
    float placeSpousesAndTheirChildren();
    SpouseBlocks otherSpouses(const Person& preferred);
    void placeOtherSpouses(const SpouseBlocks& blocks, const Person& preferred);
    void placeUnknownChildren(float childTop);
    void collect(int otherKey, std::vector<Person*>& list);
    float childX() const;
    float heightOf(int count) const;
    Point slot(int generation, int index) const;
    void placeParents(Person& person, int generation, int index);
    void placeParent(Person& parent, int generation, int index);

    void addFocusLines();
    void addSpouseLines();
    int spouseLineStep() const;
    void addChildLine(Person& child, Person& spouse);
    void addParentLines(Person& person);
    void addCoupleLines(Person& person, Person& father, Person& mother);
    void addLoneParentLines(Person& person, Person& parent);

    void flagHiddenRelatives();
    void flagParentsWithOtherChildren(Person& person);
    void flagChild(Person& child);
    void flagChildByParents(Person& parent, Person& child);
    bool isOfShownCouple(const Person& parent, int father, int mother) const;
    bool hasHiddenParent(Person& parent, int father, int mother);
    void flagSpouses(Person& person);
    bool hidesChildOf(Person& spouse);
};

}  // namespace plain
