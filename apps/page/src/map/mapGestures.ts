// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Mouse, wheel and fingers on the map.

import type { MapCamera } from "./MapCamera";

const kClickDistance = 6; // px that a press may move and still be a click

export interface GestureActions {
    click(x: number, y: number): void;
    doubleClick(x: number, y: number): void;
}

export function takeGestures(surface: HTMLElement, camera: MapCamera, actions: GestureActions): void {
    const pointers = new Map<number, { x: number; y: number }>();
    let moved = 0;
    const placeOf = (event: MouseEvent) => {
        const { left, top } = surface.getBoundingClientRect();
        return { x: event.clientX - left, y: event.clientY - top };
    };
    surface.addEventListener("pointerdown", (event) => {
        if (event.button !== 0) return;
        if (pointers.size === 0) moved = 0;
        pointers.set(event.pointerId, placeOf(event));
        if (event.isTrusted) surface.setPointerCapture(event.pointerId);
    });
    surface.addEventListener("pointermove", (event) => {
        const from = pointers.get(event.pointerId);
        if (!from) return;
        const to = placeOf(event);
        const other = [...pointers].find(([id]) => id !== event.pointerId)?.[1];
        pointers.set(event.pointerId, to);
        if (other) {
            pinch(camera, other, from, to);
            moved = kClickDistance + 1;
        } else {
            moved += Math.hypot(to.x - from.x, to.y - from.y);
            camera.panBy(to.x - from.x, to.y - from.y);
        }
    });
    const end = (event: PointerEvent) => {
        if (!pointers.delete(event.pointerId) || pointers.size > 0) return;
        const { x, y } = placeOf(event);
        if (event.type === "pointerup" && moved <= kClickDistance) actions.click(x, y);
    };
    surface.addEventListener("pointerup", end);
    surface.addEventListener("pointercancel", end);
    surface.addEventListener("dblclick", (event) => {
        const { x, y } = placeOf(event);
        actions.doubleClick(x, y);
    });
    surface.addEventListener(
        "wheel",
        (event) => {
            event.preventDefault();
            const { x, y } = placeOf(event);
            const px =
                event.deltaMode === 1 ? event.deltaY * 16 : event.deltaMode === 2 ? event.deltaY * 400 : event.deltaY;
            camera.zoomAt(x, y, 2 ** (-px * (event.ctrlKey ? 0.02 : 0.002)));
        },
        { passive: false },
    );
}

interface Point {
    readonly x: number;
    readonly y: number;
}

// One finger rests, the other moves: what lies between them stays there and grows with their distance.
function pinch(camera: MapCamera, rest: Point, from: Point, to: Point): void {
    const before = Math.hypot(from.x - rest.x, from.y - rest.y) || 1;
    const after = Math.hypot(to.x - rest.x, to.y - rest.y) || 1;
    camera.panBy((to.x - from.x) / 2, (to.y - from.y) / 2);
    camera.zoomAt((rest.x + to.x) / 2, (rest.y + to.y) / 2, after / before);
}
