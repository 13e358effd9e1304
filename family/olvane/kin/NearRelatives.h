// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <vector>

#include <olvane/Export.h>
#include <olvane/kin/KinGraph.h>

namespace olvane::kin {

// Everybody with whom a person has one of the first parents in common: the father's children first, then those that only the
// mother has, each once.
OLVANE_API std::vector<Place> siblingsOf(const KinGraph& graph, Place person);

// Whom to show first where nobody said: the person with the most relatives near, two generations up and down and across, the
// first of several. Parents count most, so that the picture has all its parts; isNamed says of whom a name is known, and
// a person without any comes behind all others of ordinary families. kNobody in a family of nobody.
OLVANE_API Place bestFocus(const KinGraph& graph, const std::function<bool(Place)>& isNamed);

}  // namespace olvane::kin
