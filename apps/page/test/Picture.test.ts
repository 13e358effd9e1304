// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A picture's values, ready for the screen.

import assert from "node:assert/strict";
import { test } from "node:test";
import type { PictureFamily } from "olvane";
import { Picture } from "../src/view/Picture";
import { box, values } from "./pictureValues";

const couple = {
    number: 1,
    parents: [0, 1],
    children: [2],
    lines: [
        { x1: 100, y1: 40, x2: 140, y2: 40 },
        { x1: 120, y1: 40, x2: 120, y2: 400 },
    ],
} as unknown as PictureFamily;
const boxes = [box(0, 1, 0, 0), box(1, 2, 140, 0), box(2, 3, 70, 400), box(3, 1, 3000, 400)];
const marks = [
    { kind: "samePerson", boxes: [0, 3], number: 1 },
    { kind: "parentsElsewhere", boxes: [2, 0], number: 2 },
] as never;
const picture = new Picture("everybody", "bottom", 1, values(boxes, { families: [couple], marks, focus: 0 }));

test("each box of a person has a key of its own, by which the next picture finds it again", () => {
    assert.deepEqual(
        picture.boxes.map(({ key }) => key),
        ["1", "2", "3", "1#1"],
    );
    assert.equal(picture.boxOfKey("1#1"), picture.boxes[3]);
    assert.deepEqual(picture.boxesOf(1), [picture.boxes[0], picture.boxes[3]]);
    assert.equal(picture.focusBox, picture.boxes[0]);
    assert.ok(picture.shows(3) && !picture.shows(4));
});

test("a window holds the boxes and the families that touch it", () => {
    const window = { left: 90, top: 300, right: 200, bottom: 420 };
    assert.deepEqual(
        picture.boxesWithin(window).map(({ person }) => person),
        [3],
    );
    assert.deepEqual(
        picture.familiesWithin(window).map(({ index }) => index),
        [0],
    );
    assert.deepEqual(picture.familiesWithin({ left: 2900, top: 0, right: 3200, bottom: 900 }), []);
});

test("its bounds hold all boxes and lines", () => {
    assert.deepEqual(picture.bounds, { left: 0, top: 0, right: 3100, bottom: 480 });
});

test("a box knows its families and the numbers of its marks", () => {
    assert.deepEqual(
        picture.boxes.map((one) => picture.familiesOf(one).length),
        [1, 1, 1, 0],
    );
    assert.deepEqual(
        picture.boxes.map((one) => one.marks),
        [[1, 2], [], [2], [1]],
    );
});

test("a parent who is not known is named by sex and child", () => {
    const unknown = box(1, 0, 0, -120, { kind: "unknownParent", sex: "male", childOf: 0 });
    const small = new Picture("family", "bottom", 1, values([box(0, 1, 0, 0), unknown]));
    assert.equal(small.boxes[1]!.key, "male parent of 1");
    assert.equal(small.boxes[1]!.child, 1);
});
