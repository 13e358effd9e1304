// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <ostream>
#include <vector>

#include <olvane/graph/TreeLine.h>
#include <olvane/graph/TreeViewPerson.h>
#include <olvane/layouter/TreeSize.h>

// Comparable and printable pictures of what a layouter drew, in points. Numbers compare exactly.
namespace views {

struct Point {
    float x;
    float y;
    bool operator==(const Point&) const = default;
};
std::ostream& operator<<(std::ostream& out, const Point& point);
typedef std::vector<Point> Course;

struct Segment {
    float x1;
    float y1;
    float x2;
    float y2;
    bool isSpouseLine = false;
    bool operator==(const Segment&) const = default;
};
std::ostream& operator<<(std::ostream& out, const Segment& segment);
typedef std::vector<Segment> Segments;

// Fields of (55, 80, 25, 30, 10, 0): the sizes that all worked figures rest on.
inline constexpr TreeSize kSizes{55.0f, 80.0f, 25.0f, 30.0f, 10.0f, 0.0f};

Point placeOf(const TreeViewPerson& person);
void place(TreeViewPerson& person, float x, float y);
Segments segmentsOf(const TreeViewPerson& person);
Course courseOf(const TreeLine& line);

// The one edge that the person owns, or the one generation edge on it. Each throws std::runtime_error unless
// there is exactly one.
TreeViewSpouseEdge& onlySpouseEdge(TreeViewPerson& person);
TreeViewGenerationEdge& onlyGenerationEdge(TreeViewPerson& person);
// The children's edges that hang from a couple, in order.
std::vector<TreeViewGenerationEdge*> childEdgesOf(TreeViewSpouseEdge& couple);

// The keys that a walk visits, in order.
std::vector<int> keysOf(const TreeViewPerson::Iterator& walk);

}  // namespace views
