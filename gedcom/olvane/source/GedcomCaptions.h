// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/kin/PersonCaption.h>

namespace olvane::gedcom {

// What is written of each person of a file, by place: the first name, and the years of birth and death.
//
// Holds: names longer than kMostCaptionBytes are cut, in whole characters.
constexpr std::size_t kMostCaptionBytes = 200;
std::vector<kin::PersonCaption> captionsOf(const GedcomData& data);

}  // namespace olvane::gedcom
