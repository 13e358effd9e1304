// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <vector>

#include <olvane/draw/DrawingShape.h>
#include <olvane/host/LayoutText.h>

namespace olvane::draw {

// A line that joins a family's trunk to a parent (or to the parents' marriage line) or to a child.
//
// Units: points. at counts along the trunk, end across it: x and y in a downward layout, y and x in a
//        sideways one.
struct FamilyTap {
    int at = 0;
    int end = 0;
    // The child's record, for the tap of a child; kNoRecord for the parents' one.
    std::size_t childRecord = 0;

    static constexpr std::size_t kNoRecord = static_cast<std::size_t>(-1);
    bool operator==(const FamilyTap&) const = default;
};

// The lines between one couple, or one parent, and their children: a trunk with taps.
struct FamilyLine {
    int trunk = 0;                // where the trunk runs, across its own direction
    int joint = 0;                // where the parents' tap meets it, along its direction
    std::vector<FamilyTap> taps;  // each once

    // The span of the trunk that its taps need.
    int first() const;
    int last() const;
};

// The line of a couple, between two boxes.
struct MarriageLine {
    LayoutSegment segment;
    std::size_t from = 0;                   // record that holds it
    std::size_t to = FamilyTap::kNoRecord;  // record of the spouse, where one is met
};

// All lines of a layout, each once, with what they join.
struct LayoutLines {
    std::vector<FamilyLine> families;
    std::vector<MarriageLine> marriages;
    std::vector<LayoutSegment> others;  // segments that fit neither shape; drawn as they are
};

// Sorts the segments of all records into families and marriages. Families come in the order in which the
// records first name them. Fails: never; what is not recognised goes to others.
LayoutLines collectLines(const std::vector<LayoutRecord>& records, LineDirection direction,
                         const BoxSize& box);

}  // namespace olvane::draw
