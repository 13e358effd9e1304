// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Everybody as a map to move about in. The picture is one canvas; keys and screen readers walk from person to person,
// along kin and not along pixels.

import type { Person } from "olvane";
import { iconButton } from "../base/controls";
import { html } from "../base/dom";
import type { Messages } from "../messages";
import type { UiMessages } from "../messages/ui";
import { type FamilyMap, type Kin, kNobody } from "./FamilyMap";
import { kReadable, MapCamera, type MapPlace } from "./MapCamera";
import { type MapColours, mapColours } from "./mapColours";
import { takeGestures } from "./mapGestures";
import { mapPerson } from "./mapPerson";
import { type Frame, MapPixels } from "./MapPixels";
import { MapTexts } from "./MapTexts";
import { PersonCard } from "./PersonCard";

const kPanStep = 90; // px
const kZoomStep = 1.6;

export interface MapActions {
    /** Leaves the map for a person's family. */
    openPerson(number: number): void;
    /** After the map has moved or somebody was chosen. */
    mapMoved(): void;
}

const kNoKin: Kin = { parents: [], partners: [], children: [], siblings: [] };

export class MapView {
    readonly element: HTMLElement;
    readonly camera: MapCamera;
    private readonly canvas: HTMLCanvasElement;
    private readonly context: CanvasRenderingContext2D;
    private readonly pixels: MapPixels;
    private readonly texts: MapTexts;
    private readonly card: PersonCard;
    private readonly live = html("div", { class: "unseen", role: "status", "aria-live": "polite" });
    private colours: MapColours | null = null;
    private current = kNobody;
    private cameFrom = kNobody; // the child from whom keys went up
    private kin: Kin = kNoKin;
    private asked = 0; // for a frame; 0 for none
    private awaitsSize = false; // shows everything once the window is laid out

    constructor(
        readonly map: FamilyMap,
        ui: UiMessages,
        private readonly messages: Messages,
        private readonly home: number, // person
        private readonly actions: MapActions,
    ) {
        this.canvas = html("canvas", {
            tabindex: 0,
            role: "application",
            "aria-label": ui.map.label(map.count),
            "aria-describedby": "map-hint",
        });
        this.context = this.canvas.getContext("2d", { alpha: false, willReadFrequently: true })!;
        this.camera = new MapCamera(map.area, () => this.moved());
        this.pixels = new MapPixels(map);
        this.texts = new MapTexts(map, this.context, (p) => this.yearsOf(p), messages.unknownName);
        this.card = new PersonCard(map, ui, {
            go: (p) => this.goTo(p),
            open: (p) => this.open(p),
            closeCard: () => this.choose(kNobody),
            nameOf: (p) => this.nameOf(p),
            yearsOf: (p) => this.yearsOf(p),
        });
        const zoom = html(
            "div",
            { class: "zoom", role: "group", "aria-label": ui.zoom },
            iconButton("map-in", "plus", ui.zoomIn, () => this.camera.zoomBy(kZoomStep)),
            iconButton("map-out", "minus", ui.zoomOut, () => this.camera.zoomBy(1 / kZoomStep)),
            iconButton("map-fit", "fit", ui.fit, () => this.camera.fly(this.camera.whole)),
        );
        this.element = html(
            "section",
            { id: "map", "aria-label": ui.map.name },
            this.canvas,
            html("p", { id: "map-hint", class: "unseen" }, ui.map.hint),
            this.card.element,
            zoom,
            this.live,
        );
        this.canvas.addEventListener("keydown", (event) => {
            if (this.key(event)) event.preventDefault();
        });
        takeGestures(this.canvas, this.camera, {
            click: (x, y) => this.click(x, y),
            doubleClick: (x, y) => this.doubleClick(x, y),
        });
        new ResizeObserver(() => this.resized()).observe(this.canvas);
        const repaint = () => this.repaint();
        new MutationObserver(repaint).observe(document.documentElement, { attributeFilter: ["data-theme"] });
        matchMedia("(forced-colors: active)").addEventListener("change", repaint);
    }

