// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The engine's own records have no equality that distinguishes spouse lines and cannot be printed; these can.

#include "Drawing.h"

#include <stdexcept>

namespace views {

std::ostream& operator<<(std::ostream& out, const Point& point) {
    return out << "(" << point.x << ", " << point.y << ")";
}

std::ostream& operator<<(std::ostream& out, const Segment& segment) {
    out << "(" << segment.x1 << ", " << segment.y1 << ")-(" << segment.x2 << ", " << segment.y2 << ")";
    return segment.isSpouseLine ? out << " marriage" : out;
}

Point placeOf(const TreeViewPerson& person) {
    return Point{person.getNodeCenter().x, person.getNodeCenter().y};
}

void place(TreeViewPerson& person, float x, float y) {
    person.getNodeCenter().x = x;
    person.getNodeCenter().y = y;
}

Segments segmentsOf(const TreeViewPerson& person) {
    Segments segments;
    for (const TreeLineSegment& from : person.lineSegments) {
        segments.push_back(Segment{from.x1, from.y1, from.x2, from.y2, from.isSpouseLine});
    }
    return segments;
}

Course courseOf(const TreeLine& line) {
    Course course;
    for (const TreePoint& point : line.points()) course.push_back(Point{point.x, point.y});
    return course;
}

TreeViewSpouseEdge& onlySpouseEdge(TreeViewPerson& person) {
    if (person.spouseEdges.size() != 1) throw std::runtime_error("not exactly one owned spouse edge");
    return *person.spouseEdges.begin()->second;
}

TreeViewGenerationEdge& onlyGenerationEdge(TreeViewPerson& person) {
    if (person.generationEdges.size() != 1) throw std::runtime_error("not exactly one generation edge");
    return *person.generationEdges.front();
}

std::vector<TreeViewGenerationEdge*> childEdgesOf(TreeViewSpouseEdge& couple) {
    std::vector<TreeViewGenerationEdge*> edges;
    for (const auto& edge : couple.childEdges) edges.push_back(edge.get());
    return edges;
}

std::vector<int> keysOf(const TreeViewPerson::Iterator& walk) {
    std::vector<int> keys;
    walk([&keys](TreeViewPerson& person) { keys.push_back(person.personId); });
    return keys;
}

}  // namespace views
