// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where a picture stands in the window, worked out by hand for a window of 1000 by 600 px. Around a picture 28 px are
// free, beside it 64 px for the buttons, and below it 36 px for the legend.

import "./stillBrowser";
import assert from "node:assert/strict";
import { test } from "node:test";
import { between, Camera, eased, type Placing } from "../src/scene/Camera";

interface Surface {
    clientWidth: number;
    clientHeight: number;
}

// As much of an element as a zoom needs.
function surface(clientWidth = 1000, clientHeight = 600): Surface {
    const nothing = () => {};
    return Object.assign(
        { clientWidth, clientHeight },
        { addEventListener: nothing, removeEventListener: nothing, style: { setProperty: nothing } },
    );
}

function camera(on = surface(), moved: (placing: Placing) => void = () => {}): Camera {
    return new Camera(on as unknown as SVGSVGElement, moved);
}

function stands({ k, x, y }: Placing): Placing {
    const round = (value: number) => Math.round(value * 1e6) / 1e6 + 0;
    return { k: round(k), x: round(x), y: round(y) };
}

test("a small picture is fitted no larger than life, in the middle of what buttons and legend leave", () => {
    const fitted = camera().fitting({ left: 0, top: 0, right: 500, bottom: 200 });
    assert.deepEqual(stands(fitted), { k: 1.15, x: 180.5, y: 167 });
    assert.equal(camera().fitting({ left: 0, top: 0, right: 500, bottom: 200 }, 1).k, 1);
});

test("a wide picture is fitted between the margins", () => {
    const fitted = camera().fitting({ left: 0, top: 0, right: 1760, bottom: 100 });
    assert.deepEqual(stands(fitted), { k: 0.5, x: 28, y: 257 });
});

test("a narrow window leaves no room for buttons beside the picture", () => {
    const fitted = camera(surface(456, 600)).fitting({ left: 0, top: 0, right: 800, bottom: 100 });
    assert.deepEqual(stands(fitted), { k: 0.5, x: 28, y: 257 });
});

test("the least zoom bounds what is fitted", () => {
    assert.equal(camera().fitting({ left: 0, top: 0, right: 1e6, bottom: 10 }).k, 0.02);
});

test("a picture that cannot be read whole opens readable around its middle", () => {
    const area = { left: 0, top: 0, right: 10000, bottom: 508 };
    assert.deepEqual(stands(camera().opening(area, { x: 5000, y: 254 })), { k: 1, x: -4500, y: 28 });
});

test("room beside a picture goes to what is out of sight on the other side", () => {
    const area = { left: 0, top: 0, right: 10000, bottom: 508 };
    assert.deepEqual(stands(camera().opening(area, { x: 100, y: 254 })), { k: 1, x: 28, y: 28 });
    assert.deepEqual(stands(camera().opening(area, { x: 9900, y: 254 })), { k: 1, x: 1000 - 28 - 10000, y: 28 });
});

test("a picture that is larger than the window both ways opens at the usual zoom", () => {
    const area = { left: 0, top: 0, right: 10000, bottom: 10000 };
    assert.deepEqual(stands(camera().opening(area, { x: 5000, y: 5000 })), { k: 0.85, x: -3750, y: -3950 });
});

test("the least move brings a box into the window less a margin", () => {
    const here = { k: 1, x: 0, y: 0 };
    const including = (left: number, top: number) =>
        stands(camera().including({ left, top, right: left + 100, bottom: top + 50 }, 0.1, here));
    assert.deepEqual(including(400, 300), here);
    assert.deepEqual(including(950, 300), { k: 1, x: -150, y: 0 });
    assert.deepEqual(including(20, -30), { k: 1, x: 80, y: 90 });
});

test("what is wider than the window is moved crosswise only where it would be out of sight", () => {
    const wide = { left: -200, top: 100, right: 1200, bottom: 200 };
    assert.deepEqual(stands(camera().includingWhole(wide, { k: 1, x: 5, y: 0 })), { k: 1, x: 5, y: 0 });
    const beyond = { left: 2000, top: 100, right: 3400, bottom: 200 };
    assert.equal(camera().including(beyond, 0, { k: 1, x: 0, y: 0 }).x, (1000 - 2000 - 3400) / 2);
});

test("a zoom by buttons keeps the middle of the window, within the bounds", () => {
    const one = camera();
    one.place({ k: 1, x: 0, y: 0 });
    one.zoomBy(2);
    assert.deepEqual(stands(one.placing), { k: 2, x: -500, y: -300 });
    one.zoomBy(8);
    assert.deepEqual(stands(one.placing), { k: 4, x: -1500, y: -900 });
    one.zoomBy(1e-6);
    assert.equal(one.placing.k, 0.02);
});

test("a window that changes its size keeps what stood in its middle", () => {
    const on = surface();
    const one = camera(on);
    one.place({ k: 1, x: 10, y: 20 });
    assert.deepEqual(one.window(), { left: -10, top: -20, right: 990, bottom: 580 });
    Object.assign(on, { clientWidth: 800, clientHeight: 700 });
    one.resized();
    assert.deepEqual(stands(one.placing), { k: 1, x: -90, y: 70 });
});

test("every move is reported", () => {
    const seen: Placing[] = [];
    const one = camera(surface(), (placing) => seen.push(stands(placing)));
    one.place({ k: 2, x: 1, y: 3 });
    one.panBy(4, -3);
    assert.deepEqual(seen, [
        { k: 2, x: 1, y: 3 },
        { k: 2, x: 5, y: 0 },
    ]);
});

test("a travel begins and ends where it should and zooms evenly in between", () => {
    const [a, b] = [
        { k: 1, x: 0, y: 0 },
        { k: 4, x: -600, y: 900 },
    ];
    const size = { width: 1000, height: 600 };
    assert.deepEqual(stands(between(a, b, 0, size)), a);
    assert.deepEqual(stands(between(a, b, 1, size)), b);
    assert.equal(between(a, b, 0.5, size).k, 2);
    const level = between(a, { k: 1, x: 100, y: -50 }, 0.25, size);
    assert.deepEqual(stands(level), { k: 1, x: 25, y: -12.5 });
});

test("a travel starts slowly and ends slowly", () => {
    assert.deepEqual([0, 0.25, 0.5, 0.75, 1].map(eased), [0, 0.0625, 0.5, 0.9375, 1]);
});
