// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// All views to choose from, each with a small picture of it, and how far the chosen one reaches.

import { checkbox, iconButton, switchRow } from "../base/controls";
import { html, onClick } from "../base/dom";
import { icon } from "../base/icons";
import {
    type ChartDirection,
    hasCompact,
    hasDirection,
    hasDown,
    hasUp,
    kDirections,
    kViewNames,
    type ViewName,
} from "../base/views";
import type { UiMessages } from "../messages/ui";
import type { ViewState } from "../view/ViewState";
import type { PictureSwitches } from "./PictureSwitches";
import { Popover } from "./Popover";

const kMostCounted = 10; // generations; one step further on the slider is all of them

export interface ViewActions {
    setView(view: ViewName): void;
    /** Shows everybody as a map. */
    setMap(): void;
    /** Exchanges right and left of what is shown. */
    setMirrored(isMirrored: boolean): void;
}

export class ViewChooser {
    readonly popover: Popover;
    private readonly buttons = new Map<ViewName, HTMLButtonElement>();
    private readonly map: HTMLButtonElement;
    private readonly depths = new Map<"up" | "down", Depth>();
    private readonly direction: HTMLSelectElement;
    private readonly directionRow: HTMLElement;
    private readonly compact: HTMLInputElement;
    private readonly compactRow: HTMLElement;
    private readonly mirrored: HTMLInputElement;

    constructor(
        private readonly ui: UiMessages,
        private readonly actions: ViewActions,
        switches: PictureSwitches,
    ) {
        const views = html("div", { class: "views", role: "group", "aria-label": ui.views.label });
        for (const view of kViewNames) views.append(this.viewButton(view));
        this.map = html(
            "button",
            { id: "choose-map", type: "button", class: "view", "aria-pressed": "false" },
            icon("map"),
            html("span", {}, ui.map.name),
        );
        // The keys go to the map.
        onClick(this.map, () => {
            this.popover.close();
            actions.setMap();
        });
        views.append(this.map);
        this.direction = html("select", { id: "direction" });
        for (const name of kDirections) this.direction.append(html("option", { value: name }, ui.directions[name]));
        this.direction.addEventListener("change", () => switches.setDirection(this.direction.value as ChartDirection));
        this.directionRow = html("label", { class: "row" }, html("span", {}, ui.direction), this.direction);
        this.compact = checkbox("compact", (checked) => switches.setCompact(checked));
        this.compactRow = switchRow(this.compact, ui.compact);
        this.mirrored = checkbox("mirrored", (checked) => actions.setMirrored(checked));
        for (const which of ["up", "down"] as const)
            this.depths.set(which, new Depth(which, ui, (n) => switches.setDepth(which, n)));
        this.popover = new Popover(
            iconButton("views-button", "views", ui.views.label, () => {}),
            html(
                "div",
                { id: "views-panel", class: "sheet", role: "region", "aria-label": ui.views.label },
                views,
                ...[...this.depths.values()].map((depth) => depth.row),
                this.directionRow,
                this.compactRow,
                switchRow(this.mirrored, ui.mirrored),
            ),
        );
    }

    show({ view, up, down, direction, to, compact, mirrored }: ViewState): void {
        this.mirrored.checked = mirrored === true;
        for (const [name, button] of this.buttons) {
            button.setAttribute("aria-pressed", String(name === view));
            // Ways lead to a second person, who is chosen in the panel about them.
            if (name === "kinship") button.disabled = view !== name && to === 0;
        }
        this.depths.get("up")!.show(hasUp(view), up);
        this.depths.get("down")!.show(hasDown(view), down);
        this.directionRow.hidden = !hasDirection(view);
        this.direction.value = direction;
        this.compactRow.hidden = !hasCompact(view);
        this.compact.checked = compact;
    }

    showMap(shown: boolean, isMirrored: boolean): void {
        if (shown) this.mirrored.checked = isMirrored;
        this.map.setAttribute("aria-pressed", String(shown));
        if (shown) for (const button of this.buttons.values()) button.setAttribute("aria-pressed", "false");
    }

    private viewButton(view: ViewName): HTMLButtonElement {
        const button = html(
            "button",
            { id: "choose-" + view, type: "button", class: "view", "aria-pressed": "false" },
            icon(view),
            html("span", {}, this.ui.views[view]),
        );
        onClick(button, () => this.actions.setView(view));
        this.buttons.set(view, button);
        return button;
    }
}

// A slider for a number of generations.
class Depth {
    readonly row: HTMLElement;
    private readonly slider: HTMLInputElement;
    private readonly value = html("output", {});

    constructor(
        which: "up" | "down",
        private readonly ui: UiMessages,
        change: (generations: number) => void,
    ) {
        this.slider = html("input", { id: "depth-" + which, type: "range", min: 1, max: kMostCounted + 1, step: 1 });
        this.slider.addEventListener("change", () => change(this.generations));
        this.slider.addEventListener("input", () => this.name(this.generations));
        this.row = html("label", { class: "row depth" }, html("span", {}, ui.depth[which]), this.slider, this.value);
    }

    show(isUsed: boolean, generations: number): void {
        this.row.hidden = !isUsed;
        this.slider.value = String(generations === 0 ? kMostCounted + 1 : Math.min(generations, kMostCounted));
        this.name(generations);
    }

    private get generations(): number {
        const value = Number(this.slider.value);
        return value > kMostCounted ? 0 : value;
    }

    private name(generations: number): void {
        const text = generations === 0 ? this.ui.depth.all : String(generations);
        this.value.textContent = text;
        this.slider.setAttribute("aria-valuetext", text);
    }
}
