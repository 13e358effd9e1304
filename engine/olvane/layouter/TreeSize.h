// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

// The sizes of the drawing, in points. Every formula reads these fields; none holds a literal size.
struct TreeSize {
    float nodeWidth;       // of one person's box
    float nodeHeight;      // of one person's box
    float horzPadding;     // gap between boxes of a row
    float vertPadding;     // gap between generations
    float spouseLineStep;  // between the stacked lines of one person's marriages
    float lineInset;       // of a marriage line from a box's left edge; read by the pedigree lines alone
};
