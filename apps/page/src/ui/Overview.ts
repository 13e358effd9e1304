// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The whole picture in small, with a frame around what the window shows: where one is, and a way to the rest.
// Shown only while there is a rest. The keys have other ways, so it is for the mouse alone.

import type { Camera } from "../scene/Camera";
import { overviewPaths } from "../scene/overviewPaths";
import type { Picture } from "../view/Picture";
import { encloses, grown, type Rectangle } from "../base/SpatialGrid";
import { html, setAttributes, svg } from "../base/dom";

// px
const kMostWidth = 200;
const kMostHeight = 96;
const kLeastHeight = 26;
const kLeastFrame = 8;
const kLeastUse = 12; // of either side; what is thinner shows nothing

export class Overview {
    readonly element = html("div", { class: "overview", "aria-hidden": "true", hidden: true });
    private readonly drawing = svg("svg", { preserveAspectRatio: "xMidYMid meet" });
    private readonly frame = svg("rect", { class: "window" });
    private area: Rectangle | null = null;
    private bounds: Rectangle | null = null;
    private scale = 1; // px for a point

    constructor(private readonly camera: Camera) {
        this.element.append(this.drawing);
        let held = false;
        this.drawing.addEventListener("pointerdown", (event) => {
            held = true;
            this.drawing.setPointerCapture(event.pointerId);
            this.go(event, 260);
        });
        this.drawing.addEventListener("pointermove", (event) => held && this.go(event, 0));
        for (const end of ["pointerup", "pointercancel"]) this.drawing.addEventListener(end, () => (held = false));
    }

    show(picture: Picture): void {
        const { bounds } = picture;
        this.bounds = bounds;
        this.area = grown(bounds, picture.focusBox.width / 2, picture.focusBox.height / 2);
        const { left, top, right, bottom } = this.area;
        this.scale = Math.min(kMostWidth / (right - left), kMostHeight / (bottom - top));
        const height = Math.max(kLeastHeight, (bottom - top) * this.scale);
        const focus = picture.areaOf(picture.focusBox);
        const mark = Math.max(4 / this.scale, 0);
        setAttributes(this.drawing, {
            viewBox: `${left} ${top} ${right - left} ${bottom - top}`,
            width: Math.round((right - left) * this.scale),
            height: Math.round(height),
        });
        const dot = svg("circle", {
            class: "focus-dot",
            cx: (focus.left + focus.right) / 2,
            cy: (focus.top + focus.bottom) / 2,
            r: mark,
        });
        this.drawing.replaceChildren(...overviewPaths(picture), dot, this.frame);
        this.follow();
    }

    // The window has moved over the picture.
    follow(): void {
        if (!this.area || !this.bounds) return;
        const window = this.camera.window();
        const { area } = this;
        const thin = Math.min(area.right - area.left, area.bottom - area.top) * this.scale;
        this.element.hidden = thin < kLeastUse || encloses(window, this.bounds);
        const least = kLeastFrame / this.scale;
        const left = Math.max(area.left, window.left);
        const top = Math.max(area.top, window.top);
        setAttributes(this.frame, {
            x: left,
            y: top,
            width: Math.max(least, Math.min(area.right, window.right) - left),
            height: Math.max(least, Math.min(area.bottom, window.bottom) - top),
        });
    }

    clear(): void {
        this.area = this.bounds = null;
        this.element.hidden = true;
    }

    private go(event: PointerEvent, time: number): void {
        const matrix = this.drawing.getScreenCTM();
        if (!matrix) return;
        const point = new DOMPoint(event.clientX, event.clientY).matrixTransform(matrix.inverse());
        const target = this.camera.centring(point, this.camera.placing.k);
        if (time > 0) this.camera.travelTo(target, time);
        else this.camera.place(target);
    }
}
