// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How the boxes of a picture come from where the one before had them. The box that was acted on hands its place on the screen
// to its heir in the new picture, and everybody who is in both comes from their old place, moved along with it.

import type { Box, Picture } from "../view/Picture";
import { handleOf } from "./boxArt";
import { eased, type Point } from "./Camera";
import { middleOf } from "./sceneAreas";

export const kGlideTime = 520; // ms
const kFadeTime = 200; // ms, as in styles/viewer.css

export class Glide {
    /** From the old picture's points to the new one's. */
    readonly shift: Point;
    private readonly from = new Map<string, Point>();

    /** start is of performance.now(). held is a box of the picture before, heir one of the picture that follows. */
    constructor(
        before: Picture,
        held: Box,
        picture: Picture,
        heir: Box,
        private readonly start: number,
    ) {
        const oldCentre = middleOf(before.areaOf(held));
        const newCentre = middleOf(picture.areaOf(heir));
        this.shift = { x: newCentre.x - oldCentre.x, y: newCentre.y - oldCentre.y };
        for (const box of before.boxes) this.from.set(box.key, { x: box.x + this.shift.x, y: box.y + this.shift.y });
        this.from.set(heir.key, {
            x: oldCentre.x + this.shift.x - heir.width / 2,
            y: oldCentre.y + this.shift.y - heir.height / 2,
        });
    }

    /** How much of the way is done, 0 to 1. */
    partAt(now: number): number {
        return Math.min(1, Math.max(0, now - this.start) / kGlideTime);
    }

    /** Where a box of the new picture is then: who was not in the old one is in place from the beginning. */
    placeOf(box: Box, now: number): Point {
        const from = this.from.get(box.key) ?? box;
        const part = eased(this.partAt(now));
        return { x: from.x + (box.x - from.x) * part, y: from.y + (box.y - from.y) * part };
    }
}

/** Puts the boxes of those who are not in the picture any more into the layer, to fade there where they stood. */
export function leaveGhosts(
    layer: SVGGElement,
    picture: Picture,
    shift: Point,
    old: ReadonlyMap<Box, SVGGElement>,
): void {
    const gone: SVGGElement[] = [];
    for (const [box, element] of old) {
        if (picture.boxOfKey(box.key)) continue;
        for (const name of ["data-person-id", "data-xref", "data-box"]) element.removeAttribute(name);
        for (const name of ["role", "tabindex", "aria-label", "aria-current"]) handleOf(element).removeAttribute(name);
        element.setAttribute("transform", `translate(${box.x + shift.x} ${box.y + shift.y})`);
        gone.push(element);
    }
    layer.replaceChildren(...gone);
    setTimeout(() => gone.forEach((element) => element.remove()), kFadeTime);
}
