// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How tests wait: for the thing itself, and so long that only what hangs is given up.

import assert from "node:assert/strict";
import { isDeepStrictEqual } from "node:util";

export const kPatience = 90_000; // ms

/** Waits until what read gives is wanted; fails with what it was at last. */
export async function becomes(read, wanted, message) {
    const end = Date.now() + kPatience;
    for (;;) {
        const found = await read();
        if (isDeepStrictEqual(found, wanted)) return;
        if (Date.now() > end) return assert.deepEqual(found, wanted, message);
        await new Promise((next) => setTimeout(next, 20));
    }
}
