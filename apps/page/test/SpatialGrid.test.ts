// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The grid against a look at every rectangle.

import assert from "node:assert/strict";
import { test } from "node:test";
import { encloses, grown, type Rectangle, SpatialGrid, touches } from "../src/base/SpatialGrid";

// The same numbers in each run.
function numbers(seed: number): (most: number) => number {
    let state = seed;
    return (most) => {
        state = (Math.imul(state, 1664525) + 1013904223) >>> 0;
        return Math.floor((state / 2 ** 32) * most);
    };
}

function rectangle(next: (most: number) => number, most: number): Rectangle {
    const [left, top] = [next(8000) - 4000, next(8000) - 4000];
    return { left, top, right: left + next(most), bottom: top + next(most) };
}

test("a grid finds what a look at every rectangle finds, in rising order", () => {
    const next = numbers(7);
    const things = Array.from({ length: 400 }, (_, i) => rectangle(next, i % 20 === 0 ? 9000 : 150));
    const grid = new SpatialGrid(things);
    for (let round = 0; round < 200; ++round) {
        const window = rectangle(next, round % 10 === 0 ? 12000 : 900);
        const expected = things.flatMap((thing, i) => (touches(thing, window) ? [i] : []));
        assert.deepEqual(grid.within(window), expected);
    }
});

test("rectangles that share no more than an edge touch", () => {
    const one = { left: 0, top: 0, right: 600, bottom: 600 };
    assert.ok(touches(one, { left: 600, top: 0, right: 700, bottom: 10 }));
    assert.ok(!touches(one, { left: 600.5, top: 0, right: 700, bottom: 10 }));
    assert.deepEqual(new SpatialGrid([one]).within({ left: 600, top: 600, right: 601, bottom: 601 }), [0]);
});

test("a rectangle encloses itself until it is grown", () => {
    const one = { left: 0, top: 0, right: 10, bottom: 20 };
    const large = grown(one, 1, 2);
    assert.deepEqual(large, { left: -1, top: -2, right: 11, bottom: 22 });
    assert.ok(encloses(one, one) && encloses(large, one) && !encloses(one, large));
});
