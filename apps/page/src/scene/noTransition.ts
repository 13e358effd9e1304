// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Stands in for d3-transition, which d3-zoom loads to stop transitions that this page never starts.

import { selection } from "d3-selection";

(selection.prototype as unknown as { interrupt: () => unknown }).interrupt = function (this: unknown) {
    return this;
};

export function interrupt(): void {}
