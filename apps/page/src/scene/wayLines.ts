// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines of the ways of a kinship, each with a class of its own for its colour and dashes.

import type { PictureWay } from "olvane";
import { svg } from "../base/dom";

const kStyles = 8; // as many as there are in styles/viewer.css

export function wayClass(index: number): string {
    return "way-" + (index % kStyles);
}

// The nearest way last, so on top.
export function drawWays(ways: readonly PictureWay[]): SVGElement[] {
    return ways
        .map(({ lines }, index) =>
            svg("path", {
                class: "way " + wayClass(index),
                d: lines.map(({ x1, y1, x2, y2 }) => `M${x1} ${y1}L${x2} ${y2}`).join(""),
            }),
        )
        .reverse();
}
