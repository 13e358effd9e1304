// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The nodes of the plain layout and the walks over them. Slow and plain on purpose: every relative is a
// separate object behind a shared pointer, so nothing moves when a list grows, and every question walks the
// lists again. The order of every walk is what the engine is compared with.

#include <support/plain/PlainPerson.h>

#include <cmath>
#include <limits>
#include <stdexcept>

namespace plain {

int cut(double value) {
    if (std::isnan(value)) return 0;
    if (value >= static_cast<double>(std::numeric_limits<int>::max())) return std::numeric_limits<int>::max();
    if (value <= static_cast<double>(std::numeric_limits<int>::min())) return std::numeric_limits<int>::min();
    return static_cast<int>(value);
}

// By key where both have a place in a host's list: a child met earlier stands first, whatever its place.
bool operator<(const ChildRecord& a, const ChildRecord& b) {
    if (a.hostOrder >= 1 && b.hostOrder >= 1) return a.key < b.key;
    if (a.date != b.date) return a.date < b.date;
    if (a.idText != b.idText) return a.idText < b.idText;
    return a.key < b.key;
}

bool operator<(const SpouseRecord& a, const SpouseRecord& b) {
    if (a.hostOrder >= 1 && b.hostOrder >= 1) return a.hostOrder < b.hostOrder;
    if (a.preferred != b.preferred) return a.preferred;
    if (a.alive != b.alive) return a.alive;
    if (a.date != b.date) return b.date < a.date;
    return b.idText < a.idText;
}

void Line::extend(const Segment& segment) {
    const Point first{segment.x1, segment.y1};
    const Point second{segment.x2, segment.y2};
    if (points.empty()) {
        points.push_back(first);
        points.push_back(second);
        return;
    }
    const Point last = points.back();
    if (first.x == last.x && first.y == last.y) {
        points.push_back(second);
    } else if (second.x == last.x && second.y == last.y) {
        points.push_back(first);
    }
}

namespace {

Person& parentAt(Person& person, int index) {
    if (index < 0) throw std::out_of_range("no such parent");
    return *person.parents.at(static_cast<std::size_t>(index));
}

}  // namespace

Person& fatherOf(Person& person) {
    return parentAt(person, person.fatherIndex);
}

Person& motherOf(Person& person) {
    return parentAt(person, person.motherIndex);
}

Person& addTo(People& list, int key, bool male) {
    list.push_back(std::make_shared<Person>());
    list.back()->key = key;
    list.back()->male = male;
    return *list.back();
}

int countOf(const People& list) {
    return static_cast<int>(list.size());
}

int childCountUnder(Person& person, int key) {
    return countOf(person.children[key]);
}

int drawnChildCount(Person& person) {
    int count = 0;
    for (const auto& spouse : person.spouses) count += childCountUnder(person, spouse->key);
    return count + childCountUnder(person, -1);
}

void forEach(People& list, const Visit& visit) {
    const std::size_t count = list.size();
    for (std::size_t i = 0; i < count; ++i) visit(*list[i]);
}

void forEachGrandparent(Person& person, const Visit& visit) {
    forEach(person.parents, [&](Person& parent) { forEach(parent.parents, visit); });
}

void forEachGreatGrandparent(Person& person, const Visit& visit) {
    forEach(person.parents, [&](Person& parent) { forEachGrandparent(parent, visit); });
}

void forEachChildUnder(Person& person, int key, const Visit& visit) {
    forEach(person.children[key], visit);
}

void forEachChild(Person& person, bool withSpousesOwn, const Visit& visit) {
    if (person.male) forEachChildUnder(person, -1, visit);
    forEach(person.spouses, [&](Person& spouse) {
        if (person.male) forEachChildUnder(person, spouse.key, visit);
        if (withSpousesOwn) forEachChildUnder(spouse, -1, visit);
        if (!person.male) forEachChildUnder(person, spouse.key, visit);
    });
    if (!person.male) forEachChildUnder(person, -1, visit);
}

void forEachChildAndSpouse(Person& person, const std::function<void(Person&, Person&)>& visit) {
    const Visit visitOwn = [&](Person& child) { visit(child, person); };
    if (person.male) forEachChildUnder(person, -1, visitOwn);
    forEach(person.spouses, [&](Person& spouse) {
        forEachChildUnder(person, spouse.key, [&](Person& child) { visit(child, spouse); });
    });
    if (!person.male) forEachChildUnder(person, -1, visitOwn);
}

void forEachSiblingOutward(Person& person, const Visit& visit) {
    People& siblings = person.siblings;
    std::size_t own = 0;
    while (own < siblings.size() && siblings[own]->key != person.key) ++own;
    for (std::size_t i = own; i > 0; --i) visit(*siblings[i - 1]);
    for (std::size_t i = own; i < siblings.size(); ++i) visit(*siblings[i]);
}

void forEachChildOfCouple(Person& person, Person& spouse, const Visit& visit) {
    if (person.male) forEachChildUnder(person, spouse.key, visit);
    forEachChildUnder(spouse, -1, visit);
    if (!person.male) forEachChildUnder(person, spouse.key, visit);
}

void addSegment(Person& holder, Line& line, const Segment& segment) {
    holder.segments.push_back(segment);
    line.extend(segment);
}

void addSpouseLine(Person& person, int spouseKey, const Segment& segment) {
    person.spouseLines[spouseKey].push_back(segment);
}

Segment& spouseLine(Person& person, int spouseKey) {
    return person.spouseLines[spouseKey].at(0);
}

SpouseEdge& spouseEdge(Person& person, Person& spouse, const Line& line) {
    const auto unowned = person.unownedEdges.find(spouse.key);
    if (unowned != person.unownedEdges.end()) return *unowned->second;
    const auto owned = person.ownedEdges.find(spouse.key);
    if (owned != person.ownedEdges.end()) return *owned->second;

    const auto edge = std::make_shared<SpouseEdge>();
    edge->line = line;
    edge->person = person.male ? &person : &spouse;
    edge->spouse = person.male ? &spouse : &person;
    spouse.unownedEdges[person.key] = edge;
    person.ownedEdges[spouse.key] = edge;
    return *edge;
}

}  // namespace plain
