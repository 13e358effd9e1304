// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <cstdint>
#include <utility>
#include <vector>

#include <olvane/charts/EverybodyLayoutInternal.h>
#include <olvane/charts/EverybodyMarksInternal.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

using kin::at;

// What lies between a row and the first track under it, and between two tracks; and the steps in which gaps grow,
// so that one more bar more seldom moves all that lies below. Units: points.
struct TrackSizes {
    double margin = 9;
    double gap = 4;
    double step = 24;
};

// How near to the side of its box a line may end. In points.
constexpr double kBoxMargin = 5;

// Places one part of the family and routes its lines: the steps of layOut(), in their order. Used for one layOut() only.
class PartLayouter {
public:
    PartLayouter(PartLayout& layout, const BoxSizes& boxes, const EverybodyOptions& options,
                 const EarlierPicture* earlier);

    void layOut();

private:
    // EverybodyLayout.cpp
    void report(ChartStep step, double share = 0) const;
    void measureChains();
    void place();
    bool placeAsBefore();
    std::vector<double> boxWidths() const;
    LineRoom roomForLines() const;
    double boxEndRoom(std::int32_t person) const;
    double coupleEndRoom() const;

    // EverybodyLayoutOrder.cpp: the order in the rows, and which links become marks.
    void orderRows(const std::vector<std::int32_t>& unfolded);
    void fold();
    void drawFree();
    void fromAllMarks(const std::vector<std::int32_t>& unfolded, const MarkedLinks& forced);
    void exchangeMarks(std::int32_t lines, const MarkedLinks& forced);
    static std::int32_t marksIn(const MarkedLinks& marked);
    void rebuildRows();
    std::vector<double> placesIn(const Rows& rows) const;
    static std::int32_t passAt(const Rows& rows, std::int32_t u, std::int32_t row);
    std::int64_t levelEffort() const { return 20'000'000 + 40 * std::int64_t{layout_.part.personCount()}; }
    std::int64_t orderEffort() const;
    int starts() const;

    // EverybodyLayoutEnds.cpp: where lines end at boxes, and how far they may be moved there.
    struct BoxPlace {
        double left;
        double right;
    };
    void measureEnds();
    BoxPlace boxPlace(std::int32_t person) const;
    std::vector<EndRange> endRanges() const;
    void givePassesRoom(const std::vector<std::int32_t>& nodes, std::vector<EndRange>& ranges) const;
    void spreadEnds(std::int32_t chain, std::vector<EndRange>& ranges) const;
    std::pair<double, double> otherSide(std::int32_t e, const std::vector<EndRange>& ranges) const;

    // EverybodyLayoutHeights.cpp: rows and the gaps between them, from top to bottom.
    void stackRows();
    double gapHeight(std::int32_t gap, double used) const;
    double heightBefore(std::int32_t gap) const;

    PartLayout& layout_;
    const BoxSizes& boxes_;
    const EverybodyOptions& options_;
    const EarlierPicture* earlier_;
    std::vector<double> middleBefore_;  // by row, in an earlier picture whose places are kept
    TrackSizes tracks_;
};

}  // namespace olvane::charts
