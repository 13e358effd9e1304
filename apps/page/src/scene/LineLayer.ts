// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The lines of the families in sight, one group for each, and over them the ways of a kinship. From afar all families are one
// path. Lines stay to be seen however far off the picture is.
//
// Holds: lit are the families of the box that was named last, or alone the one whose line is under the pointer.

import { svg } from "../base/dom";
import type { FamilyLines, Picture } from "../view/Picture";
import { drawFamily } from "./familyLines";
import { farLines } from "./overviewPaths";
import { drawWays } from "./wayLines";

const kLineWidth = 1.6; // points
const kFarWidth = 0.7; // px, of lines that would be thinner

export class LineLayer {
    private group = svg("g", { class: "lines", "aria-hidden": "true" });
    private lit: readonly FamilyLines[] = []; // of a box
    private pointed: string | null = null; // the family whose line is under the pointer, as its lines name it

    get element(): SVGGElement {
        return this.group;
    }

    /** label gives what stands at a marriage line; null draws the families from afar. */
    draw(
        families: readonly FamilyLines[],
        ways: NonNullable<Picture["kinship"]>["ways"],
        label: ((lines: FamilyLines) => string) | null,
    ): void {
        const drawn = label ? families.map((lines) => drawFamily(lines, label(lines))) : [farLines(families)];
        this.group.replaceChildren(...drawn, ...drawWays(ways));
        this.light();
    }

    clear(): void {
        this.group.replaceChildren();
        this.pointed = null;
        this.lit = [];
    }

    /** For a zoom. */
    thicken(zoom: number): void {
        const width = String(Math.max(kLineWidth, Math.round((10 * kFarWidth) / zoom) / 10));
        if (this.group.getAttribute("stroke-width") !== width) this.group.setAttribute("stroke-width", width);
    }

    /** Lights up the families of a box. */
    lightFamilies(families: readonly FamilyLines[]): void {
        this.lit = families;
        this.light();
    }

    /** Lights up the family whose line is under the pointer, and nobody else's meanwhile; null for none. */
    pointAt(family: string | null): void {
        if (this.pointed === family) return;
        this.pointed = family;
        this.light();
    }

    /** The lines that are drawn now come to be seen slowly. */
    fadeIn(): void {
        const later = svg("g", {
            class: "lines later",
            "aria-hidden": "true",
            "stroke-width": this.group.getAttribute("stroke-width"),
        });
        later.append(...this.group.childNodes);
        this.group.replaceWith(later);
        this.group = later;
    }

    private light(): void {
        const own = this.lit.map(({ index }) => String(index));
        const lit = new Set(this.pointed === null ? own : [this.pointed]);
        for (const group of this.group.children)
            group.classList.toggle("lit", lit.has(group.getAttribute("data-family") ?? ""));
    }
}
