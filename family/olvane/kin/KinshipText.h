// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

#include <olvane/Export.h>
#include <olvane/kin/Kinship.h>
#include <olvane/kin/Language.h>

namespace olvane::kin {

// What B is to A, in words: "second cousin once removed", "half sister", "wife and first cousin, in 2 ways".
// A near relation over marriages comes before a farther one by blood; an adoptive one is named as such.
// Empty where there is no way at all.
OLVANE_API std::string kinshipText(const KinGraph& graph, const Kinship& kinship, Language language);

// What B is to A by this way alone: "great-uncle (mother's side)".
OLVANE_API std::string wayText(const KinGraph& graph, const KinWay& way, Language language);

// "wife's sister"; of a way of many steps only how many there are.
OLVANE_API std::string wayText(const KinGraph& graph, const MarriageWay& way, Language language);

}  // namespace olvane::kin
