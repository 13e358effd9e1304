// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <utility>
#include <vector>

namespace plain {

// Cut toward zero. What an int cannot hold becomes the nearest int, and not-a-number becomes 0.
int cut(double value);

// The same as a coordinate again.
inline float cutPoint(double value) {
    return static_cast<float>(cut(value));
}

// A child as a host states it; hostOrder counts from 1, and is 0 for the child of an unknown parent.
struct ChildRecord {
    int key = 0;
    std::string date;
    std::string idText;
    int hostOrder = 0;
};

bool operator<(const ChildRecord& a, const ChildRecord& b);

// A spouse as a host states it; hostOrder counts from 1.
struct SpouseRecord {
    int key = 0;
    bool preferred = false;
    bool alive = false;
    std::string date;
    std::string idText;
    int hostOrder = 0;
};

bool operator<(const SpouseRecord& a, const SpouseRecord& b);

struct Point {
    float x = 0.0F;
    float y = 0.0F;
};

struct Segment {
    float x1 = 0.0F;
    float y1 = 0.0F;
    float x2 = 0.0F;
    float y2 = 0.0F;
    bool isSpouseLine = false;
};

// A course of points, grown at its end by segments that touch it there exactly.
class Line {
public:
    Line() = default;
    explicit Line(std::vector<Point> course) : points(std::move(course)) {}

    // A segment that does not touch the last point is left out.
    void extend(const Segment& segment);

    std::vector<Point> points;
};

struct Person;

struct GenerationEdge {
    Line line;
    Person* child = nullptr;
    Person* singleParent = nullptr;  // null where a couple's edge holds this one
};

struct SpouseEdge {
    Line line;
    Person* person = nullptr;
    Person* spouse = nullptr;
    std::vector<GenerationEdge> childEdges;
};

using People = std::vector<std::shared_ptr<Person>>;
using Visit = std::function<void(Person&)>;
using Walk = std::function<void(const Visit&)>;

// A box of the chart with the relatives that hang from it. Each relative is a node of its own, made for this
// one list: the same human being stands here as often as it was entered.
struct Person {
    int key = -1;
    int parentKey = -1;  // on a half sibling, the parent in common
    bool male = false;
    bool visited = false;
    bool flagged = false;  // the host knows relatives that the chart leaves out
    bool childRecordsRead = false;
    bool hostSpousesRead = false;
    int fatherIndex = -1;  // in parents
    int motherIndex = -1;  // in parents
    float width = 0.0F;    // of the block below this person
    Point corner;          // upper left

    std::set<ChildRecord> childRecords;
    People hostSpouses;  // all that the host knows, drawn or not
    People parents;
    People spouses;
    People siblings;                 // the person's own second node may be among them
    std::map<int, People> children;  // by the other parent's key, -1 for none

    std::vector<Segment> segments;
    std::map<int, std::vector<Segment>> spouseLines;
    std::map<int, std::shared_ptr<SpouseEdge>> ownedEdges;
    std::map<int, std::shared_ptr<SpouseEdge>> unownedEdges;
    std::vector<GenerationEdge> generationEdges;
};

// The parent at the index; std::out_of_range where there is none.
Person& fatherOf(Person& person);
Person& motherOf(Person& person);

Person& addTo(People& list, int key, bool male);

// The sizes as the model counts them.
int countOf(const People& list);
int childCountUnder(Person& person, int key);
int drawnChildCount(Person& person);

void forEach(People& list, const Visit& visit);
void forEachGrandparent(Person& person, const Visit& visit);
void forEachGreatGrandparent(Person& person, const Visit& visit);
void forEachChildUnder(Person& person, int key, const Visit& visit);

// Family by family, the children of an unknown other parent on the person's outer side.
void forEachChild(Person& person, bool withSpousesOwn, const Visit& visit);

// The child with its other parent, or with the person itself where there is none.
void forEachChildAndSpouse(Person& person, const std::function<void(Person&, Person&)>& visit);

// Outward from the person's own node: those before it backwards, then it and those behind it.
void forEachSiblingOutward(Person& person, const Visit& visit);

// The children of the person with the spouse and the spouse's own, in the order in which they are drawn.
void forEachChildOfCouple(Person& person, Person& spouse, const Visit& visit);

void addSegment(Person& holder, Line& line, const Segment& segment);
void addSpouseLine(Person& person, int spouseKey, const Segment& segment);

// Fails with std::out_of_range where no line was laid under the key.
Segment& spouseLine(Person& person, int spouseKey);

// The edge of the two, made with the line unless it is there already.
SpouseEdge& spouseEdge(Person& person, Person& spouse, const Line& line);

}  // namespace plain
