// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finds out what each segment of a layout is. The text tells under whose record a segment stands and no more,
// so families are put together by where their pieces meet:
//
//     parents' tap    one segment that ends on the trunk at the joint; held by a parent
//     child's run     along the trunk from the joint to beside the child, then across to the child; held by
//                     the child
//     parents' run    sideways only: from the marriage line to the trunk, along it, then across to the child;
//                     held by the child
//
// All pieces that name the same joint are one family. A segment of marriage runs from box to box, across the
// direction of the taps. Sideways layouts are read with x and y exchanged, so one recognition serves both.

#include <olvane/draw/FamilyLinesInternal.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <map>
#include <tuple>
#include <unordered_map>
#include <utility>

namespace olvane::draw {

namespace {

LayoutSegment turned(const LayoutSegment& s) {
    return {s.y1, s.x1, s.y2, s.x2};
}

bool runsAlong(const LayoutSegment& s) {
    return s.y1 == s.y2;
}
bool runsAcross(const LayoutSegment& s) {
    return s.x1 == s.x2;
}

// Points are hashed by their two halves.
std::uint64_t pointKey(int x, int y) {
    return (static_cast<std::uint64_t>(static_cast<std::uint32_t>(x)) << 32) | static_cast<std::uint32_t>(y);
}

using SegmentKey = std::tuple<int, int, int, int>;
SegmentKey keyOf(const LayoutSegment& s) {
    return {s.x1, s.y1, s.x2, s.y2};
}

// Works in the frame of a downward layout: "along" the trunk is x, "across" is y.
class LineCollector {
public:
    LineCollector(const std::vector<LayoutRecord>& records, LineDirection direction, const BoxSize& box)
        : records_(records), sideways_(direction == LineDirection::sideways), box_(box) {
        for (std::size_t i = 0; i < records.size(); ++i) {
            recordAt_.emplace(pointKey(records[i].x, records[i].y), i);
        }
    }

    LayoutLines collect() {
        for (std::size_t i = 0; i < records_.size(); ++i) collectRecord(i);
        return std::move(lines_);
    }

private:
    void collectRecord(std::size_t record) {
        const std::vector<LayoutSegment>& segments = records_[record].segments;
        std::size_t i = 0;
        while (i < segments.size()) {
            i += sideways_ ? collectSideways(record, segments, i) : collectDownward(record, segments, i);
        }
    }

    // Each collect... takes what stands at place i and answers how many segments that was.
    std::size_t collectDownward(std::size_t record, const std::vector<LayoutSegment>& segments,
                                std::size_t i) {
        if (collectChildRun(record, segments, i)) return 2;
        const LayoutSegment& segment = segments[i];
        if (runsAcross(segment) && segment.y2 >= segment.y1) {
            addParentTap(segment);
        } else if (runsAlong(segment)) {
            addMarriage(record, segment);
        } else {
            addOther(segment);
        }
        return 1;
    }

    std::size_t collectSideways(std::size_t record, const std::vector<LayoutSegment>& segments,
                                std::size_t i) {
        if (collectParentsRun(record, segments, i)) return 3;
        if (collectTurnedChildRun(record, segments, i)) return 2;
        const LayoutSegment& segment = segments[i];
        if (runsAlong(segment)) {
            addParentTap(turned(segment));
        } else if (runsAcross(segment)) {
            addMarriage(record, segment);
        } else {
            addOther(segment);
        }
        return 1;
    }

    // Downward: (stem, trunk) to (joint, trunk), then (stem, child's top) to (stem, trunk).
    bool collectChildRun(std::size_t record, const std::vector<LayoutSegment>& segments, std::size_t i) {
        if (i + 1 >= segments.size()) return false;
        const LayoutSegment& bus = segments[i];
        const LayoutSegment& stem = segments[i + 1];
        const bool meets = runsAlong(bus) && runsAcross(stem) && stem.x2 == bus.x1 && stem.y2 == bus.y1;
        if (!meets || stem.y1 != records_[record].y) return false;
        addChildTap(bus.x2, bus.y2, {stem.x1, stem.y1, record});
        return true;
    }

    // Sideways: (trunk, child) to (trunk, joint), then (child's edge, child) to (trunk, child).
    bool collectTurnedChildRun(std::size_t record, const std::vector<LayoutSegment>& segments,
                               std::size_t i) {
        if (i + 1 >= segments.size()) return false;
        const LayoutSegment bus = turned(segments[i]);
        const LayoutSegment stem = turned(segments[i + 1]);
        const bool meets = runsAlong(bus) && runsAcross(stem) && stem.x2 == bus.x1 && stem.y2 == bus.y1;
        const int edge = records_[record].x + box_.width;
        if (!meets || std::abs(stem.y1 - edge) > 1) return false;
        addChildTap(bus.x2, bus.y2, {stem.x1, stem.y1, record});
        return true;
    }

