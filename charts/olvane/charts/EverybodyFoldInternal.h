// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <vector>

#include <olvane/charts/EverybodyOrderInternal.h>

namespace olvane::charts {

// How rows are folded. width is what each chain takes along its row, with a gap; rowPitch is about what a row
// takes down the picture. Units: points.
struct FoldSizes {
    std::vector<double> width;
    double rowPitch = 110;
    double aspect = 0.75;        // of the picture, that folding stops at
    bool splitSiblings = false;  // the children of one union too, where they alone make a row too wide
};

// The rows again, with wide generations in two or three: of the children of one union all in one row, those of the
// next in the next, as they follow one another in the order; children that are split stand in the rows by turns. Everybody
// stays below their parents.
std::vector<std::int32_t> foldRows(const Rows& rows, const RowOrder& order, const FoldSizes& sizes);

}  // namespace olvane::charts
