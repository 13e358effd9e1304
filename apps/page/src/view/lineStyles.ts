// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which lines of a family view tell more than that two boxes belong together: a marriage that ended, and a
// child who came to its parents otherwise than by birth. A piece is known by what it touches: a marriage runs
// from the right edge of one box to the left edge of another, and a child's own piece ends in the middle of
// its upper edge.

import type { Person, Segment } from "olvane";
import type { OpenFamily } from "./OpenFamily";
import type { Box, Picture } from "./Picture";

export const kLineStyles = ["plain", "divorced", "adopted"] as const;
export type LineStyle = (typeof kLineStyles)[number];

// Only pieces that are not plain are in the map.
export function lineStylesOf(picture: Picture, family: OpenFamily): ReadonlyMap<Segment, LineStyle> {
    const styles = new Map<Segment, LineStyle>();
    if (picture.view !== "family") return styles;
    for (const segment of picture.segments) {
        if (isMarriage(segment) && isDivorce(segment, picture, family)) styles.set(segment, "divorced");
        else if (segment.x1 === segment.x2 && isAdoption(segment, picture, family))
            styles.set(segment, "adopted");
    }
    return styles;
}

function isMarriage({ y1, y2 }: Segment): boolean {
    return y1 === y2;
}

function isDivorce({ x1, x2, y1 }: Segment, picture: Picture, family: OpenFamily): boolean {
    const width = picture.sizes.nodeWidth;
    const left = Math.min(x1, x2);
    const right = Math.max(x1, x2);
    const husbands = personsAt(left - 1, y1, picture).filter((box) => box.x + width === left);
    const wives = personsAt(right + 1, y1, picture).filter((box) => box.x === right);
    return husbands.some((a) => wives.some((b) => areDivorced(a.person, b.person, family)));
}

function areDivorced(a: number, b: number, family: OpenFamily): boolean {
    const couples = (family.person(a)?.coupleFamilies ?? []).map((id) => family.families[id - 1]);
    return couples.some((couple) => couple?.divorced && (couple.husband === b || couple.wife === b));
}

function isAdoption({ x1, y1, y2 }: Segment, picture: Picture, family: OpenFamily): boolean {
    const lower = Math.max(y1, y2);
    return personsAt(x1, lower + 1, picture).some((box) => {
        const person = family.person(box.person);
        return box.y === lower && person !== undefined && wasAdopted(person, family);
    });
}

// By the family of the parents whom the picture shows.
function wasAdopted(person: Person, family: OpenFamily): boolean {
    const link = person.parentFamilies.find(({ family: id }) => {
        const couple = family.families[id - 1];
        return couple !== undefined && couple.husband === person.father && couple.wife === person.mother;
    });
    return link?.pedigree === "adopted" || link?.pedigree === "foster";
}

function personsAt(x: number, y: number, picture: Picture): Box[] {
    return picture.boxesWithin({ left: x, top: y, right: x, bottom: y }).filter((box) => box.person > 0);
}
