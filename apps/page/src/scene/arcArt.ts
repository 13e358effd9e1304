// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws one box of a round chart: a piece of a ring with the name in it. Its outline and the places of its texts are the
// module's.

import { svg } from "../base/dom";
import type { Box, BoxArc } from "../view/Picture";
import type { BoxLook } from "./boxArt";

/** The class of a piece's colour, by its line of descent. */
export function lineClass({ colour }: BoxArc): string {
    return colour === null ? "" : "descent-" + colour;
}

export function appendArc(group: SVGGElement, look: BoxLook, box: Box, arc: BoxArc): void {
    const outline = { d: arc.outline, transform: `translate(${-box.x} ${-box.y})` };
    group.append(
        svg("path", {
            class: "frame",
            ...outline,
            role: look.person ? "button" : "img",
            tabindex: -1,
            "aria-label": look.label,
            "aria-current": look.isFocus && "true",
        }),
        // Upon the frame: half of it would lie under the cells beside it.
        svg("path", { class: "ring", ...outline }),
    );
    appendText(group, look, box, arc);
}

function appendText(group: SVGGElement, { texts, name, dates }: BoxLook, box: Box, arc: BoxArc): void {
    const holder = svg("g", { transform: `translate(${arc.middleX - box.x} ${arc.middleY - box.y})` });
    for (const line of texts.placeInCell(name, dates, arc)) {
        const { text, isName, size, x, y, turn, baseline } = line;
        holder.append(
            svg(
                "text",
                {
                    class: isName ? "name" : "years",
                    "font-size": size,
                    transform: `translate(${x} ${y}) rotate(${turn})`,
                    y: baseline,
                    "aria-hidden": "true",
                    direction: line.rightToLeft ? "rtl" : null,
                },
                text,
            ),
        );
    }
    group.append(holder);
}
