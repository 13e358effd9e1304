// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>
#include <vector>

#include <olvane/Export.h>
#include <olvane/kin/DataCheck.h>

namespace olvane::kin {

// A string of JSON with its quotes. The text is UTF-8.
OLVANE_API std::string jsonText(std::string_view text);

// Remarks as a JSON array, one on each line, with persons by their ids, families by their numbers, and words in English:
//
//   [
//   {"kind": "diedBeforeBirth", "person": 17, "family": null, "text": "Ada Berg died before being born"}]
OLVANE_API std::string remarksJson(const KinGraph& graph, const std::vector<Remark>& remarks,
                                   const RemarkNames& names);

}  // namespace olvane::kin
