// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>
#include <vector>

#include <olvane/Export.h>
#include <olvane/kin/DataCheck.h>
#include <olvane/kin/Kinship.h>

namespace olvane::kin {

// A kinship as one line of JSON, with persons by their ids:
//
//   {"a": 52, "b": 113, "words": {"en": "...", "de": "...", "es": "..."}, "phi": 0.0078125, "degree": 7,
//    "blood": [{"up": 3, "down": 4, "half": false, "ancestors": [19, 20], "persons": [52, ...], "words": {...}}],
//    "bloodCount": 1, "legal": [the same with "bond": "adopted"], "legalCount": 0,
//    "marriage": [{"links": 3, "persons": [52, 30, 31, 113], "words": {...}}], "marriageCount": 1}
//
// Numbers that nobody can say are null; behind them, "reason" is "loop" where somebody among the ancestors is their
// own ancestor. Units: phi is written with as few digits as give the same number back.
OLVANE_API std::string kinshipJson(const KinGraph& graph, const Kinship& kinship);

// Remarks as a JSON array, one on each line, with persons by their ids, families by their numbers, and words in English:
//
//   [
//   {"kind": "diedBeforeBirth", "person": 17, "family": null, "text": "Ada Berg died before being born"}]
OLVANE_API std::string remarksJson(const KinGraph& graph, const std::vector<Remark>& remarks,
                                   const RemarkNames& names);

// A string of JSON with its quotes. The text is UTF-8.
OLVANE_API std::string jsonText(std::string_view text);

// The same, behind what is there.
OLVANE_API void appendJsonText(std::string& json, std::string_view text);

}  // namespace olvane::kin
