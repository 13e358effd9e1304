// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/kin/KinGraph.h>
#include <olvane/picture/Picture.h>

namespace olvane::charts {

// Counts the parents, partners and children of a person who are not shown into the person's box. Who would be
// counted over two unions is counted over the first. shown is by person.
void countHiddenRelatives(const kin::KinGraph& graph, kin::Place person, const std::vector<bool>& shown,
                          picture::Box& box);

}  // namespace olvane::charts
