// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <limits>
#include <vector>

#include <olvane/charts/EverybodyPlacesInternal.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// An earlier chart of everybody, as it lies when it runs down.
struct EarlierPicture {
    picture::Picture picture;
    std::vector<picture::Index> boxOf;  // by place in the graph; kNone for who was not in it
};

// The picture with its chart turned so that it runs down.
EarlierPicture earlierPictureOf(const kin::KinGraph& graph, const picture::Picture& picture, bool sideways,
                                bool mirrored);

// A person's box in the earlier picture; nullptr for who is new.
const picture::Box* boxOf(const Component& part, const EarlierPicture& earlier, std::int32_t person);

// A place that is not known is not a number.
constexpr double kUnknown = std::numeric_limits<double>::quiet_NaN();
inline bool isKnown(double place) {
    return place == place;
}

// Whether the persons of a chain stood from right to left.
bool stoodFlipped(const Component& part, const Chains& chains, std::int32_t chain,
                  const EarlierPicture& earlier);

// Where a part stood in an earlier picture.
//
// Units: points.
// Holds: everybody who was there keeps their row, and who is new has one beside their nearest kin. Rows are counted
//        from 0 again.
struct EarlierRows {
    std::vector<std::int32_t> rowOfChain;
    std::vector<double> middle;  // by row: of its boxes, down the picture; not a number for a new row
};

// No rows where fewer than half of the chains were in the earlier picture, or where boxes had other sizes.
EarlierRows rowsAsBefore(const Component& part, const Chains& chains, const EarlierPicture& earlier,
                         const std::vector<double>& widthOf);

// What the earlier picture drew as marks, and nothing else.
void markAsBefore(const Component& part, const EarlierPicture& earlier, MarkedLinks& marked);

// Where each node stood: the left edge of a chain, the line of a pass; not a number for new ones.
std::vector<double> placesAsBefore(const Component& part, const Chains& chains, const Rows& rows,
                                   const EarlierRows& earlierRows, const EarlierPicture& earlier,
                                   const RowSizes& sizes, const std::vector<double>& widthOf);

// The order as before, with new nodes where they cross the fewest lines, and of such places near their kin; and which
// chains stood the other way round. wanted gets a place for every node.
RowOrder orderAsBefore(const Component& part, const Chains& chains, const Rows& rows,
                       const EarlierPicture& earlier, const RowSizes& sizes, std::vector<double>& wanted);

// Places in that order, with the least sum of distances to what is wanted: so everybody stays where there is room, and
// the fewest move where there is none (isotonic regression in the first norm, by pools of adjacent violators with
// their medians: Robertson and Wright 1980).
std::vector<double> placesNear(const Rows& rows, const RowOrder& order, const RowSizes& sizes,
                               const std::vector<double>& wanted, const std::vector<std::uint8_t>& isNew);

}  // namespace olvane::charts
