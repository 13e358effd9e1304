// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <span>
#include <vector>

#include <olvane/Export.h>
#include <olvane/graph/TreeLineSegment.h>
#include <olvane/graph/TreePoint.h>

// A polyline that grows at either end. A plain value: a copy is a deep copy.
//
// Units: points. Ends meet only when both coordinates are exactly equal.
// Holds: nothing is allocated when a line moves.
// Fails: the operations that need points on the line (first, last, frontLineSegment, backLineSegment) throw
//        std::out_of_range on a line that is too short.
// NOLINTNEXTLINE(bugprone-exception-escape)
class OLVANE_API TreeLine {
public:
    TreeLine() = default;
    explicit TreeLine(const std::vector<TreePoint>& points);
    explicit TreeLine(std::initializer_list<TreePoint> points);
    explicit TreeLine(TreeLineSegment segment);  // two points: the first end, then the second

    void pushPointBack(TreePoint point) {
        lengthIsCached = false;
        if (nearCount_ == kUsualPoints) return pushFarPointBack(point);
        near_[nearCount_] = point;
        ++nearCount_;
    }
    void pushPointFront(TreePoint point);

    TreePoint first() const { return pointAt(0); }
    TreePoint last() const { return pointAt(all().size() - 1); }

    // The segment from the first point to the second.
    TreeLineSegment frontLineSegment() const;

    // The segment from the last point to the one before it. The order is reversed, unlike at the front, and
    // must stay so: TreeLinesFromLineSegments distinguishes a turn from a straight run by it.
    TreeLineSegment backLineSegment() const;

    // Joins a segment by whichever of its ends lies on the first (or last) point; the first end is tried
    // first. False, and no change, when neither end does. Any segment joins an empty line.
    bool addLineSegmentFront(TreeLineSegment segment);
    bool addLineSegmentBack(TreeLineSegment segment) {
        if (nearCount_ == 0) {
            pushPointBack(segment.firstEnd());
            pushPointBack(segment.secondEnd());
            return true;
        }
        if (segment.firstEnd() == last()) {
            pushPointBack(segment.secondEnd());
            return true;
        }
        if (segment.secondEnd() == last()) {
            pushPointBack(segment.firstEnd());
            return true;
        }
        return false;
    }

    // The sum of the distances of all later points from the FIRST point, not from the point before: for three
    // or more points this is not the length of the polyline. (0,0) (10,0) (10,10) gives 10 + 14.142136. Hosts
    // compare lines by this number, so a corrected sum would rank their lines again. Kept until the next
    // change.
    float length();

    // Chains loose segments into polylines, growing each from the last segment that is left. A candidate that
    // would run back over the front segment is refused, and so is one that runs straight on at the back: the
    // two ends differ, on purpose (see backLineSegment). Lines come in the order in which they were finished.
    // Fails: std::logic_error when a chosen segment does not join; ordinary numbers cannot bring that about.
    static std::vector<TreeLine> TreeLinesFromLineSegments(std::vector<TreeLineSegment> segments);

    std::vector<TreePoint> points() const { return std::vector<TreePoint>(all().begin(), all().end()); }

private:
    const TreePoint& pointAt(std::size_t place) const {
        const std::span<const TreePoint> points = all();
        if (place >= points.size()) failAsTooShort();
        return points[place];
    }
    std::span<const TreePoint> all() const {
        if (!far_.empty()) return far_;
        return {near_, nearCount_};
    }
    void pushFarPointBack(TreePoint point);
    [[noreturn]] static void failAsTooShort();

    static constexpr std::uint8_t kUsualPoints = 4;  // of a drop, a bar and a stem

    // A line that is moved away keeps the points in near_, so it stays whole whatever it had.
    TreePoint near_[kUsualPoints];
    std::vector<TreePoint> far_;  // all points, where near_ is too short for them
    float cachedLength = 0.0f;
    std::uint8_t nearCount_ = 0;
    bool lengthIsCached = false;
};
