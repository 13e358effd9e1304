// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

#include <olvane/Export.h>
#include <olvane/charts/ViewRequest.h>
#include <olvane/layouter/TreeSize.h>

namespace olvane::charts {

// The form of the boxes on paper: tall ones as hosts draw them, or wide ones, which keep a sideways chart low.
enum class BoxForm : std::uint8_t { tall, wide };

// What suits a view: wide boxes where generations stand side by side.
OLVANE_API BoxForm usualBoxForm(View view, Direction direction);

// The same for sheets of paper, of which everybody takes less in wide boxes.
OLVANE_API BoxForm usualBoxFormOnPaper(View view, Direction direction);

// The sizes of the engine's views, in points.
OLVANE_API TreeSize treeSizeOf(BoxForm form);

// Sets all sizes of a request for boxes of a form; its view and its aspect are set before.
OLVANE_API void setBoxForm(ChartRequest& request, BoxForm form);

// Whether wide generations of a view are folded for the paper that it is for: in every view of rows but the engine's own
// and that of kinship.
OLVANE_API bool foldsForPaper(View view);

// Sets a request for paper whose width is `aspect` times its height. The lines of everybody lie closer together on it.
OLVANE_API void foldForPaper(ChartRequest& request, double aspect);

// Lets a pedigree of any number of columns flag those who have ancestors beyond the last one.
OLVANE_API void flagBeyondGenerations(ChartRequest& request);

}  // namespace olvane::charts
