// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/KinGraph.h>
#include <olvane/kin/Lives.h>

namespace olvane::gedcom {

// The years that a date may stand for; all of them for a date that was not read.
kin::Years yearsOf(const GedcomDate& date);

// The years of the persons and unions of a file. graph is kinGraphOf(data).
kin::Lives livesOf(const GedcomData& data, const kin::KinGraph& graph);

}  // namespace olvane::gedcom
