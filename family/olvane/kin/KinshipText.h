// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/Export.h>
#include <olvane/kin/Kinship.h>
#include <olvane/kin/Language.h>

namespace olvane::kin {

// What B is to A, in words: "second cousin once removed", "half sister", "wife and first cousin; related in 2 ways".
// A spouse, a relative in law or a step relative who is a farther relative by blood, too, is named as both; other ways
// over marriages are named where there is none by blood. An adoptive relation is named as such.
// Empty where there is no way at all.
OLVANE_API std::string kinshipText(const KinGraph& graph, const Kinship& kinship, Language language);

// The nearest way alone, for where there is little room: without the side, the number of ways and explanations: "uncle",
// "sister-in-law", "wife".
OLVANE_API std::string shortKinshipText(const KinGraph& graph, const Kinship& kinship, Language language);

// The short text, and after it others in fewer letters for a room that is too narrow for it: with repeated greats counted
// and ordinals as numerals ("3rd great-grandmother", "1st cousin 2× removed"), and at last only how far the relation is
// ("kin, 9th degree", "by marriage (5 links)"). One empty text where there is no way.
OLVANE_API std::vector<std::string> kinshipWordings(const KinGraph& graph, const Kinship& kinship,
                                                    Language language);

// What B is to A by this way alone: "great-uncle (mother's side)".
OLVANE_API std::string wayText(const KinGraph& graph, const KinWay& way, Language language);

// "wife's sister"; of a way of many steps only how many there are.
OLVANE_API std::string wayText(const KinGraph& graph, const MarriageWay& way, Language language);

}  // namespace olvane::kin
