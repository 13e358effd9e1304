// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines of one family as an element of their own. The module draws them, with arcs where they jump over another
// family's, and says where the text at the marriage line stands.

import type { PictureLabel } from "olvane";
import { svg } from "../base/dom";
import type { FamilyLines } from "../view/Picture";
import { kLabelSize } from "../view/ViewState";

/** label stands at the marriage line; empty for none. */
export function drawFamily({ index, family, paths }: FamilyLines, label: string): SVGGElement {
    const group = svg("g", { class: "family-lines", "data-family": index });
    for (const { style, data } of paths)
        group.append(svg("path", { class: "line " + style.name, "stroke-dasharray": style.dashes || null, d: data }));
    if (label && family.label) appendLabel(group, family.label, label);
    return group;
}

// Where the picture has room for it.
function appendLabel(group: SVGGElement, { side, textX, textY }: PictureLabel, label: string): void {
    const kind = side === "right" ? "marriage-label upright" : "marriage-label";
    group.append(svg("text", { class: kind, "font-size": kLabelSize, x: textX, y: textY }, label));
}
