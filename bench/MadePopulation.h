// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/kin/KinGraph.h>

namespace bench {

// A made-up population of a given size, the same on every machine: people along a street, in generations of which
// no one is wider than a few thousand. They marry somebody who was born near them, one in ten twice, and have two
// or three children on the average; one in four of those who marry comes from elsewhere.
olvane::kin::KinGraph madePopulation(int persons);

}  // namespace bench