    // --- where it stands ---

    /** In the form of an address: the middle in points, and px a point; empty as long as it is not laid out. */
    get place(): string {
        if (this.awaitsSize) return "";
        const { x, y, k } = this.camera.place;
        return `${Math.round(x)},${Math.round(y)},${Number(k.toPrecision(4))}`;
    }

    /** The number of the person who is chosen; 0 for nobody. */
    get number(): number {
        return this.current === kNobody ? 0 : this.map.number(this.current);
    }

    /** Goes where an address says; to everything where it says nothing that can be read. */
    restore(place: string, number: number): void {
        this.measure();
        const [x, y, k] = place.split(",").map(Number) as [number, number, number];
        this.select(this.map.person(number));
        const isPlace = [x, y, k].every(Number.isFinite) && k > 0;
        this.awaitsSize = !isPlace && this.canvas.clientWidth === 0;
        this.camera.jump(isPlace ? { x, y, k } : this.camera.whole);
    }

    takeKeys(): void {
        this.canvas.focus({ preventScroll: true });
    }

    /** Flies to a person near enough to read the name. */
    goTo(person: number): void {
        this.choose(person);
        this.takeKeys();
        const { left, top, right, bottom } = this.map.box(person);
        const target: MapPlace = {
            x: (left + right) / 2,
            y: (top + bottom) / 2,
            k: Math.max(kReadable, this.camera.place.k),
        };
        const start = performance.now();
        this.camera.fly(target, () => {
            this.draw();
            performance.measure("olvane-map-flight", { start });
        });
    }

    private choose(person: number): void {
        this.select(person);
        this.actions.mapMoved();
        this.draw();
    }

    private select(person: number): void {
        this.current = person;
        this.kin = person === kNobody ? kNoKin : this.map.kin(person);
        if (person === kNobody) this.card.hide();
        else this.card.show(person, this.kin);
        this.live.textContent = person === kNobody ? "" : this.card.spoken(person, this.kin);
    }

    private open(person: number): void {
        this.actions.openPerson(this.map.number(person));
    }

    // --- hands and keys ---

    private click(x: number, y: number): void {
        const at = this.camera.toMap(x, y);
        this.cameFrom = kNobody;
        this.choose(this.map.personAt(at.x, at.y));
    }

    private doubleClick(x: number, y: number): void {
        const at = this.camera.toMap(x, y);
        const person = this.map.personAt(at.x, at.y);
        if (person !== kNobody && this.camera.place.k >= kReadable / 2) this.open(person);
        else this.camera.fly({ ...at, k: this.camera.place.k * 4 });
    }

    private key(event: KeyboardEvent): boolean {
        if (event.ctrlKey || event.altKey || event.metaKey) return false;
        const arrow = /^Arrow(Up|Down|Left|Right)$/.exec(event.key)?.[1];
        if (arrow && event.shiftKey) this.pan(arrow);
        else if (arrow) this.follow(arrow);
        else if (event.key === "+" || event.key === "=") this.camera.zoomBy(kZoomStep);
        else if (event.key === "-") this.camera.zoomBy(1 / kZoomStep);
        else if (event.key === "0") this.camera.fly(this.camera.whole);
        else if (event.key === "Home") this.goTo(this.home);
        else if (event.key === "Enter" && this.current !== kNobody) this.open(this.current);
        else if (event.key === "Escape" && this.current !== kNobody) this.choose(kNobody);
        else return false;
        return true;
    }

    private pan(arrow: string): void {
        const x = arrow === "Left" ? 1 : arrow === "Right" ? -1 : 0;
        const y = arrow === "Up" ? 1 : arrow === "Down" ? -1 : 0;
        this.camera.panBy(x * kPanStep, y * kPanStep);
    }

