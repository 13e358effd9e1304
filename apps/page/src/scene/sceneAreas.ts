// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which part of the picture must have elements: rectangles in points.

import type { Rectangle } from "../base/SpatialGrid";
import type { Point } from "./Camera";

export function middleOf(area: Rectangle): Point {
    return { x: (area.left + area.right) / 2, y: (area.top + area.bottom) / 2 };
}

/** The least rectangle around both. */
export function unionOf(a: Rectangle, b: Rectangle): Rectangle {
    return {
        left: Math.min(a.left, b.left),
        top: Math.min(a.top, b.top),
        right: Math.max(a.right, b.right),
        bottom: Math.max(a.bottom, b.bottom),
    };
}

/**
 * What of a window has anything in it: nothing stands outside of the picture's bounds, so a window that only reaches beyond
 * them needs nothing new. drawn where that is nothing at all.
 */
export function clipped(window: Rectangle, drawn: Rectangle, bounds: Rectangle): Rectangle {
    const left = Math.max(window.left, bounds.left);
    const top = Math.max(window.top, bounds.top);
    const right = Math.min(window.right, bounds.right);
    const bottom = Math.min(window.bottom, bounds.bottom);
    return left > right || top > bottom ? drawn : { left, top, right, bottom };
}
