// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where an arrow key leads: to the nearest relative of the right kind whose box lies that way, and where
// there is none, to the box that lies most nearly that way.

import type { OpenFamily } from "./OpenFamily";
import type { Box, LaterSide, Picture } from "./Picture";

export type Direction = "up" | "down" | "left" | "right";

const kStraying = 2.2; // how much worse a step aside is than one ahead

export function boxTowards(from: Box, direction: Direction, picture: Picture, family: OpenFamily): Box | null {
    const ahead = (box: Box) => box !== from && distanceAhead(from, box, direction) > 0;
    const kin = kinBoxes(from, direction, picture, family).filter(ahead);
    const others = picture.boxes.filter(ahead);
    return nearest(from, direction, kin) ?? nearest(from, direction, inLine(from, direction, others, picture));
}

const kWays = {
    bottom: ["up", "down"],
    top: ["down", "up"],
    left: ["right", "left"],
    right: ["left", "right"],
} as const satisfies Record<LaterSide, readonly [toParents: Direction, toChildren: Direction]>;

function kinBoxes(from: Box, direction: Direction, picture: Picture, family: OpenFamily): Box[] {
    const [toParents, toChildren] = kWays[picture.laterSide];
    if (from.child && direction === toChildren) return [...picture.boxesOf(from.child)];
    const person = family.person(from.person);
    if (!person) return [];
    const kin =
        direction === toParents ? [person.father, person.mother] : direction === toChildren ? person.children : [];
    const missing =
        direction === toParents ? picture.boxes.filter((box) => box.child === person.id && person.id > 0) : [];
    return [...kin.flatMap((id) => picture.boxesOf(id)), ...missing];
}

// Along a generation only the generation itself counts; from one to another also what lies not quite straight
// ahead.
function inLine(from: Box, direction: Direction, boxes: readonly Box[], picture: Picture): Box[] {
    const alongGeneration = !kWays[picture.laterSide].some((way) => way === direction);
    const slope = alongGeneration ? 0.2 : 1.8;
    return boxes.filter((box) => distanceAside(from, box, direction) <= distanceAhead(from, box, direction) * slope);
}

function nearest(from: Box, direction: Direction, boxes: readonly Box[]): Box | null {
    let best: Box | null = null;
    let least = Infinity;
    for (const box of boxes) {
        const cost = distanceAhead(from, box, direction) + kStraying * distanceAside(from, box, direction);
        if (cost < least) [best, least] = [box, cost];
    }
    return best;
}

function distanceAhead(from: Box, to: Box, direction: Direction): number {
    if (direction === "up") return from.y - to.y;
    if (direction === "down") return to.y - from.y;
    return direction === "left" ? from.x - to.x : to.x - from.x;
}

function distanceAside(from: Box, to: Box, direction: Direction): number {
    return direction === "up" || direction === "down" ? Math.abs(to.x - from.x) : Math.abs(to.y - from.y);
}
