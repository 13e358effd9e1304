// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/kin/Family.h>

namespace olvane {

// How far a host is asked. Generations count from the focus; a generation of 0 asks no further.
struct ReachAround {
    int up = 4;    // generations of ancestors
    int down = 4;  // generations of descendants
    int downBeside =
        0;  // generations of descendants of each ancestor: 1 siblings, aunts and uncles; 2 cousins and so on
    bool spouses = true;  // of everybody who is reached; a spouse's own relatives are not asked for
    bool everybody =
        false;  // everyone who is connected with the focus by any links, whatever the numbers above say
    std::size_t mostPersons = 1000000;
};

// The family around one person, asked of a host: for charts and kinship of data that lie elsewhere. Nobody is asked
// about twice, and nobody beyond the reach.
//
// Holds: persons stand in the order in which they are met, the focus first. A parent who is beyond the reach is
//        unknown in the table; lists keep those who are in reach. A person listed twice is listed once.
// Fails: FamilyError for a focus or an answer that is not 1 to 2^31 - 1, by the person who was asked about and the
//        field; std::length_error beyond mostPersons; whatever the host throws.
OLVANE_API Family familyAround(OlvaneViewerManagerWrapProtocol& host, std::int64_t focus,
                               const ReachAround& reach = ReachAround());

}  // namespace olvane
