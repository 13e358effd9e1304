// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/Everybody.h>
#include <olvane/charts/EverybodyEarlierInternal.h>
#include <olvane/charts/EverybodyLinesInternal.h>
#include <olvane/charts/EverybodyPlacesInternal.h>

namespace olvane::charts {

// Between the marriage lines of two unions of one couple, and the least between them and the edges of the boxes.
// Units: points.
constexpr double kMarriageGap = 6;
constexpr double kMarriageMargin = 2;

// One part of the family, placed and routed, before it is a picture.
struct PartLayout {
    Component part;
    Chains chains;
    MarkedLinks marked;
    Rows rows;
    RowOrder order;
    RowSizes sizes;
    std::vector<double> left;  // by node
    GapLines lines;
    std::vector<double> rowTop;     // by row
    std::vector<double> rowHeight;  // by row
    std::vector<double> gapTop;     // by gap + 1: where the first track runs
    double width = 0;
    double height = 0;
    double trackGap = 4;         // between two tracks
    std::int32_t marksMade = 0;  // because they were asked for
};

// The sizes of boxes as they lie in a chart that runs down.
struct BoxSizes {
    std::span<const BoxSize> each;  // by place in the graph, or empty
    double boxWidth = 55;
    double boxHeight = 80;
    double gapX = 25;
    double gapY = 30;
    bool turned = false;  // the chart runs sideways: width and height change places

    double width(const Component& part, std::int32_t person) const { return size(part, person, !turned); }
    double height(const Component& part, std::int32_t person) const { return size(part, person, turned); }
    double mostHeight(const Component& part) const {
        double most = 0;
        for (std::int32_t person = 0; person < part.personCount(); ++person) {
            most = height(part, person) > most ? height(part, person) : most;
        }
        return most;
    }

private:
    double size(const Component& part, std::int32_t person, bool wide) const {
        if (each.empty()) return wide ? boxWidth : boxHeight;
        const BoxSize& box = each[static_cast<std::size_t>(part.persons[static_cast<std::size_t>(person)])];
        return double{wide ? box.width : box.height};
    }
};

// earlier: whose places are kept where that is possible; may be null.
PartLayout layOutPart(const Component& part, const BoxSizes& boxes, const EverybodyOptions& options,
                      const EarlierPicture* earlier);

}  // namespace olvane::charts
