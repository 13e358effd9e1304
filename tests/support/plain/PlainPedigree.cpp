// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The pedigree view of the plain layout: where everybody stands, and who has relatives that the chart leaves
// out. Slow and plain on purpose; it is compared with the engine on random families. Slot numbers wrap as
// 32-bit numbers, since a lone line of mothers doubles them once a generation.

#include <support/plain/PlainPedigree.h>

#include <algorithm>
#include <cmath>

namespace plain {

void PedigreeLayouter::layOut() {
    shown.clear();
    focus.corner = Point{size.nodeWidth * 0.5F, 0.0F};
    shown[focus.key] = true;
    placeFocusFamily();
    placeParents(focus, 0, 0);
    addFocusLines();
    addParentLines(focus);
    flagHiddenRelatives();
}

void PedigreeLayouter::walkFrom(Person& person, const Visit& visit) {
    visit(person);
    const Visit follow = [&](Person& relative) { walkFrom(relative, visit); };
    forEach(person.parents, follow);
    forEach(person.spouses, follow);
    forEachChild(person, false, follow);
}

void PedigreeLayouter::placeFocusFamily() {
    addSpouses(focus);
    addAllChildren(focus);
    forEachChild(focus, true, [this](Person& child) { shown[child.key] = true; });
    float childTop = focus.corner.y + size.vertPadding;
    if (!focus.spouses.empty()) childTop = placeSpousesAndTheirChildren();
    placeUnknownChildren(childTop);
}

// One stack of children, those of the preferred spouse level with the middle of the couple. Returns the top
// of the stack, its starting value where it holds nobody.
float PedigreeLayouter::placeSpousesAndTheirChildren() {
    Person& preferred = *focus.spouses.front();
    preferred.corner = Point{focus.corner.x, focus.corner.y + size.nodeHeight + size.vertPadding};

    std::vector<Person*> stack;
    collect(preferred.key, stack);
    const float blockHeight = heightOf(static_cast<int>(stack.size()));
    const float childTop = focus.corner.y + size.nodeHeight + size.vertPadding * 0.5F - blockHeight * 0.5F;

    const SpouseBlocks blocks = otherSpouses(preferred);
    for (const auto& block : blocks) stack.insert(stack.end(), block.second.begin(), block.second.end());
    const float stepY = size.nodeHeight + size.vertPadding;
    float nextChildY = childTop;
    for (Person* child : stack) {
        child->corner = Point{childX(), nextChildY};
        nextChildY += stepY;
    }
    placeOtherSpouses(blocks, preferred);
    return stack.empty() ? focus.corner.y + size.vertPadding : childTop;
}

// A second node of the preferred spouse is none of them and stays where it is.
PedigreeLayouter::SpouseBlocks PedigreeLayouter::otherSpouses(const Person& preferred) {
    SpouseBlocks blocks;
    forEach(focus.spouses, [&](Person& spouse) {
        if (spouse.key == preferred.key) return;
        blocks.emplace_back(&spouse, std::vector<Person*>());
        collect(spouse.key, blocks.back().second);
    });
    return blocks;
}

// Each at least one pitch below the one above, or level with the middle of its own children.
void PedigreeLayouter::placeOtherSpouses(const SpouseBlocks& blocks, const Person& preferred) {
    float spouseY = preferred.corner.y;
    for (const auto& [spouse, children] : blocks) {
        spouseY += size.nodeHeight + size.vertPadding;
        if (!children.empty()) {
            float sum = 0.0F;
            for (const Person* child : children) sum += child->corner.y;
            spouseY = std::max(spouseY, sum / static_cast<float>(children.size()));
        }
        spouse->corner = Point{preferred.corner.x, spouseY};
    }
}

// Above the rest of the stack, one pitch from it.
void PedigreeLayouter::placeUnknownChildren(float childTop) {
    std::vector<Person*> unknown;
    collect(-1, unknown);
    if (unknown.empty()) return;
    float y = childTop - heightOf(static_cast<int>(unknown.size())) - size.vertPadding;
    for (Person* child : unknown) {
        child->corner = Point{childX(), y};
        y += size.nodeHeight + size.vertPadding;
    }
}

void PedigreeLayouter::collect(int otherKey, std::vector<Person*>& list) {
    forEachChildUnder(focus, otherKey, [&](Person& child) {
        shown[child.key] = true;
        list.push_back(&child);
    });
}

float PedigreeLayouter::childX() const {
    return focus.corner.x - size.nodeWidth - size.horzPadding;
}

float PedigreeLayouter::heightOf(int count) const {
    if (count == 0) return 0.0F;
    return static_cast<float>(count) * size.nodeHeight + static_cast<float>(count - 1) * size.vertPadding;
}

// The corner of a slot; column 0 is the focus's.
Point PedigreeLayouter::slot(int generation, int index) const {
    const int slots = cut(std::ldexp(1.0, generation));
    const float top = heightOf(slots) * -0.5F;
    const float column = static_cast<float>(generation);
    const float row = static_cast<float>(index);
    const float x = size.nodeWidth * 0.5F + column * size.nodeWidth + column * size.horzPadding;
    const float y = size.nodeHeight * 0.5F + (row * size.nodeHeight + top) + row * size.vertPadding;
    return Point{x, y};
}

void PedigreeLayouter::placeParents(Person& person, int generation, int index) {
    const int next = generation + 1;
    if (next >= request.maxGenerations) return;
    addParents(person);
    const unsigned firstSlot = 2U * static_cast<unsigned>(index);
    if (person.fatherIndex != -1) placeParent(fatherOf(person), next, static_cast<int>(firstSlot));
    if (person.motherIndex != -1) placeParent(motherOf(person), next, static_cast<int>(firstSlot + 1U));
}

void PedigreeLayouter::placeParent(Person& parent, int generation, int index) {
    shown[parent.key] = true;
    parent.corner = slot(generation, index);
    placeParents(parent, generation, index);
}

// No pass goes over the whole chart: each flag is what the last of these leaves on it.
void PedigreeLayouter::flagHiddenRelatives() {
    flagTopOfTree();
    flagParentsWithOtherChildren(focus);
    forEach(focus.parents, [this](Person& parent) { flagParentsWithOtherChildren(parent); });
    forEachGrandparent(focus, [this](Person& ancestor) { flagParentsWithOtherChildren(ancestor); });
    std::vector<Person*> climbed;
    climb(0, request.maxStackDepth, focus, climbed);
    for (Person* person : climbed) person->visited = false;
    forEachChild(focus, true, [this](Person& child) { flagChild(child); });
    flagSpouses(focus);
}

void PedigreeLayouter::flagParentsWithOtherChildren(Person& person) {
    forEach(person.parents, [&](Person& parent) {
        for (const ChildRecord& record : childRecords(parent)) {
            if (record.key != person.key) parent.flagged = true;
        }
    });
}

void PedigreeLayouter::flagChild(Person& child) {
    readHostSpouses(child);
    if (!child.hostSpouses.empty()) {
        child.flagged = true;
        return;
    }
    child.flagged = !childRecords(child).empty();
    if (!child.flagged) flagChildByParents(focus, child);
}

void PedigreeLayouter::flagChildByParents(Person& parent, Person& child) {
    int father = -1;
    int mother = -1;
    data.parents(child.key, father, mother);
    child.flagged = !isOfShownCouple(parent, father, mother) && hasHiddenParent(parent, father, mother);
}

bool PedigreeLayouter::isOfShownCouple(const Person& parent, int father, int mother) const {
    if (parent.key != mother && parent.key != father) return false;
    for (const auto& spouse : parent.spouses) {
        if (data.isAddNode(spouse->key)) continue;
        if (spouse->key == mother || spouse->key == father) return true;
    }
    return false;
}

bool PedigreeLayouter::hasHiddenParent(Person& parent, int father, int mother) {
    readHostSpouses(parent);
    for (const auto& spouse : parent.hostSpouses) {
        if (father == parent.key && !data.isAddNode(mother)) {
            if (spouse->key != mother) return true;
        } else if (mother == parent.key && !data.isAddNode(father)) {
            if (spouse->key != father) return true;
        }
    }
    if (!data.isAddNode(father) && father != parent.key) return true;
    return !data.isAddNode(mother) && mother != parent.key;
}

// The spouse's children are read whatever the first answer.
void PedigreeLayouter::flagSpouses(Person& person) {
    forEach(person.spouses, [this](Person& spouse) {
        readHostSpouses(spouse);
        const bool flag = countOf(spouse.hostSpouses) > 1 || hasParents(spouse);
        const bool hidden = hidesChildOf(spouse);
        spouse.flagged = flag || hidden;
    });
}

bool PedigreeLayouter::hidesChildOf(Person& spouse) {
    for (const ChildRecord& record : childRecords(spouse)) {
        if (shown.count(record.key) == 0) return true;
    }
    return false;
}

}  // namespace plain
