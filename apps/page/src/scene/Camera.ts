// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Where the picture stands on the screen: moved by hand, wheel, pinch and keys, or travelling to a place of
// its own.

import { select } from "d3-selection";
import { type D3ZoomEvent, zoom, zoomIdentity, type ZoomTransform } from "d3-zoom";
import { prefersStillness } from "../base/dom";
import type { Rectangle } from "../base/SpatialGrid";

// screen = world * k + (x, y), in CSS px.
export interface Placing {
    readonly k: number;
    readonly x: number;
    readonly y: number;
}

export interface Point {
    readonly x: number;
    readonly y: number;
}

const kLeastZoom = 0.02;
const kMostZoom = 4;
const kFitMargin = 28; // px
const kTravelTime = 420; // ms
const kButtonsWidth = 64; // px, of the buttons over the right edge
const kCornerHeight = 36; // px that the legend and its neighbours take beyond the margin
const kWideWindow = 700; // px; a narrower one has no room to leave for them
export const kReadable = 0.6; // the least zoom at which names are read with ease
const kUsualZoom = 0.85;

export class Camera {
    private readonly behaviour = zoom<SVGSVGElement, unknown>();
    private readonly selection;
    private measured: { width: number; height: number } | null = null;
    private travel = 0; // the frame that is asked for; 0 at rest
    private aim: Placing | null = null; // of the travel
    /** Whether the wheel is for the picture now, and not for the page around it. */
    takesWheel = () => true;

    constructor(
        private readonly surface: SVGSVGElement,
        onMove: (placing: Placing) => void,
    ) {
        this.selection = select<SVGSVGElement, unknown>(surface);
        this.behaviour
            .scaleExtent([kLeastZoom, kMostZoom])
            .extent(() => [
                [0, 0],
                [this.size.width, this.size.height],
            ])
            .filter((event: MouseEvent) =>
                event.type === "wheel" ? event.ctrlKey || this.takesWheel() : !event.ctrlKey && !event.button,
            )
            .clickDistance(6)
            .on("zoom", (event: D3ZoomEvent<SVGSVGElement, unknown>) => {
                if (event.sourceEvent) this.stop();
                onMove(event.transform);
            });
        this.selection.call(this.behaviour).on("dblclick.zoom", null);
    }

    get placing(): Placing {
        return (this.surface as unknown as { __zoom: ZoomTransform }).__zoom;
    }

    /** What of the picture is in the window, in its points. */
    get shown(): Rectangle {
        const { k, x, y } = this.placing;
        const { width, height } = this.size;
        return { left: -x / k, top: -y / k, right: (width - x) / k, bottom: (height - y) / k };
    }

    // Asked for in every frame, so it is measured only when it has changed.
    get size(): { width: number; height: number } {
        return (this.measured ??= {
            width: this.surface.clientWidth || 1,
            height: this.surface.clientHeight || 1,
        });
    }

    // What stood in the middle of the window stays there.
    resized(): void {
        const before = this.measured;
        this.measured = null;
        const { width, height } = this.size;
        if (!before || (before.width === width && before.height === height)) return;
        const { k, x, y } = this.aim ?? this.placing;
        this.place({ k, x: x + (width - before.width) / 2, y: y + (height - before.height) / 2 });
    }

    // What is in sight, in world points.
    window(placing: Placing = this.placing): Rectangle {
        const { k, x, y } = placing;
        const { width, height } = this.size;
        return { left: -x / k, top: -y / k, right: (width - x) / k, bottom: (height - y) / k };
    }

    place(placing: Placing): void {
        this.stop();
        this.jump(placing);
    }

    travelTo(target: Placing, time = kTravelTime): void {
        this.stop();
        if (prefersStillness()) return this.jump(target);
        const from = this.placing;
        const start = performance.now();
        this.aim = target;
        const step = (now: number) => {
            const part = Math.min(1, Math.max(0, now - start) / time);
            this.travel = part < 1 ? requestAnimationFrame(step) : 0;
            if (part === 1) this.aim = null;
            this.jump(between(from, target, eased(part), this.size));
        };
        this.travel = requestAnimationFrame(step);
    }

    stop(): void {
        cancelAnimationFrame(this.travel);
        this.travel = 0;
        this.aim = null;
    }

    zoomBy(factor: number): void {
        const { width, height } = this.size;
        // Quick clicks add up, however far the picture has come.
        const { k, x, y } = this.aim ?? this.placing;
        const next = Math.min(kMostZoom, Math.max(kLeastZoom, k * factor));
        const ratio = next / k;
        this.travelTo(
            { k: next, x: width / 2 - (width / 2 - x) * ratio, y: height / 2 - (height / 2 - y) * ratio },
            180,
        );
    }

