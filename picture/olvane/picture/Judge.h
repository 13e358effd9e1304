// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <vector>

#include <olvane/picture/Picture.h>

namespace olvane::picture {

enum class FindingKind : std::uint8_t { overlap, hit, crossing, track, touch, unjoined };

// One thing that a count counts. overlap: two boxes; hit: a family and the box that its line runs through;
// crossing, track, touch: two families; unjoined: a family and the member's box.
struct Finding {
    FindingKind kind = FindingKind::overlap;
    Index one = kNone;
    Index other = kNone;

    bool operator==(const Finding&) const = default;
};

// What is counted in a picture, and what it measures.
//
// Units: counts; area in boxes of mean size for each person, line lengths in mean box widths.
struct Judgement {
    std::size_t boxes = 0;
    std::size_t persons = 0;   // with one box or more
    std::size_t families = 0;  // as listed

    std::size_t overlaps = 0;   // pairs of boxes whose insides meet
    std::size_t hits = 0;       // pairs of a family and a box of nobody in it that a line runs through
    std::size_t crossings = 0;  // pairs of families whose lines cross at an inner point of both
    std::size_t tracks = 0;     // pairs of families with parallel pieces that run beside one another
    std::size_t touches = 0;    // pairs of families where a piece of one ends on a piece of the other
    std::size_t unjoined = 0;   // members whom their family's connected lines do not reach
    std::optional<std::size_t> untold;  // known relations that nothing expresses; needs what is known

    std::size_t couples = 0;     // pairs of parents' boxes, each once
    std::size_t sideBySide = 0;  // those that stand side by side
    std::size_t repeats = 0;     // persons with more than one box
    std::size_t unmarked = 0;    // those of them of whom a box has no samePerson mark
    std::size_t slanted = 0;     // pieces neither horizontal nor vertical; 0 in a round chart
    std::size_t samePersonMarks = 0;
    std::size_t parentsElsewhereMarks = 0;
    std::size_t partnersElsewhereMarks = 0;

    double width = 0;  // of boxes and lines together, in points
    double height = 0;
    double areaPerPerson = 0;
    double aspect = 0;  // width to height; 0 for a picture without height
    double medianLineLength = 0;
    double longLineLength = 0;  // the 95th percentile

    bool operator==(const Judgement&) const = default;
};

// Counts everything that can be counted in one picture. Distances: a line runs through a box when it is more
// than half a point inside; pieces are on one track when they are less than 2 points apart for more than 2
// points; a piece ends on another when its end is less than 2 points away, outside the boxes that both
// families share; what is at most half a point apart is joined. In a round chart, members are joined as well
// where their cells border on one another in neighbouring rings, and lines through cells are not counted.
//
// known: who is related to whom, for untold; without it untold is not set.
// findings: where not null, gets what overlaps, hits, crossings, tracks, touches and unjoined count, sorted.
// Time: a plane sweep, O((n + k) log n) for n boxes and pieces of which k pairs are close to one another.
Judgement judge(const Picture& picture, const kin::KinGraph* known = nullptr,
                std::vector<Finding>* findings = nullptr);

// The share of the persons in both pictures whose box stands elsewhere relative to the focus, by more than
// half a point in x or y. Of several boxes the first counts. 0 where nobody is in both.
double movedShare(const Picture& before, const Picture& after);

}  // namespace olvane::picture
