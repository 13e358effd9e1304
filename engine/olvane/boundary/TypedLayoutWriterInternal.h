// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/boundary/TypedLayout.h>
#include <olvane/boundary/ViewerGlue.h>
#include <olvane/layouter/LineRecordInternal.h>

namespace olvane {

// Fills the typed layout, and its text too if asked to, from the record of a layouter that has run.
// Fails: as resultWriter, with what was written so far in the result.
OLVANE_API void writeTypedLayout(const ViewerGlue& glue, const SharedTreeViewer::LineRecord& record,
                                 bool withText, TypedLayout& result);

}  // namespace olvane