    panBy(dx: number, dy: number): void {
        const { k, x, y } = this.placing;
        this.place({ k, x: x + dx, y: y + dy });
    }

    // The whole area in sight, no larger than life.
    fitting(area: Rectangle, mostZoom = 1.15): Placing {
        const { width, height } = this.size;
        const aside = width > kWideWindow ? kButtonsWidth : 0;
        const room = (size: number) => Math.max(40, size - 2 * kFitMargin);
        const k = Math.max(
            kLeastZoom,
            Math.min(
                mostZoom,
                room(width - aside) / (area.right - area.left),
                room(height - kCornerHeight) / (area.bottom - area.top),
            ),
        );
        const { x, y } = this.centring({ x: (area.left + area.right) / 2, y: (area.top + area.bottom) / 2 }, k);
        return { k, x: x - aside / 2, y: y - kCornerHeight / 2 };
    }

    // Where a picture begins: whole if it can be read so, else readable, with its middle in the window's
    // middle and all of its height if there is room.
    opening(area: Rectangle, middle: Point): Placing {
        const whole = this.fitting(area);
        if (whole.k >= kReadable) return whole;
        const { height } = this.size;
        const tall = (height - 2 * kFitMargin - kCornerHeight) / (area.bottom - area.top);
        if (tall < kReadable) return this.usingRoom(area, this.centring(middle, kUsualZoom));
        const { k, x, y } = this.centring({ x: middle.x, y: (area.top + area.bottom) / 2 }, Math.min(1, tall));
        return this.usingRoom(area, { k, x, y: y - kCornerHeight / 2 });
    }

    // Room beside the picture goes to what lies out of sight on the other side.
    private usingRoom({ left, top, right, bottom }: Rectangle, from: Placing): Placing {
        const { width, height } = this.size;
        const { k, x, y } = from;
        return {
            k,
            x: x + shiftIntoRoom(left * k + x, width - right * k - x),
            y: y + shiftIntoRoom(top * k + y, height - kCornerHeight - bottom * k - y),
        };
    }

    centring(point: Point, k: number): Placing {
        const { width, height } = this.size;
        return { k, x: width / 2 - point.x * k, y: height / 2 - point.y * k };
    }

    // The least move that brings all of an area into the window, crosswise and upwards each where there is
    // room for it.
    includingWhole(area: Rectangle, from: Placing): Placing {
        const { width, height } = this.size;
        const { k } = from;
        const whole = this.including(area, kFitMargin / width, from);
        return {
            k,
            x: (area.right - area.left) * k <= width ? whole.x : from.x,
            y: (area.bottom - area.top) * k <= height ? whole.y : from.y,
        };
    }

    // The least move that brings an area into the window less a margin, in parts of the window's size.
    including(area: Rectangle, margin: number, from: Placing = this.placing): Placing {
        const { width, height } = this.size;
        const { k } = from;
        const x = nudged(from.x, area.left * k, area.right * k, width, margin * width);
        const y = nudged(from.y, area.top * k, area.bottom * k, height, margin * height);
        return { k, x, y };
    }

    private jump({ k, x, y }: Placing): void {
        this.behaviour.transform(this.selection, zoomIdentity.translate(x, y).scale(k));
    }
}

export function eased(part: number): number {
    return part < 0.5 ? 4 * part ** 3 : 1 - (-2 * part + 2) ** 3 / 2;
}

// Zooms evenly, and keeps the middle of the window on a straight way.
export function between(
    a: Placing,
    b: Placing,
    part: number,
    { width, height }: { width: number; height: number },
): Placing {
    const k = a.k * (b.k / a.k) ** part;
    const middle = (from: number, to: number, size: number) => {
        const start = (size / 2 - from) / a.k;
        const end = (size / 2 - to) / b.k;
        const share = a.k === b.k ? part : (1 / a.k - 1 / k) / (1 / a.k - 1 / b.k);
        return size / 2 - (start + (end - start) * share) * k;
    };
    return { k, x: middle(a.x, b.x, width), y: middle(a.y, b.y, height) };
}

// How far a picture may move along one axis; before and behind are the px of room on either side, less than
// none where it goes on.
function shiftIntoRoom(before: number, behind: number): number {
    if (before > kFitMargin && behind < kFitMargin) return -Math.min(before - kFitMargin, kFitMargin - behind);
    if (behind > kFitMargin && before < kFitMargin) return Math.min(behind - kFitMargin, kFitMargin - before);
    return 0;
}

function nudged(offset: number, low: number, high: number, size: number, margin: number): number {
    const room = Math.max(0, Math.min(margin, (size - (high - low)) / 2));
    if (high - low > size) return offset + low < 0 && offset + high > size ? offset : (size - low - high) / 2;
    if (low + offset < room) return room - low;
    if (high + offset > size - room) return size - room - high;
    return offset;
}
