// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the map stands on the screen. Families are much wider than high, so from afar only the width shrinks: all
// generations stay in sight, and time runs down the window.

import { prefersStillness } from "../base/dom";
import type { Rect } from "./FamilyMap";

// The point (x, y) of the map is in the middle of the window; k is px a point along a row.
export interface MapPlace {
    readonly x: number;
    readonly y: number;
    readonly k: number;
}

const kMostZoom = 3;
const kMargin = 24; // px around everything
const kFlight = 50; // ms: nobody waits for the map to arrive
export const kReadable = 0.8;

export class MapCamera {
    place: MapPlace = { x: 0, y: 0, k: 1 };
    width = 1; // px of the window
    height = 1;
    private flight = 0;
    private aim: MapPlace | null = null;

    constructor(
        private readonly area: Rect,
        private readonly moved: () => void,
    ) {}

    /** px a point from row to row. */
    get ky(): number {
        return this.kyOf(this.place.k);
    }

    kyOf(k: number): number {
        return Math.max(k, Math.min(1, (this.height - 2 * kMargin) / (this.area.bottom - this.area.top)));
    }

    get least(): number {
        const { left, top, right, bottom } = this.area;
        const [width, height] = [
            (this.width - 2 * kMargin) / (right - left),
            (this.height - 2 * kMargin) / (bottom - top),
        ];
        return Math.min(0.5, Math.max(Math.min(width, height), 1e-7));
    }

    get whole(): MapPlace {
        const { left, top, right, bottom } = this.area;
        return { x: (left + right) / 2, y: (top + bottom) / 2, k: this.least };
    }

    /** Of the point of the window in px. */
    toMap(px: number, py: number): { x: number; y: number } {
        const { x, y, k } = this.place;
        return { x: x + (px - this.width / 2) / k, y: y + (py - this.height / 2) / this.ky };
    }

    toScreen(x: number, y: number): { x: number; y: number } {
        return {
            x: this.width / 2 + (x - this.place.x) * this.place.k,
            y: this.height / 2 + (y - this.place.y) * this.ky,
        };
    }

    jump(place: MapPlace): void {
        this.stop();
        this.set(place);
    }

    /** Goes there within kFlight; at once where movement is unwelcome. */
    fly(place: MapPlace, arrived = () => {}): void {
        this.stop();
        const from = this.place;
        const start = performance.now();
        const step = () => {
            const part = prefersStillness() ? 1 : Math.min(1, (performance.now() - start) / kFlight);
            const k = from.k * (place.k / from.k) ** part;
            // The same share of the way as of the zoom, seen from the end: a target drifts, it does not race.
            const share = place.k === from.k ? part : (1 / from.k - 1 / k) / (1 / from.k - 1 / place.k);
            this.flight = part < 1 ? requestAnimationFrame(step) : 0;
            this.aim = part < 1 ? place : null;
            this.set(
                part < 1
                    ? { x: from.x + (place.x - from.x) * share, y: from.y + (place.y - from.y) * share, k }
                    : place,
            );
            if (part === 1) arrived();
        };
        step();
    }

    panBy(dx: number, dy: number): void {
        const { x, y, k } = this.place;
        this.jump({ x: x - dx / k, y: y - dy / this.ky, k });
    }

    /** What is at the point of the window stays there. */
    zoomAt(px: number, py: number, factor: number): void {
        this.jump(this.zoomed(px, py, factor, this.place));
    }

    zoomBy(factor: number): void {
        this.fly(this.zoomed(this.width / 2, this.height / 2, factor, this.aim ?? this.place));
    }

    private zoomed(px: number, py: number, factor: number, from: MapPlace): MapPlace {
        const k = this.clamped(from.k * factor);
        const [dx, dy] = [px - this.width / 2, py - this.height / 2];
        return {
            x: from.x + dx / from.k - dx / k,
            y: from.y + dy / this.kyOf(from.k) - dy / this.kyOf(k),
            k,
        };
    }

    private clamped(k: number): number {
        return Math.min(kMostZoom, Math.max(this.least, k));
    }

    private stop(): void {
        cancelAnimationFrame(this.flight);
        this.flight = 0;
        this.aim = null;
    }

    // The middle of the window stays over the family, and what is less high than the window is whole in it.
    private set({ x, y, k }: MapPlace): void {
        const { left, top, right, bottom } = this.area;
        const clamped = this.clamped(k);
        const reachY = Math.max(0, (bottom - top) / 2 - (this.height / 2 - 2 * kMargin) / this.kyOf(clamped));
        const middle = (top + bottom) / 2;
        this.place = {
            x: Math.min(right, Math.max(left, x)),
            y: Math.min(middle + reachY, Math.max(middle - reachY, y)),
            k: clamped,
        };
        this.moved();
    }
}
