// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines of the family view as the plain layout draws them: first every marriage line, then from each
// person to its children, its siblings and its parents. A box covers its corner to corner + size; a drop
// hangs down from a marriage line or from a lone parent, a bar runs sideways, a stem ends on the child's top.
//
//      [husband]--+--[wife]        + dropX
//                 |   drop
//           +-----+   busY
//           |         stem
//        [child]
//
// A child repeats the drop of its couple: no segment is ever left out.

#include <support/plain/PlainFamily.h>

namespace plain {

namespace {

// Sums that are taken in double before they are narrowed or cut.
double quarterBelow(float padding, float startY) {
    return static_cast<double>(padding) * 0.25 + static_cast<double>(startY);
}

void addCoupleEdge(SpouseEdge& couple, Person& child, const Line& line) {
    couple.childEdges.push_back(GenerationEdge{line, &child, nullptr});
}

void addLoneEdge(Person& holder, Person& parent, Person& child, const Line& line) {
    holder.generationEdges.push_back(GenerationEdge{line, &child, &parent});
}

}  // namespace

// A man's spouses stand to his right and a woman's to her left; their lines step up for him, down for her.
void FamilyLayouter::addSpouseLines(Person& person) {
    const float ownEdgeX = person.male ? size.nodeWidth : 0.0F;
    const float spouseEdgeX = person.male ? 0.0F : size.nodeWidth;
    const float offsetStep = person.male ? -1.0F : 1.0F;
    int offset = lineOffset(countOf(person.spouses), person.male);
    forEach(person.spouses, [&](Person& spouse) {
        const float dropX = person.male ? spouse.corner.x - size.horzPadding * 0.5F
                                        : (spouse.corner.x + size.horzPadding * 0.5F) + size.nodeWidth;
        const float x1 = cutPoint(person.corner.x + ownEdgeX);
        const float y = cutPoint(person.corner.y + size.nodeHeight * 0.5F + static_cast<float>(offset));
        const float x2 = cutPoint(spouse.corner.x + spouseEdgeX);
        person.segments.push_back(Segment{x1, y, x2, y, true});
        spouseEdge(person, spouse, Line({{x1, y}, {dropX, y}, {x2, y}}));
        addSpouseLine(person, spouse.key, Segment{x1, y, x2, y, true});
        offset = cut(size.spouseLineStep * offsetStep + static_cast<float>(offset));
    });
}

// From mid-height to the first marriage line.
int FamilyLayouter::lineOffset(int spouseCount, bool male) const {
    if (spouseCount < 2) return 0;
    const float step = male ? size.spouseLineStep : -size.spouseLineStep;
    if (spouseCount == 2) return cut(step * 0.5F);
    return cut(step * static_cast<float>(spouseCount / 2));
}

void FamilyLayouter::addLines(Person& person) {
    forEachChildAndSpouse(person,
                          [&](Person& child, Person& spouse) { addChildLine(person, child, spouse); });
    forEach(person.siblings, [&](Person& sibling) { addSiblingLine(person, sibling); });
    addParentLines(person);
}

void FamilyLayouter::addChildLine(Person& person, Person& child, Person& spouse) {
    const bool lone = spouse.key == person.key;
    float dropX = 0.0F;
    float startY = 0.0F;
    float busY = 0.0F;
    if (lone) {
        dropX = spouse.corner.x + size.nodeWidth * 0.5F;
        startY = spouse.corner.y + size.nodeHeight;
        busY = static_cast<float>(quarterBelow(size.vertPadding, startY));
    } else {
        dropX = person.male ? spouse.corner.x + size.horzPadding * -0.5F
                            : size.nodeWidth + (spouse.corner.x + size.horzPadding * 0.5F);
        startY = spouseLine(person, spouse.key).y1;
        busY = spouse.corner.y + size.nodeHeight + size.vertPadding * 0.5F;
    }
    Line line;
    addSegment(spouse, line, Segment{dropX, startY, dropX, busY, false});
    addBarAndStem(child, line, dropX, busY);
    if (lone) {
        addLoneEdge(person, person, child, line);
    } else {
        addCoupleEdge(spouseEdge(person, spouse, Line()), child, line);
    }
}

// A sibling without a named parent is a full one and hangs from the couple.
void FamilyLayouter::addSiblingLine(Person& person, Person& sibling) {
    if (sibling.key == person.key) return;
    float dropX = 0.0F;
    float startY = 0.0F;
    float busY = 0.0F;
    Line line;
    if (data.isAddNode(sibling.parentKey)) {
        Person& father = fatherOf(person);
        dropX = size.nodeWidth + (father.corner.x + size.horzPadding * 0.5F);
        startY = cutPoint(father.corner.y + size.nodeHeight * 0.5F);
        busY = cutPoint(father.corner.y + size.nodeHeight + size.vertPadding * 0.5F);
        addSegment(father, line, Segment{dropX, startY, dropX, busY, false});
    } else {
        const bool fathers = person.fatherIndex != -1 && fatherOf(person).key == sibling.parentKey;
        Person& parent = fathers ? fatherOf(person) : motherOf(person);
        dropX = parent.corner.x + size.nodeWidth * 0.5F;
        startY = cutPoint(parent.corner.y + size.nodeHeight);
        busY = loneParentBusY(startY);
        addSegment(parent, line, Segment{dropX, startY, dropX, busY, false});
    }
    addBarAndStem(sibling, line, dropX, busY);
    addSiblingEdge(person, sibling, line);
}

// With both parents drawn even a half sibling's edge hangs on the couple; with one it hangs on the person.
void FamilyLayouter::addSiblingEdge(Person& person, Person& sibling, const Line& line) {
    if (person.fatherIndex != -1 && person.motherIndex != -1) {
        Person& father = fatherOf(person);
        Person& mother = motherOf(person);
        const Line parentsLine = parentsLineSeenBySibling(father, mother);
        addCoupleEdge(spouseEdge(mother, father, parentsLine), sibling, line);
        return;
    }
    const bool fathers = person.fatherIndex != -1 && fatherOf(person).key == sibling.parentKey;
    Person& parent = fathers ? fatherOf(person) : motherOf(person);
    addLoneEdge(person, parent, sibling, line);
}

Line FamilyLayouter::parentsLineSeenBySibling(Person& father, Person& mother) {
    const float fatherRight = father.corner.x + size.nodeWidth;
    const float motherLeft = mother.corner.x;
    const float y = cutPoint(father.corner.y + size.nodeHeight * 0.5F);
    const float dropX = father.male ? mother.corner.x + size.horzPadding * -0.5F
                                    : size.nodeWidth + (mother.corner.x + size.horzPadding * 0.5F);
    const Line fromFather({{fatherRight, y}, {dropX, y}, {motherLeft, y}});
    const Line fromMother({{motherLeft, y}, {dropX, y}, {fatherRight, y}});
    if (!(motherLeft > fatherRight)) return fromFather;
    readHostSpouses(father);
    if (father.hostSpouses.empty()) return fromMother;
    if (father.hostSpouses.front()->key == mother.key) return fromMother;
    return data.isAddNode(mother.key) ? fromMother : fromFather;
}

void FamilyLayouter::addParentLines(Person& person) {
    if (person.parents.empty()) return;
    if (person.parents.size() > 1) {
        addCoupleLines(person, fatherOf(person), motherOf(person));
    } else {
        addLoneParentLines(person, person.fatherIndex != -1 ? fatherOf(person) : motherOf(person));
    }
}

void FamilyLayouter::addCoupleLines(Person& person, Person& father, Person& mother) {
    const float dropX = size.nodeWidth + (father.corner.x + size.horzPadding * 0.5F);
    const float startY = cutPoint(father.corner.y + size.nodeHeight * 0.5F);
    const float busY = cutPoint(father.corner.y + size.nodeHeight + size.vertPadding * 0.5F);
    const float fatherRight = father.corner.x + size.nodeWidth;
    Line line;
    addSegment(father, line, Segment{dropX, startY, dropX, busY, false});
    father.segments.push_back(Segment{fatherRight, startY, mother.corner.x, startY, true});
    spouseEdge(father, mother, Line({{fatherRight, startY}, {dropX, startY}, {mother.corner.x, startY}}));
    addBarAndStem(person, line, dropX, busY);
    addCoupleEdge(spouseEdge(father, mother, Line()), person, line);
}

void FamilyLayouter::addLoneParentLines(Person& person, Person& parent) {
    const float dropX = parent.corner.x + size.nodeWidth * 0.5F;
    const float startY = cutPoint(parent.corner.y + size.nodeHeight);
    const float busY = loneParentBusY(startY);
    Line line;
    addSegment(parent, line, Segment{dropX, startY, dropX, busY, false});
    addBarAndStem(person, line, dropX, busY);
    addLoneEdge(parent, parent, person, line);
}

void FamilyLayouter::addBarAndStem(Person& lower, Line& line, float dropX, float busY) const {
    const float stemX = cutPoint(lower.corner.x + size.nodeWidth * 0.5F);
    addSegment(lower, line, Segment{stemX, busY, dropX, busY, false});
    addSegment(lower, line, Segment{stemX, lower.corner.y, stemX, busY, false});
}

// The sum is cut as a double, before it could be rounded to a float.
float FamilyLayouter::loneParentBusY(float startY) const {
    return cutPoint(quarterBelow(size.vertPadding, startY));
}

}  // namespace plain
