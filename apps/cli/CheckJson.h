// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include <olvane/gedcom/GedcomData.h>

#include <cli/LayoutFindings.h>
#include <cli/RemarkList.h>

namespace olvane::cli {

// A layout that was looked at.
struct CheckedLayout {
    gedcom::PersonId focus = 0;
    LayoutFindings findings;
};

// A check as JSON, of the form of docs/check.schema.json; "layouts" is there if there are any.
std::string checkJson(const gedcom::GedcomData& data, const std::vector<Remark>& remarks,
                      const std::vector<CheckedLayout>& layouts);

}  // namespace olvane::cli
