// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/picture/RoutePlanInternal.h>

namespace olvane::picture {

// How many tracks a bar's neighbourhood takes: all bars of its channel that overlap it, directly or over
// others.
struct TrackUse {
    std::vector<std::int32_t> tracks;  // by bar
};

// Puts the bars of every channel on tracks, numbered from the parents' side: bars that overlap never share
// one, and the order has few crossings. most has the number of tracks that each channel has room for; where
// it does not do, bars are packed without regard to crossings, and tracks beyond it may still occur.
TrackUse assignTracks(RoutePlan& plan, const std::vector<std::int32_t>& most);

}  // namespace olvane::picture
