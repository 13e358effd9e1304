// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pictures for tests, as the module hands them over.

import type { PictureBox, Picture as PictureValues } from "olvane";

export function box(index: number, id: number, x: number, y: number, more: Partial<PictureBox> = {}): PictureBox {
    return {
        index,
        kind: "person",
        id,
        sex: "other",
        childOf: null,
        x,
        y,
        width: 100,
        height: 80,
        flag: false,
        repeat: 0,
        hidden: { parents: 0, partners: 0, children: 0 },
        furtherParents: 0,
        ...more,
    } as unknown as PictureBox;
}

export function values(boxes: readonly PictureBox[], more: Partial<PictureValues> = {}): PictureValues {
    return {
        boxes,
        families: [],
        marks: [],
        folded: [],
        arcs: [],
        rings: null,
        kinship: null,
        focus: 0,
        ...more,
    } as unknown as PictureValues;
}
