// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the map stands, worked out by hand for a window of 1000 by 600 px over a family of 20,000 by 1,000 points.

import "./stillBrowser";
import assert from "node:assert/strict";
import { test } from "node:test";
import { MapCamera } from "../src/map/MapCamera";

function camera(moved = () => {}): MapCamera {
    const one = new MapCamera({ left: 0, top: 0, right: 20000, bottom: 1000 }, moved);
    one.width = 1000;
    one.height = 600;
    return one;
}

function rounded({ x, y }: { x: number; y: number }): { x: number; y: number } {
    return { x: Math.round(x * 1e6) / 1e6, y: Math.round(y * 1e6) / 1e6 };
}

test("from afar only the width shrinks, and all generations stay in sight", () => {
    const one = camera();
    assert.equal(one.least, (1000 - 48) / 20000);
    one.jump(one.whole);
    assert.equal(one.ky, (600 - 48) / 1000);
    assert.deepEqual(rounded(one.toScreen(0, 0)), { x: 24, y: 24 });
    assert.deepEqual(rounded(one.toScreen(20000, 1000)), { x: 976, y: 576 });
});

test("a point of the window is the point of the map that is drawn there", () => {
    const one = camera();
    one.jump({ x: 4000, y: 500, k: 0.8 });
    const { x, y } = one.toMap(123, 456);
    const again = one.toScreen(x, y);
    assert.ok(Math.abs(again.x - 123) < 1e-9 && Math.abs(again.y - 456) < 1e-9);
});

test("a zoom keeps what is under the pointer, within the bounds", () => {
    const one = camera();
    one.jump({ x: 4000, y: 500, k: 1 });
    const before = one.toMap(300, 300);
    one.zoomAt(300, 300, 2);
    assert.equal(one.place.k, 2);
    const after = one.toMap(300, 300);
    assert.ok(Math.abs(before.x - after.x) < 1e-9);
    one.zoomBy(100);
    assert.equal(one.place.k, 3);
    one.zoomBy(1e-9);
    assert.equal(one.place.k, one.least);
});

test("the middle of the window stays over the family", () => {
    const one = camera();
    one.jump({ x: -500, y: 99999, k: 1 });
    assert.deepEqual(one.place, { x: 0, y: 500 + (500 - (300 - 48)), k: 1 });
    one.panBy(-1e6, 0);
    assert.equal(one.place.x, 20000);
});

test("each move is reported, and a flight arrives", () => {
    let moves = 0;
    let arrived = false;
    const one = camera(() => ++moves);
    one.fly({ x: 100, y: 500, k: 1 }, () => (arrived = true));
    assert.ok(moves === 1 && arrived);
    assert.equal(one.place.x, 100);
});
