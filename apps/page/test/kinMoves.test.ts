// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where arrow keys lead in a small picture, rows from the top: parents, the focus with a sister and a wife, a child.
//
//      [2]   [3]
//   [5]   [1]   [4]
//         [6]

import assert from "node:assert/strict";
import { test } from "node:test";
import { boxTowards, type Direction } from "../src/view/kinMoves";
import type { OpenFamily } from "../src/view/OpenFamily";
import { Picture } from "../src/view/Picture";
import { person } from "./persons";
import { box, values } from "./pictureValues";

const persons = [
    person(1, "Focus", { father: 2, mother: 3, spouses: [4], children: [6] }),
    person(2, "Father", { children: [5, 1] }),
    person(3, "Mother", { children: [5, 1] }),
    person(4, "Wife", { children: [6] }),
    person(5, "Sister", { father: 2, mother: 3 }),
    person(6, "Child", { father: 1, mother: 4 }),
];
const family = { person: (id: number) => persons[id - 1] } as OpenFamily;
const boxes = [
    box(0, 1, 200, 120),
    box(1, 2, 130, 0),
    box(2, 3, 270, 0),
    box(3, 4, 340, 120),
    box(4, 5, 60, 120),
    box(5, 6, 200, 240),
];

function leads(picture: Picture, from: number, direction: Direction): number | undefined {
    return boxTowards(picture.boxesOf(from)[0]!, direction, picture, family)?.person;
}

test("up leads to a parent and down to a child, and along a row to the neighbour", () => {
    const picture = new Picture("family", "bottom", 1, values(boxes));
    assert.equal(leads(picture, 1, "up"), 2);
    assert.equal(leads(picture, 1, "down"), 6);
    assert.equal(leads(picture, 1, "left"), 5);
    assert.equal(leads(picture, 1, "right"), 4);
    assert.equal(leads(picture, 6, "up"), 1);
});

test("a relative counts before a box that lies nearer", () => {
    const nearer = [...boxes, box(6, 7, 205, 60)];
    assert.equal(leads(new Picture("family", "bottom", 1, values(nearer)), 1, "up"), 2);
});

test("nothing beyond the last row", () => {
    const picture = new Picture("family", "bottom", 1, values(boxes));
    assert.equal(leads(picture, 6, "down"), undefined);
    assert.equal(leads(picture, 5, "left"), undefined);
});

test("a chart that lies otherwise is walked as it lies", () => {
    const turned = boxes.map(({ index, id, x, y }) => box(index, id, x, 240 - y));
    const upwards = new Picture("descendants", "top", 1, values(turned));
    assert.equal(leads(upwards, 1, "down"), 2);
    assert.equal(leads(upwards, 1, "up"), 6);
    const sideways = boxes.map(({ index, id, x, y }) => box(index, id, 240 - y, x));
    const pedigree = new Picture("pedigree", "left", 1, values(sideways));
    assert.equal(leads(pedigree, 1, "right"), 2);
    assert.equal(leads(pedigree, 1, "left"), 6);
    const mirrored = boxes.map(({ index, id, x, y }) => box(index, id, y, x));
    assert.equal(leads(new Picture("pedigree", "right", 1, values(mirrored)), 1, "left"), 2);
});

test("a parent who is not known is reached, and left again", () => {
    const unknown = box(6, 0, 340, 0, { kind: "unknownParent", sex: "female", childOf: 3 });
    const picture = new Picture("family", "bottom", 1, values([...boxes, unknown]));
    const up = boxTowards(picture.boxesOf(4)[0]!, "up", picture, family)!;
    assert.equal(up.key, "female parent of 4");
    assert.equal(boxTowards(up, "down", picture, family)?.person, 4);
});
