// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is drawn of a picture too large to be read: boxes without anything in them, and all lines as one path.

import { svg } from "../base/dom";
import type { FamilyLines, Picture } from "../view/Picture";

/** All boxes of a picture, a path for each sex. */
export function overviewPaths(picture: Picture): SVGPathElement[] {
    const paths = new Map<string, string[]>();
    for (const box of picture.boxes) {
        const { person, sex, x, y, width, height } = box;
        const kind = person ? sex : "missing";
        const list = paths.get(kind) ?? [];
        list.push(box.arc ? box.arc.outline : `M${x} ${y}h${width}v${height}h${-width}z`);
        paths.set(kind, list);
    }
    return [...paths].map(([kind, list]) => svg("path", { class: kind, d: list.join("") }));
}

/** The lines of families, without the arcs of their bridges, which nobody sees from afar: of the screen alone. */
export function farLines(families: readonly FamilyLines[]): SVGPathElement {
    const d = families
        .flatMap(({ family }) => family.lines.map(({ x1, y1, x2, y2 }) => `M${x1} ${y1}L${x2} ${y2}`))
        .join("");
    return svg("path", { class: "line", d });
}