    // Up to the father, else the mother, who stands beside him; down to the child that one came from, else the first;
    // aside to the next partner or sibling that way.
    private follow(arrow: string): void {
        if (this.current === kNobody) return this.map.count > 0 ? this.goTo(this.home) : undefined;
        const { parents, children, partners, siblings } = this.kin;
        const here = this.current;
        if (arrow === "Up") {
            if (parents.length === 0) return;
            this.goTo(parents[0]!);
            this.cameFrom = here;
        } else if (arrow === "Down") {
            const child = children.includes(this.cameFrom) ? this.cameFrom : children[0];
            if (child !== undefined) this.goTo(child);
        } else {
            const aside = this.nearest([...partners, ...siblings], arrow === "Left" ? -1 : 1);
            if (aside !== kNobody) this.goTo(aside);
        }
    }

    private nearest(persons: readonly number[], side: number): number {
        const { left } = this.map.box(this.current);
        let best = kNobody;
        let least = Infinity;
        for (const person of persons) {
            const ahead = (this.map.box(person).left - left) * side;
            if (ahead > 0 && ahead < least) [best, least] = [person, ahead];
        }
        return best;
    }

    // --- drawing ---

    private nameOf(person: number): string {
        return this.messages.nameOf(this.person(person));
    }

    private yearsOf(person: number): string {
        return this.messages.yearsOf(this.person(person));
    }

    private person(person: number): Person {
        return mapPerson(this.map, person);
    }

    private moved(): void {
        this.actions.mapMoved();
        this.asked ||= requestAnimationFrame(() => this.draw());
    }

    private measure(): void {
        this.camera.width = this.canvas.clientWidth || 1;
        this.camera.height = this.canvas.clientHeight || 1;
    }

    private resized(): void {
        if (this.canvas.clientWidth === 0) return; // hidden
        this.measure();
        this.camera.jump(this.awaitsSize ? this.camera.whole : this.camera.place);
        this.awaitsSize = false;
        this.draw();
    }

    private repaint(): void {
        this.colours = null;
        this.asked ||= requestAnimationFrame(() => this.draw());
    }

    private draw(): void {
        cancelAnimationFrame(this.asked);
        this.asked = 0;
        const frame = this.frame();
        if (!this.element.isConnected || frame.width < 2) return;
        const { canvas, context } = this;
        if (canvas.width !== frame.width || canvas.height !== frame.height) {
            canvas.width = frame.width;
            canvas.height = frame.height;
        }
        this.colours ??= mapColours(this.element);
        const near = new Set([...this.kin.parents, ...this.kin.partners, ...this.kin.children]);
        context.putImageData(this.pixels.draw(frame, this.colours, near), 0, 0);
        this.texts.draw(frame, this.colours.texts);
        if (this.current !== kNobody) this.ring(frame, this.colours.current);
    }

    private frame(): Frame {
        const { width, height, place, ky } = this.camera;
        const dpr = devicePixelRatio || 1;
        const [sx, sy] = [(place.k * dpr) / 4, (ky * dpr) / 4];
        return {
            sx,
            sy,
            ox: Math.round((width * dpr) / 2 - place.x * place.k * dpr),
            oy: Math.round((height * dpr) / 2 - place.y * ky * dpr),
            width: Math.round(width * dpr),
            height: Math.round(height * dpr),
            dpr,
        };
    }

    // Around the chosen person, however small the box is.
    private ring({ sx, sy, ox, oy, dpr }: Frame, colour: string): void {
        const { left, top, right, bottom } = this.map.box(this.current);
        const { context } = this;
        const least = 9 * dpr;
        const [width, height] = [Math.max(least, (right - left) * 4 * sx), Math.max(least, (bottom - top) * 4 * sy)];
        const [x, y] = [(left + right) * 2 * sx + ox, (top + bottom) * 2 * sy + oy];
        context.strokeStyle = colour;
        context.lineWidth = 3 * dpr;
        context.strokeRect(x - width / 2 - 2 * dpr, y - height / 2 - 2 * dpr, width + 4 * dpr, height + 4 * dpr);
    }
}
