// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The family view of the plain layout: the order of the rings of relatives, the widths of family units, and
// where each person stands. Slow and plain on purpose; it is compared with the engine on random families, so
// the order of every float sum is the order set by the view's rules, and no sum is shared or kept.

#include <support/plain/PlainFamily.h>

#include <algorithm>

namespace plain {

// The focus's own unit is measured and placed before its siblings exist, so that they take no room in it.
void FamilyLayouter::layOut() {
    addFocusFamily();
    addParents(focus);
    measure(focus);
    placeUnit(focus, 0.0F, 0.0F);
    addSiblingRow();
    const float rightEdge = placeSiblings(focus);
    placeAncestors(rightEdge);
    flagHiddenRelatives();
    walk([this](Person& person) { addSpouseLines(person); });
    walk([this](Person& person) { addLines(person); });
}

void FamilyLayouter::walkFrom(Person& person, const Visit& visit) {
    visit(person);
    const Visit follow = [&](Person& relative) { walkFrom(relative, visit); };
    forEach(person.parents, follow);
    forEach(person.spouses, follow);
    forEachChild(person, false, follow);
    forEach(person.siblings, [&](Person& sibling) {
        if (sibling.key != person.key) walkFrom(sibling, visit);
    });
}

void FamilyLayouter::addFocusFamily() {
    addSpouses(focus);
    addAllChildren(focus);
    forEach(focus.spouses, [this](Person& spouse) {
        if (childRecords(spouse).empty()) return;
        readHostSpouses(spouse);
        addChildrenWithoutOther(spouse,
                                [&spouse](const Visit& visit) { forEach(spouse.hostSpouses, visit); });
    });
    if (option("ACTV_Fam_ShowSpousesOfChildren")) {
        forEachChild(focus, true, [this](Person& child) { addSpouses(child); });
    }
    if (option("ACTV_Fam_ShowGrandchildren")) {
        forEachChild(focus, true, [this](Person& child) { addAllChildren(child); });
    }
}

void FamilyLayouter::addSiblingRow() {
    if (option("ACTV_Fam_ShowSiblings")) addSiblings(focus);
    if (option("ACTV_Fam_ShowSiblingSpouses")) {
        forEach(focus.siblings, [this](Person& sibling) {
            if (sibling.key != focus.key) addSpouses(sibling);
        });
    }
    if (option("ACTV_Fam_ShowNeicesNephews")) {
        forEach(focus.siblings, [this](Person& sibling) {
            if (sibling.key != focus.key) addAllChildren(sibling);
        });
    }
}

void FamilyLayouter::placeAncestors(float rightEdge) {
    const float parentY = -size.nodeHeight - size.vertPadding;
    placeAncestorRow([this](const Visit& visit) { forEach(focus.parents, visit); }, parentY, focus.corner.x,
                     countOf(focus.parents));

    forEach(focus.parents, [this](Person& parent) { addParents(parent); });
    const float grandparentY = parentY - size.nodeHeight - size.vertPadding;
    int grandparents = 0;
    forEachGrandparent(focus, [&](Person&) { ++grandparents; });
    placeAncestorRow([this](const Visit& visit) { forEachGrandparent(focus, visit); }, grandparentY,
                     focus.corner.x, grandparents);

    if (option("ACTV_Fam_ShowAuntsUncles")) placeAuntsAndUncles(rightEdge, parentY);
    if (option("ACTV_Fam_ShowGreatGrandparents")) placeGreatGrandparents(grandparentY);
}

void FamilyLayouter::placeAuntsAndUncles(float rightEdge, float parentY) {
    forEach(focus.parents, [this](Person& parent) { addSiblingFamilies(parent); });
    if (focus.fatherIndex != -1) rightEdge = placeFatherSiblings(focus, rightEdge, parentY);
    if (focus.motherIndex != -1) placeMotherSiblings(focus, rightEdge, parentY);
}

void FamilyLayouter::addSiblingFamilies(Person& parent) {
    const bool showCousins = option("ACTV_Fam_ShowCousins");
    addSiblings(parent);
    forEach(parent.siblings, [&](Person& sibling) {
        if (sibling.key == parent.key) return;
        addSpouses(sibling);
        if (showCousins) addAllChildren(sibling);
    });
}

void FamilyLayouter::placeGreatGrandparents(float grandparentY) {
    const float greatY = grandparentY - size.nodeHeight - size.vertPadding;
    forEachGrandparent(focus, [this](Person& grandparent) { addParents(grandparent); });
    int count = 0;
    forEachGreatGrandparent(focus, [&](Person&) { ++count; });
    placeAncestorRow([this](const Visit& visit) { forEachGreatGrandparent(focus, visit); }, greatY,
                     focus.corner.x, count);
}

// A row from 0 to the right, then moved so that its middle lies at centerX.
void FamilyLayouter::placeAncestorRow(const Walk& row, float y, float centerX, int count) {
    if (count == 0) return;
    const float stride = size.nodeWidth + size.horzPadding;
    float x = 0.0F;
    int visited = 0;
    row([&](Person& person) {
        person.corner = Point{x, y};
        ++visited;
        if (visited != count) x += stride;
    });
    const float shift = centerX + x * -0.5F;
    row([&](Person& person) { person.corner.x += shift; });
}

void FamilyLayouter::measure(Person& person) {
    forEach(person.spouses, [&](Person& spouse) { measureSpouse(person, spouse); });
    const float unknown = unknownChildrenWidth(person);
    person.width = size.nodeWidth > unknown ? size.nodeWidth : unknown;
}

// Beside shared children each unknown child takes a gap; alone they take one gap fewer.
void FamilyLayouter::measureSpouse(Person& person, Person& spouse) {
    const int sharedCount = childCountUnder(person, spouse.key);
    if (sharedCount == 0) {
        const float step = stepChildrenWidth(spouse);
        const float below = step + gaps(childCountUnder(spouse, -1));
        spouse.width = coupleWidth() > below ? coupleWidth() : below;
        return;
    }
    const float shared = sharedChildrenWidth(person, spouse);
    const float step = stepChildrenWidth(spouse);
    const int stepCount = childCountUnder(spouse, -1);
    const float stepGaps = stepCount > 0 ? static_cast<float>(stepCount) * size.horzPadding : 0.0F;
    spouse.width = (step + stepGaps) + (gaps(sharedCount) + shared);
}

// An only child that is as narrow as its box is widened to a couple, so that it stands under the middle.
float FamilyLayouter::sharedChildrenWidth(Person& person, Person& spouse) {
    const bool onlyChild = childCountUnder(person, spouse.key) == 1 && childCountUnder(spouse, -1) == 0;
    float shared = 0.0F;
    forEachChildUnder(person, spouse.key, [&](Person& child) {
        measure(child);
        shared = shared + unitWidth(child);
        if (onlyChild && shared == size.nodeWidth) {
            shared = shared + (size.nodeWidth + size.horzPadding);
            child.width = shared;
        }
    });
    return shared;
}

// Only the children's own blocks; their spouses take no room here.
float FamilyLayouter::stepChildrenWidth(Person& spouse) {
    float sum = 0.0F;
    forEachChildUnder(spouse, -1, [&](Person& child) {
        measure(child);
        sum = sum + child.width;
    });
    return sum;
}

float FamilyLayouter::unknownChildrenWidth(Person& person) {
    float unknown = 0.0F;
    forEachChildUnder(person, -1, [&](Person& child) {
        measure(child);
        unknown = unknown + child.width;
        forEach(child.spouses, [&](Person& spouse) {
            unknown = unknown + spouse.width;
            unknown = unknown + size.horzPadding;
        });
    });
    return unknown + gaps(childCountUnder(person, -1));
}

float FamilyLayouter::unitWidth(Person& person) {
    const int spouseCount = countOf(person.spouses);
    if (childCountUnder(person, -1) != 0) {
        float total = person.width;
        forEach(person.spouses, [&](Person& spouse) { total = total + spouse.width; });
        const float spouseGaps = spouseCount >= 1 ? static_cast<float>(spouseCount) * size.horzPadding : 0.0F;
        return spouseGaps + total;
    }
    if (spouseCount == 0) return person.width;
    const float first = person.spouses.front()->width;
    float total = coupleWidth() > first ? coupleWidth() : first;
    for (std::size_t i = 1; i < person.spouses.size(); ++i) total = total + person.spouses[i]->width;
    return gaps(spouseCount) + total;
}

float FamilyLayouter::gaps(int blockCount) const {
    return blockCount < 2 ? 0.0F : static_cast<float>(blockCount - 1) * size.horzPadding;
}

float FamilyLayouter::coupleWidth() const {
    return 2.0F * size.nodeWidth + size.horzPadding;
}

// A person with children of an unknown other parent stands over them, beside all spouses. Without such
// children a man stands with his first spouse, a woman with her last.
void FamilyLayouter::placeUnit(Person& person, float x, float y) {
    const bool standsAlone = childCountUnder(person, -1) > 0;
    if (person.spouses.empty()) {
        placePersonAndUnknownChildren(person, x, y);
    } else if (standsAlone && person.male) {
        placeManBesideSpouses(person, x, y);
    } else if (standsAlone) {
        placeWomanBesideSpouses(person, x, y);
    } else if (person.male) {
        placeManInCouple(person, x, y);
    } else {
        placeWomanInCouple(person, x, y);
    }
}

void FamilyLayouter::placeManBesideSpouses(Person& man, float x, float y) {
    placePersonAndUnknownChildren(man, x, y);
    float nextX = x + man.width + size.horzPadding;
    forEach(man.spouses, [&](Person& spouse) { nextX = placeSpouse(man, spouse, nextX, y); });
}

void FamilyLayouter::placeWomanBesideSpouses(Person& woman, float x, float y) {
    float nextX = x;
    forEach(woman.spouses, [&](Person& spouse) { nextX = placeSpouse(woman, spouse, nextX, y); });
    placePersonAndUnknownChildren(woman, nextX, y);
}

void FamilyLayouter::placeManInCouple(Person& man, float x, float y) {
    Person& first = *man.spouses.front();
    const Walk children = [&](const Visit& visit) { forEachChildOfCouple(man, first, visit); };
    const float width = placeCouple(man, first, children, x, y);
    float nextX = x + width + size.horzPadding;
    for (std::size_t i = 1; i < man.spouses.size(); ++i) nextX = placeSpouse(man, *man.spouses[i], nextX, y);
}

void FamilyLayouter::placeWomanInCouple(Person& woman, float x, float y) {
    float nextX = x;
    for (std::size_t i = 0; i + 1 < woman.spouses.size(); ++i) {
        nextX = placeSpouse(woman, *woman.spouses[i], nextX, y);
    }
    Person& last = *woman.spouses.back();
    placeCouple(
        last, woman, [&](const Visit& visit) { forEachChildOfCouple(woman, last, visit); }, nextX, y);
}

// Returns the width of the couple's span. The children start at its left edge.
float FamilyLayouter::placeCouple(Person& husband, Person& wife, const Walk& children, float x, float y) {
    const double couple = 2.0 * static_cast<double>(size.nodeWidth) + static_cast<double>(size.horzPadding);
    const float width = std::max(std::max(wife.width, husband.width), static_cast<float>(couple));
    centerCouple(husband, wife, width, x, y);
    const float childY = y + size.nodeHeight + size.vertPadding;
    float nextX = x;
    children([&](Person& child) {
        data.touch(child.key);
        placeUnit(child, nextX, childY);
        nextX = nextX + unitWidth(child);
        nextX = nextX + size.horzPadding;
    });
    return width;
}

// A spouse alone over its own block, whose own children stand on the outer side. Returns where the next
// block starts.
float FamilyLayouter::placeSpouse(Person& person, Person& spouse, float x, float y) {
    const Walk shared = [&](const Visit& visit) { forEachChildUnder(person, spouse.key, visit); };
    centerPerson(spouse, spouse.width, x, y);
    const float childY = size.nodeHeight + y + size.vertPadding;
    if (spouse.male) {
        placeChildren(shared, childY, placeUnknownChildren(spouse, x, y));
    } else {
        placeUnknownChildren(spouse, placeChildren(shared, childY, x), y);
    }
    const float end = x + spouse.width;
    return end + size.horzPadding;
}

float FamilyLayouter::placeChildren(const Walk& children, float childY, float x) {
    float nextX = x;
    children([&](Person& child) {
        placeUnit(child, nextX, childY);
        nextX = nextX + unitWidth(child);
        nextX = nextX + size.horzPadding;
    });
    return nextX;
}

float FamilyLayouter::placeUnknownChildren(Person& person, float x, float y) {
    const float childY = y + size.nodeHeight + size.vertPadding;
    return placeChildren([&](const Visit& visit) { forEachChildUnder(person, -1, visit); }, childY, x);
}

float FamilyLayouter::placePersonAndUnknownChildren(Person& person, float x, float y) {
    centerPerson(person, person.width, x, y);
    return placeUnknownChildren(person, x, y);
}

void FamilyLayouter::centerPerson(Person& person, float width, float left, float y) const {
    person.corner = Point{width * 0.5F + left, y};
}

void FamilyLayouter::centerCouple(Person& husband, Person& wife, float width, float left, float y) const {
    const float center = width * 0.5F + left;
    const float half = 0.5F * size.nodeWidth + size.horzPadding * 0.5F;
    husband.corner = Point{center - half, y};
    wife.corner = Point{center + half, y};
}

// Outward to the left until the focus's own node, then from the focus's right edge to the right. Returns
// where a further unit would start.
float FamilyLayouter::placeSiblings(Person& person) {
    float x = 0.0F;
    bool reachedFocus = false;
    forEachSiblingOutward(person, [&](Person& sibling) {
        data.touch(sibling.key);
        if (sibling.key == person.key) {
            reachedFocus = true;
            x = unitWidth(person) + size.horzPadding;
            return;
        }
        measure(sibling);
        if (reachedFocus) {
            placeUnit(sibling, x, 0.0F);
            x = unitWidth(sibling) + x;
            x = x + size.horzPadding;
        } else {
            x = x - unitWidth(sibling) - size.horzPadding;
            placeUnit(sibling, x, 0.0F);
        }
    });
    return x;
}

// The anchor is the left end of the focus's row: a woman's unit ends in a husband there.
float FamilyLayouter::placeFatherSiblings(Person& person, float x, float y) {
    Person& father = fatherOf(focus);
    if (father.siblings.empty()) return x;

    Person* leftmost = nullptr;
    int leftmostX = 0;
    forEach(person.siblings, [&](Person& sibling) {
        if (leftmost != nullptr && !(static_cast<float>(leftmostX) > sibling.corner.x)) return;
        leftmost = &sibling;
        leftmostX = cut(static_cast<double>(sibling.corner.x));
    });
    Person* anchor = leftmost != nullptr ? leftmost : &person;
    data.touch(anchor->key);
    if (!anchor->male && !anchor->spouses.empty()) anchor = anchor->spouses.back().get();

    float nextX = std::min(father.corner.x, anchor->corner.x) + size.nodeWidth * -0.5F;
    for (std::size_t i = father.siblings.size(); i > 0; --i) {
        Person& sibling = *father.siblings[i - 1];
        if (sibling.key == father.key) continue;
        data.touch(sibling.key);
        measure(sibling);
        nextX = nextX - unitWidth(sibling) - size.horzPadding;
        placeUnit(sibling, nextX, y);
    }
    return nextX;
}

// The anchor is the right end of the focus's row: a man's unit ends in a wife there.
float FamilyLayouter::placeMotherSiblings(Person& person, float x, float y) {
    Person& mother = motherOf(focus);
    if (mother.siblings.empty()) return x;

    Person* rightmost = nullptr;
    int rightmostX = 0;
    forEach(person.siblings, [&](Person& sibling) {
        if (rightmost != nullptr && !(sibling.corner.x > static_cast<float>(rightmostX))) return;
        rightmost = &sibling;
        rightmostX = cut(static_cast<double>(sibling.corner.x));
    });
    Person* anchor = rightmost != nullptr ? rightmost : &person;
    if (anchor->male && !anchor->spouses.empty()) anchor = anchor->spouses.back().get();

    const float edge = std::max(mother.corner.x, anchor->corner.x);
    float nextX = edge + size.nodeWidth + (size.horzPadding + size.horzPadding);
    forEach(mother.siblings, [&](Person& sibling) {
        if (sibling.key == mother.key) return;
        measure(sibling);
        placeUnit(sibling, nextX, y);
        nextX = nextX + unitWidth(sibling);
        nextX = nextX + size.horzPadding;
    });
    return nextX;
}

}  // namespace plain
