// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

#include <olvane/charts/ViewRequest.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

// A place in one of the lists of a Plan; kNone where there is nothing.
using Index = std::int32_t;
constexpr Index kNone = -1;
// In Plan::boxOf: shown, but without a box so far.
constexpr Index kAwaitsBox = -2;

using kin::at;

// How far apart lines of different families run, in points: parallel pieces, and ends of lines on one box.
constexpr double kTrackStep = 5;
constexpr float kLeastLineGap = 3;

// Where two lines from different parents meet the top of one box: so far from its centre on either side, in points,
// if it has this width.
constexpr std::int8_t kStemShift = 6;
constexpr float kLeastWidthForTwoStems = 20;

// How the two partners of a family are joined.
//
//   direct   [A]-+-[B]        over   +-----------+       alone   [A]
//                |                  [A]--[B]    +-[C]             |
//                                        |      |
enum class CoupleLine : std::uint8_t { alone, direct, over };

// A family as it shall be drawn.
//
// Units: points. dropX is where its line to the children leaves, from the left edge of the household.
// Holds: parents[0] is a box; parents[1] is kNone for one shown parent. coupleLine is alone for two parents whose
//        line cannot be drawn: they get a mark, and the children hang from `holder`. Without hasDrop nothing can
//        hang from it. Its links are Plan::links from firstLink to the next family's, children in the order of
//        the data.
struct PlannedFamily {
    kin::UnionPlace u = 0;
    Index parents[2] = {kNone, kNone};
    Index holder = kNone;
    Index household = kNone;
    std::uint32_t firstLink = 0;
    float dropX = 0;
    float departX = 0;  // coupleLine over: where the line leaves the top of its first box, from its centre
    std::uint16_t overHeight = 0;  // coupleLine over: 1 for the line next to the boxes
    std::uint16_t track = 0;       // of the bar, 0 for the one next to the parents
    CoupleLine coupleLine = CoupleLine::alone;
    bool partnersMarked = false;
    bool hasDrop = true;
};

// A child of a family. A link that is not drawn becomes a mark.
//
// Units: shift is where its stem meets the top of the box, from the centre, in points.
struct ChildLink {
    kin::Place child = kin::kNobody;
    bool drawn = false;
    std::int8_t shift = 0;
    kin::ChildKind kind = kin::ChildKind::unknown;
};

// Persons who stand in one row without anybody between them: everybody joined by couples.
//
// Holds: boxes from firstBox to the next household's, left to right; families likewise, by dropX. Households
//        that were reached from this one lie side by side: downFirst to downEnd are led by children, upFirst to
//        upEnd hold parents. It was reached itself through treeFamily and treeChild, from treeParent.
struct Household {
    double x = 0;  // of the left edge
    std::int32_t row = 0;
    float width = 0;
    Index firstBox = 0;
    Index firstFamily = 0;
    Index treeParent = kNone;
    Index treeFamily = kNone;
    Index treeLink = kNone;
    Index downFirst = 0;
    Index downEnd = 0;
    Index upFirst = 0;
    Index upEnd = 0;
    bool isAbove = false;  // reached as parents
};

// Who stands beside whom and who hangs from whom, before anything has a place.
//
// Coordinates are those of a chart that runs down: x along a row, rows below one another. A chart of another
// direction is turned when the picture is made.
// Holds: everybody shown is in exactly one household. Households are listed in the order in which they were
//        reached, so each stands behind its treeParent.
struct Plan {
    std::vector<kin::Place> persons;  // by box
    std::vector<Index> householdOf;   // by box
    std::vector<float> boxX;          // by box: from the left edge of its household
    std::vector<float> boxWidth;      // by box: along the row
    std::vector<bool> isCovered;      // by box: a line over the boxes passes over it
    std::vector<Index> boxOf;         // by person; kNone for who is not shown, less than that before placing
    std::vector<Household> households;
    std::vector<PlannedFamily> families;
    std::vector<ChildLink> links;

    Index boxEnd(Index household) const {
        return at(household) + 1 < households.size() ? households[at(household) + 1].firstBox
                                                     : static_cast<Index>(persons.size());
    }
    Index familyEnd(Index household) const {
        return at(household) + 1 < households.size() ? households[at(household) + 1].firstFamily
                                                     : static_cast<Index>(families.size());
    }
    float centreOf(Index box) const { return boxX[at(box)] + boxWidth[at(box)] / 2; }
    Index childBox(std::uint32_t link) const { return boxOf[at(links[link].child)]; }
    // Where the stem of a link meets its child's box, from the left edge of the child's household.
    double stemX(std::uint32_t link) const {
        return static_cast<double>(centreOf(childBox(link)) + static_cast<float>(links[link].shift));
    }
    std::uint32_t linkEnd(Index family) const {
        return at(family) + 1 < families.size() ? families[at(family) + 1].firstLink
                                                : static_cast<std::uint32_t>(links.size());
    }
};

// Sizes in the coordinates of a Plan.
class PlanSizes {
public:
    explicit PlanSizes(const ChartRequest& request)
        : sizes_(request.sizes),
          boxes_(request.boxSizes),
          sideways_(request.direction == Direction::left || request.direction == Direction::right) {}

    // Along the row.
    float width(kin::Place person) const { return sideways_ ? heightOnPaper(person) : widthOnPaper(person); }
    // From row to row.
    float height(kin::Place person) const { return sideways_ ? widthOnPaper(person) : heightOnPaper(person); }
    // Along the row, of a box without a size of its own.
    float usualWidth() const { return sideways_ ? sizes_.boxHeight : sizes_.boxWidth; }
    float gapX() const { return sizes_.gapX; }
    float gapY() const { return sizes_.gapY; }

    float widthOnPaper(kin::Place person) const {
        return boxes_.empty() ? sizes_.boxWidth : boxes_[at(person)].width;
    }
    float heightOnPaper(kin::Place person) const {
        return boxes_.empty() ? sizes_.boxHeight : boxes_[at(person)].height;
    }

private:
    ChartSizes sizes_;
    std::span<const BoxSize> boxes_;
    bool sideways_;
};

}  // namespace olvane::charts
