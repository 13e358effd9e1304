// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws the lines of one family as an element of their own: one path for what parents and children share, one for
// each child who came to them otherwise than by birth. Where a line jumps over another family's, it makes an arc.

import type { PictureLabel, PictureLine } from "olvane";
import { svg } from "../base/dom";
import type { FamilyLines } from "../view/Picture";
import { kLabelSize } from "../view/ViewState";

const kBridge = 4; // points, half of what an arc spans

/** label stands at the marriage line; empty for none. */
export function drawFamily({ index, family }: FamilyLines, label: string): SVGGElement {
    const shared: string[] = [];
    const own = new Map<string, string[]>(); // by kind of child
    for (const line of family.lines) {
        const kind = line.child === null ? "birth" : family.childKinds[family.children.indexOf(line.child)];
        if (kind === undefined || kind === "birth" || kind === "unknown") shared.push(pathOf(line));
        else own.set(kind, [...(own.get(kind) ?? []), pathOf(line)]);
    }
    const group = svg("g", { class: "family-lines " + family.style, "data-family": index });
    const marriages = family.lines.filter((line) => line.role === "marriage").map(pathOf);
    const rest = shared.filter((path) => !marriages.includes(path));
    if (marriages.length > 0) group.append(svg("path", { class: "line marriage", d: marriages.join("") }));
    if (rest.length > 0) group.append(svg("path", { class: "line", d: rest.join("") }));
    for (const [kind, paths] of own) group.append(svg("path", { class: "line " + kind, d: paths.join("") }));
    if (label && family.label) appendLabel(group, family.label, label);
    return group;
}

// Where the picture has room for it.
function appendLabel(group: SVGGElement, { side, textX, textY }: PictureLabel, label: string): void {
    const kind = side === "right" ? "marriage-label upright" : "marriage-label";
    group.append(svg("text", { class: kind, "font-size": kLabelSize, x: textX, y: textY }, label));
}

function pathOf({ x1, y1, x2, y2, bridges }: PictureLine): string {
    let path = `M${x1} ${y1}`;
    if (bridges.length > 0) {
        const isLevel = y1 === y2;
        const [from, to] = isLevel ? [x1, x2] : [y1, y2];
        const way = Math.sign(to - from);
        const reach = Math.min(kBridge, Math.abs(to - from) / 2);
        for (const place of [...bridges].sort((a, b) => (a - b) * way)) {
            const [start, end] = [place - way * reach, place + way * reach];
            const sweep = way > 0 ? 1 : 0;
            path += isLevel
                ? `H${start}A${reach} ${reach} 0 0 ${sweep} ${end} ${y1}`
                : `V${start}A${reach} ${reach} 0 0 ${sweep} ${x1} ${end}`;
        }
    }
    return path + `L${x2} ${y2}`;
}
