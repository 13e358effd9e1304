// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <vector>

#include <olvane/gedcom/GedcomData.h>
#include <olvane/host/LayoutText.h>
#include <olvane/picture/TextSink.h>

#include <cli/LayoutRun.h>

namespace olvane::cli {

// A layout as JSON, each field by name, with what the file states of the persons. Its form is in
// docs/layout.schema.json.
//
// living: whose data are left out, an entry for each person; empty for nobody.
void writeLayoutJson(const gedcom::GedcomData& data, gedcom::PersonId focus, const LayoutRequest& request,
                     const std::vector<LayoutRecord>& records, const std::vector<bool>& living,
                     const picture::TextSink& write);

}  // namespace olvane::cli
