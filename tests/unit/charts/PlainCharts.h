// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <map>
#include <set>

#include <olvane/charts/Charts.h>

// Who is in a chart and in which generation, found the plain way: sets that grow until nothing is missing. Slow, and
// as near to the words of the rules as can be.
namespace plain {

// The persons of ancestors, descendants, hourglass and relatives, by place.
std::set<olvane::kin::Place> personsOf(const olvane::kin::KinGraph& graph,
                                       const olvane::charts::ChartRequest& request);

// Whom a fan shows. Of ancestors: everybody who is reached over the families that the data name first. Of descendants:
// as the chart of descendants.
std::set<olvane::kin::Place> fanPersonsOf(const olvane::kin::KinGraph& graph,
                                          const olvane::charts::ChartRequest& request);

// Everybody who is linked with the focus over any number of parents, children and partners.
std::set<olvane::kin::Place> connectedWith(const olvane::kin::KinGraph& graph, olvane::kin::Place focus);

// The generations of the charts of ancestors and of descendants, the focus in 0, later ones greater. Everybody who
// is joined by couples shares a generation; each such group stands one below (above) the first group that one of
// its members is a child (parent) of.
std::map<olvane::kin::Place, int> generationsOf(const olvane::kin::KinGraph& graph,
                                                const olvane::charts::ChartRequest& request);

}  // namespace plain
