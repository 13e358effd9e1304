// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines of the pedigree view as the plain layout draws them: marriage lines run down from the upper box,
// a child's line leaves toward the left, and a person's own parents are reached from its right edge.
//
//                 +--[father]      MY is the middle of the marriage line
//      [person]---+     |          MX the middle of the gap
//                 +-----| MY
//                    [mother]

#include <support/plain/PlainPedigree.h>

#include <algorithm>
#include <cstdint>

namespace plain {

namespace {

// Half of the sum, toward zero, for any two ints.
float middleOf(float y1, float y2) {
    const std::int64_t sum = std::int64_t{cut(y1)} + std::int64_t{cut(y2)};
    return static_cast<float>(static_cast<int>(sum / 2));
}

int wrappingSum(int a, int b) {
    return static_cast<int>(static_cast<unsigned>(a) + static_cast<unsigned>(b));
}

}  // namespace

void PedigreeLayouter::addFocusLines() {
    addSpouseLines();
    forEachChildAndSpouse(focus, [this](Person& child, Person& spouse) { addChildLine(child, spouse); });
}

// The first line hangs at the inset, each further one a step to its right.
void PedigreeLayouter::addSpouseLines() {
    int inset = cut(size.lineInset);
    const int step = spouseLineStep();
    forEach(focus.spouses, [&](Person& spouse) {
        const float x = cutPoint(focus.corner.x + static_cast<float>(inset));
        const float y1 = cutPoint(focus.corner.y + size.nodeHeight);
        const float y2 = cutPoint(spouse.corner.y);
        const Segment marriage{x, y1, x, y2, true};
        focus.segments.push_back(marriage);
        addSpouseLine(focus, spouse.key, marriage);
        spouseEdge(focus, spouse, Line({{x, y1}, {x, y2 + size.vertPadding * -0.5F}, {x, y2}}));
        inset = wrappingSum(inset, step);
    });
}

// So small that all lines fit the box. Without spouses nobody reads it.
int PedigreeLayouter::spouseLineStep() const {
    if (focus.spouses.empty()) return cut(size.spouseLineStep);
    const float fitting = (size.nodeWidth - size.lineInset) / static_cast<float>(focus.spouses.size());
    return cut(std::min(fitting, size.spouseLineStep));
}

void PedigreeLayouter::addChildLine(Person& child, Person& spouse) {
    const bool lone = spouse.key == focus.key;
    Line line;
    float junctionX = 0.0F;
    float junctionY = 0.0F;
    if (lone) {
        junctionY = spouse.corner.y + size.nodeHeight * 0.5F;
        junctionX = spouse.corner.x + size.horzPadding * -0.25F;
        addSegment(spouse, line, Segment{spouse.corner.x, junctionY, junctionX, junctionY, false});
    } else {
        junctionY = spouse.corner.y + size.vertPadding * -0.5F;
        junctionX = spouse.corner.x + size.horzPadding * -0.5F;
        const float lineX = spouseLine(focus, spouse.key).x1;
        addSegment(spouse, line, Segment{lineX, junctionY, junctionX, junctionY, false});
    }
    const float childY = cutPoint(child.corner.y + size.nodeHeight * 0.5F);
    addSegment(child, line, Segment{junctionX, childY, junctionX, junctionY, false});
    addSegment(child, line, Segment{child.corner.x + size.nodeWidth, childY, junctionX, childY, false});
    if (lone) {
        focus.generationEdges.push_back(GenerationEdge{line, &child, &focus});
    } else {
        spouseEdge(spouse, focus, Line()).childEdges.push_back(GenerationEdge{line, &child, nullptr});
    }
}

void PedigreeLayouter::addParentLines(Person& person) {
    const bool hasFather = person.fatherIndex != -1;
    const bool hasMother = person.motherIndex != -1;
    if (hasFather && hasMother) {
        addCoupleLines(person, fatherOf(person), motherOf(person));
    } else if (hasFather || hasMother) {
        addLoneParentLines(person, hasFather ? fatherOf(person) : motherOf(person));
    }
}

// The line is kept under a key made of its own x, with its numbers turned about: readers of the lists of
// lines see exactly this.
void PedigreeLayouter::addCoupleLines(Person& person, Person& father, Person& mother) {
    const float x = cutPoint(father.corner.x + size.lineInset);
    const float y1 = cutPoint(father.corner.y + size.nodeHeight);
    const float y2 = cutPoint(mother.corner.y);
    father.segments.push_back(Segment{x, y1, x, y2, true});
    addSpouseLine(father, cut(x), Segment{y1, x, y2, 1.0F, true});
    const Line marriage({{x, y1}, {x, y2 + size.vertPadding * -0.5F}, {x, y2}});
    SpouseEdge& couple = spouseEdge(father, mother, marriage);

    const float middleY = middleOf(y1, y2);
    const float middleX = cutPoint((father.corner.x + person.corner.x + size.nodeWidth) * 0.5F);
    const float personY = cutPoint(person.corner.y + size.nodeHeight * 0.5F);
    const float personRight = cutPoint(person.corner.x + size.nodeWidth);
    Line line;
    addSegment(person, line, Segment{x, middleY, middleX, middleY, false});
    addSegment(person, line, Segment{middleX, middleY, middleX, personY, false});
    addSegment(person, line, Segment{middleX, personY, personRight, personY, false});
    couple.childEdges.push_back(GenerationEdge{line, &person, nullptr});

    addParentLines(father);
    addParentLines(mother);
}

void PedigreeLayouter::addLoneParentLines(Person& person, Person& parent) {
    const float parentY = cutPoint(parent.corner.y + size.nodeHeight * 0.5F);
    const float parentX = cutPoint(parent.corner.x);
    const float stubX =
        cutPoint(static_cast<double>(size.horzPadding) * -0.25 + static_cast<double>(parentX));
    const float personY = cutPoint(person.corner.y + size.nodeHeight * 0.5F);
    const float personRight = person.corner.x + size.nodeWidth;
    Line line;
    addSegment(parent, line, Segment{parentX, parentY, stubX, parentY, false});
    addSegment(person, line, Segment{stubX, personY, stubX, parentY, false});
    addSegment(person, line, Segment{personRight, personY, stubX, personY, false});
    parent.generationEdges.push_back(GenerationEdge{line, &person, &parent});

    addParentLines(parent);
}

}  // namespace plain
