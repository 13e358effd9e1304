// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where boxes are while one picture becomes another, and which part of a picture must be drawn.

import "./stillBrowser";
import assert from "node:assert/strict";
import { test } from "node:test";
import { Glide, kGlideTime } from "../src/scene/Glide";
import { clipped, middleOf, unionOf } from "../src/scene/sceneAreas";
import { Picture } from "../src/view/Picture";
import { box, values } from "./pictureValues";

// The child 3 of 1 was clicked; it hands its place to the focus of the next picture, which is 3 as well.
const before = new Picture("family", "bottom", 1, values([box(0, 1, 0, 0), box(1, 2, 200, 0), box(2, 3, 100, 110)]));
const after = new Picture("family", "bottom", 3, values([box(0, 3, 500, 0), box(1, 1, 400, -110), box(2, 4, 620, 0)]));
const start = 1000;
const glide = new Glide(before, before.boxesOf(3)[0]!, after, after.focusBox, start);

test("the box that was acted on hands its place to the new focus, and all others move along", () => {
    assert.deepEqual(glide.shift, { x: 400, y: -110 });
    const [focus] = after.boxesOf(3);
    assert.deepEqual(glide.placeOf(focus!, start), { x: 500, y: 0 });
    // 1 stood at (0, 0), which the shift makes (400, -110): where it stands now, so it holds still.
    assert.deepEqual(glide.placeOf(after.boxesOf(1)[0]!, start), { x: 400, y: -110 });
});

test("a person who was not there before is in place at once, and everybody is at the end", () => {
    const [newcomer] = after.boxesOf(4);
    for (const now of [-Infinity, start, start + kGlideTime / 2])
        assert.deepEqual(glide.placeOf(newcomer!, now), { x: 620, y: 0 });
    for (const one of after.boxes) assert.deepEqual(glide.placeOf(one, start + kGlideTime), { x: one.x, y: one.y });
});

test("a way is done in its time and never runs backwards", () => {
    assert.equal(glide.partAt(start - 50), 0);
    assert.equal(glide.partAt(start + kGlideTime / 4), 0.25);
    assert.equal(glide.partAt(start + 10 * kGlideTime), 1);
});

test("a box of another size keeps its middle on the way", () => {
    const small = new Picture("family", "bottom", 1, values([box(0, 1, 0, 0)]));
    const wide = new Picture("ancestors", "left", 1, values([box(0, 1, 300, 40, { width: 200, height: 40 })]));
    const turned = new Glide(small, small.focusBox, wide, wide.focusBox, start);
    // Both middles are (400, 60) in the points of the new picture.
    assert.deepEqual(turned.placeOf(wide.focusBox, start), { x: 300, y: 40 });
    assert.deepEqual(turned.shift, { x: 350, y: 20 });
});

const area = (left: number, top: number, right: number, bottom: number) => ({ left, top, right, bottom });

test("areas have a middle and a least rectangle around two", () => {
    assert.deepEqual(middleOf(area(10, 20, 30, 60)), { x: 20, y: 40 });
    assert.deepEqual(unionOf(area(0, 0, 10, 10), area(5, -5, 20, 8)), area(0, -5, 20, 10));
});

test("beyond the bounds of a picture nothing needs to be drawn", () => {
    const bounds = area(0, 0, 100, 100);
    const drawn = area(20, 20, 40, 40);
    assert.deepEqual(clipped(area(-50, 30, 60, 400), drawn, bounds), area(0, 30, 60, 100));
    assert.equal(clipped(area(200, 200, 300, 300), drawn, bounds), drawn);
});
