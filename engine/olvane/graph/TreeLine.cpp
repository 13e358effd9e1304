// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Polylines: growing one at either end, measuring it, and chaining loose segments into as few lines as the
// rules of joining allow. The chaining walks the loose segments from the first one again after every join;
// the lists are the few segments of one person.

#include <olvane/graph/TreeLine.h>

#include <cmath>
#include <cstddef>
#include <stdexcept>

TreeLine::TreeLine(const std::vector<TreePoint>& points) {
    for (const TreePoint& point : points) pushPointBack(point);
}

TreeLine::TreeLine(std::initializer_list<TreePoint> points) {
    for (const TreePoint& point : points) pushPointBack(point);
}

TreeLine::TreeLine(TreeLineSegment segment) : TreeLine({segment.firstEnd(), segment.secondEnd()}) {}

void TreeLine::pushFarPointBack(TreePoint point) {
    if (far_.empty()) far_.assign(near_, near_ + kUsualPoints);
    far_.push_back(point);
}

void TreeLine::pushPointFront(TreePoint point) {
    std::vector<TreePoint> points = this->points();
    points.insert(points.begin(), point);
    *this = TreeLine(points);
}

void TreeLine::failAsTooShort() {
    throw std::out_of_range("the line is too short");
}

TreeLineSegment TreeLine::frontLineSegment() const {
    const TreePoint from = pointAt(0);
    const TreePoint to = pointAt(1);
    return TreeLineSegment{from.x, from.y, to.x, to.y, false};
}

TreeLineSegment TreeLine::backLineSegment() const {
    const TreePoint from = pointAt(all().size() - 1);
    const TreePoint to = pointAt(all().size() - 2);
    return TreeLineSegment{from.x, from.y, to.x, to.y, false};
}

bool TreeLine::addLineSegmentFront(TreeLineSegment segment) {
    if (nearCount_ == 0) return addLineSegmentBack(segment);
    if (segment.firstEnd() == first()) {
        pushPointFront(segment.secondEnd());
        return true;
    }
    if (segment.secondEnd() == first()) {
        pushPointFront(segment.firstEnd());
        return true;
    }
    return false;
}

float TreeLine::length() {
    if (lengthIsCached) return cachedLength;
    cachedLength = 0.0f;
    const std::span<const TreePoint> points = all();
    for (std::size_t i = 1; i < points.size(); ++i) {
        const float dx = points[i].x - points[0].x;
        const float dy = points[i].y - points[0].y;
        cachedLength += std::sqrt(dx * dx + dy * dy);
    }
    lengthIsCached = true;
    return cachedLength;
}

namespace {

enum class JoinedEnd { none, front, back };

// Where the candidate may join the line. The first end that meets settles it, even when the directions then
// refuse the join: no later end of the same candidate is tried.
JoinedEnd joinedEndFor(const TreeLine& line, const TreeLineSegment& candidate) {
    const auto unlessSame = [](int lineCode, int candidateCode, JoinedEnd end) {
        return lineCode != candidateCode ? end : JoinedEnd::none;
    };
    const TreePoint front = line.first();
    const TreePoint back = line.last();
    if (candidate.firstEnd() == front) {
        return unlessSame(line.frontLineSegment().directionFromX1Y1(), candidate.directionFromX1Y1(),
                          JoinedEnd::front);
    }
    if (candidate.secondEnd() == front) {
        return unlessSame(line.frontLineSegment().directionFromX1Y1(), candidate.directionFromX2Y2(),
                          JoinedEnd::front);
    }
    if (candidate.firstEnd() == back) {
        return unlessSame(line.backLineSegment().directionFromX2Y2(), candidate.directionFromX1Y1(),
                          JoinedEnd::back);
    }
    if (candidate.secondEnd() == back) {
        return unlessSame(line.backLineSegment().directionFromX2Y2(), candidate.directionFromX2Y2(),
                          JoinedEnd::back);
    }
    return JoinedEnd::none;
}

// Joins the first segment that may join, takes it out of the list, and says whether there was one.
bool growByOneSegment(TreeLine& line, std::vector<TreeLineSegment>& segments) {
    for (auto candidate = segments.begin(); candidate != segments.end(); ++candidate) {
        const JoinedEnd end = joinedEndFor(line, *candidate);
        if (end == JoinedEnd::none) continue;
        const bool joined = end == JoinedEnd::front ? line.addLineSegmentFront(*candidate)
                                                    : line.addLineSegmentBack(*candidate);
        if (!joined) {
            throw std::logic_error(
                "logic error: The position returned by find_if should agree with addLine()");
        }
        segments.erase(candidate);
        return true;
    }
    return false;
}

}  // namespace

std::vector<TreeLine> TreeLine::TreeLinesFromLineSegments(std::vector<TreeLineSegment> segments) {
    std::vector<TreeLine> lines;
    while (!segments.empty()) {
        TreeLine line(segments.back());
        segments.pop_back();
        while (growByOneSegment(line, segments)) {
        }
        lines.push_back(line);
    }
    return lines;
}