    // Sideways: (marriage line, middle) to (trunk, middle), (trunk, child), (child's edge, child).
    bool collectParentsRun(std::size_t record, const std::vector<LayoutSegment>& segments, std::size_t i) {
        if (i + 2 >= segments.size()) return false;
        const LayoutSegment tap = turned(segments[i]);
        const LayoutSegment bus = turned(segments[i + 1]);
        const LayoutSegment stem = turned(segments[i + 2]);
        const bool meets = tap.x2 == bus.x1 && tap.y2 == bus.y1 && bus.x2 == stem.x1 && bus.y2 == stem.y1;
        if (!meets || !runsAcross(tap) || !runsAlong(bus) || !runsAcross(stem)) return false;
        addParentTap(tap);
        addChildTap(bus.x1, bus.y1, {stem.x2, stem.y2, record});
        return true;
    }

    FamilyLine& familyOfJoint(int joint, int trunk) {
        const auto [entry, isNew] = familyAt_.emplace(pointKey(joint, trunk), lines_.families.size());
        if (isNew) {
            FamilyLine family;
            family.trunk = trunk;
            family.joint = joint;
            lines_.families.push_back(family);
        }
        return lines_.families[entry->second];
    }

    void addParentTap(const LayoutSegment& tap) {
        addTap(familyOfJoint(tap.x2, tap.y2), {tap.x1, tap.y1, FamilyTap::kNoRecord});
    }

    void addChildTap(int joint, int trunk, const FamilyTap& tap) { addTap(familyOfJoint(joint, trunk), tap); }

    static void addTap(FamilyLine& family, const FamilyTap& tap) {
        const bool isParents = tap.childRecord == FamilyTap::kNoRecord;
        // Every child repeats the parents' tap, and a child's own taps stand together at the end.
        const auto& taps = family.taps;
        const bool known = isParents ? std::find(taps.begin(), taps.end(), tap) != taps.end()
                                     : !taps.empty() && taps.back() == tap;
        if (!known) family.taps.push_back(tap);
    }

    void addMarriage(std::size_t record, const LayoutSegment& segment) {
        if (!seen_.emplace(keyOf(segment), true).second) return;
        lines_.marriages.push_back({segment, record, spouseAtEnd(record, segment)});
    }

    std::size_t spouseAtEnd(std::size_t record, const LayoutSegment& segment) const {
        const LayoutRecord& holder = records_[record];
        return sideways_ ? recordAt(holder.x, segment.y2) : spouseBeside(holder.y, segment.x2);
    }

    // The line ends on the spouse's left or right edge, cut toward zero like the corner itself.
    std::size_t spouseBeside(int y, int edge) const {
        for (const int slack : {0, -1, 1}) {
            for (const int x : {edge + slack, edge - box_.width + slack}) {
                const std::size_t record = recordAt(x, y);
                if (record != FamilyTap::kNoRecord) return record;
            }
        }
        return FamilyTap::kNoRecord;
    }

    std::size_t recordAt(int x, int y) const {
        const auto entry = recordAt_.find(pointKey(x, y));
        return entry == recordAt_.end() ? FamilyTap::kNoRecord : entry->second;
    }

    void addOther(const LayoutSegment& segment) {
        if (seen_.emplace(keyOf(segment), true).second) lines_.others.push_back(segment);
    }

    const std::vector<LayoutRecord>& records_;
    bool sideways_;
    BoxSize box_;
    std::unordered_map<std::uint64_t, std::size_t> recordAt_;
    std::unordered_map<std::uint64_t, std::size_t> familyAt_;
    std::map<SegmentKey, bool> seen_;
    LayoutLines lines_;
};

}  // namespace

int FamilyLine::first() const {
    int least = joint;
    for (const FamilyTap& tap : taps) least = std::min(least, tap.at);
    return least;
}

int FamilyLine::last() const {
    int greatest = joint;
    for (const FamilyTap& tap : taps) greatest = std::max(greatest, tap.at);
    return greatest;
}

LayoutLines collectLines(const std::vector<LayoutRecord>& records, LineDirection direction,
                         const BoxSize& box) {
    return LineCollector(records, direction, box).collect();
}

}  // namespace olvane::draw
