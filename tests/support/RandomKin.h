// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

#include <olvane/kin/KinGraph.h>

namespace olvane::test {

// A made-up family, the same for the same seed on every machine. A sound one has generations: people marry
// within theirs, once or more often, cousins among them, and children come after their parents. A hostile one is
// unions of anybody with anybody: loops, people who are their own ancestors or partners, children of several
// unions, and parts that are not connected.
kin::KinGraph soundKin(std::uint64_t seed, int persons);
kin::KinGraph hostileKin(std::uint64_t seed, int persons, int unions);

// Most unions of a few persons, and most children a few others: more lines at their boxes than any family has.
kin::KinGraph denseKin(std::uint64_t seed);

}  // namespace olvane::test
