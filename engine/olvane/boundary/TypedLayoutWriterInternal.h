// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane/Export.h>
#include <olvane/boundary/TypedLayout.h>
#include <olvane/boundary/ViewerGlue.h>
#include <olvane/layouter/LineRecordInternal.h>
#include <olvane/layouter/TreeViewLayouter.h>

namespace olvane {

// Fills the typed layout, and its text too if asked to, from a layouter that has run with this record.
// Fails: as resultWriter, with what was written so far in the result.
OLVANE_API void writeTypedLayout(SharedTreeViewer::TreeViewLayouter& layouter, ViewerGlue& glue,
                                 const SharedTreeViewer::LineRecord& record, bool withText,
                                 TypedLayout& result);

}  // namespace olvane
