// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What clicks, fingers, the keyboard focus and the pointer mean to the boxes and lines that are drawn.

import type { Branch } from "olvane";
import type { Box } from "../view/Picture";
import type { Placing } from "./Camera";

const kDoubleTap = 400; // ms
const kReleases = ["pointerup", "pointercancel"] as const;

export interface SceneEvents {
    // A box was clicked or tapped twice.
    opened(box: Box): void;
    // A box was clicked or tapped once.
    selected(box: Box): void;
    // The keys stand on another box.
    active(box: Box): void;
    // The mark of further parents was clicked or tapped.
    furtherParents(box: Box): void;
    // The mark of a branch was clicked or tapped.
    folded(box: Box, branch: Branch): void;
    pointed(box: Box | null, element: SVGGElement | null): void;
    moved(placing: Placing): void;
}

/** What is drawn, as far as input must know of it. */
export interface SceneTarget {
    readonly active: Box | null;
    activate(box: Box, takeKeys?: boolean): void;
    elementOf(box: Box): SVGGElement | undefined;
    boxAt(target: EventTarget | null): Box | null;
    // A family by its lines' name; null for none.
    pointAtFamily(family: string | null): void;
}

/** Listens as long as the surface lives. */
export function listenToSurface(surface: SVGSVGElement, target: SceneTarget, events: SceneEvents): void {
    let lastClicked: Box | null = null;
    let lastTime = 0;
    surface.addEventListener("click", (event) => {
        const box = target.boxAt(event.target);
        if (!box) return;
        if ((event.target as Element).closest(".further")) return events.furtherParents(box);
        const branch = (event.target as Element).closest(".fold")?.getAttribute("data-branch");
        if (branch) return events.folded(box, branch as Branch);
        // The second of two quick clicks opens what the first one selected.
        // Browsers count clicks of a mouse, but not all of them those of a finger.
        const isQuick = event.detail > 1 || event.timeStamp - lastTime < kDoubleTap;
        const isSecond = isQuick && box === lastClicked;
        lastClicked = isSecond ? null : box;
        lastTime = event.timeStamp;
        if (isSecond) return events.opened(box);
        if (box.person && box !== target.active) target.activate(box, false);
        events.selected(box);
    });
    // A box that is pressed gets the keys, but the picture must hold still until it is known whether that is a
    // click or the beginning of a drag.
    let pressed = false;
    const release = (): void => {
        pressed = false;
        for (const end of kReleases) removeEventListener(end, release, true);
    };
    // The window outlives the surface, so it holds a listener no longer than the surface is pressed.
    const press = (): void => {
        pressed = true;
        for (const end of kReleases) addEventListener(end, release, true);
    };
    surface.addEventListener("pointerdown", press, { capture: true });
    surface.addEventListener("focusin", (event) => {
        const box = target.boxAt(event.target);
        if (box && box !== target.active && !pressed) target.activate(box);
    });
    surface.addEventListener("pointerover", (event) => {
        if (event.pointerType === "touch") return;
        const box = target.boxAt(event.target);
        events.pointed(box, box ? (target.elementOf(box) ?? null) : null);
        const group = (event.target as Element | null)?.closest?.("[data-family]");
        target.pointAtFamily(group?.getAttribute("data-family") ?? null);
    });
    surface.addEventListener("pointerleave", () => {
        events.pointed(null, null);
        target.pointAtFamily(null);
    });
    // The browser itself must not scroll the surface to a box that got the keys.
    surface.addEventListener("scroll", () => surface.scrollTo(0, 0));
}
