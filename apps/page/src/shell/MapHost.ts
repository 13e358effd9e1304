// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The map of the family that is open: made or unpacked once, shown in the place of the tree, searched without it.

import type { Texts } from "olvane";
import { html } from "../base/dom";
import { CutShortError } from "../engine/engine";
import { FamilyMap } from "../map/FamilyMap";
import { MapError } from "../map/mapBytes";
import { mapPerson } from "../map/mapPerson";
import { MapSearch } from "../map/mapSearch";
import { MapView } from "../map/MapView";
import { Messages } from "../messages";
import type { UiMessages } from "../messages/ui";
import type { Found } from "./searchReasons";

const kSettled = 250; // ms without a move, after which the address follows
const kSlice = 8; // ms of preparing the search between two frames

export interface MapPage {
    openPerson(number: number): void;
    /** The address of what the map shows, when it has come to rest. */
    mapSettled(address: string): void;
}

/** Whether an address is one of a map. */
export function isMapAddress(address: string): boolean {
    return new URLSearchParams(address.replace(/^#/, "")).has("map");
}

export class MapHost {
    readonly element = html("div", { id: "map-place", hidden: true });
    private map: FamilyMap | null = null;
    private search: MapSearch | null = null;
    private view: MapView | null = null;
    private home = 0;
    private isTurned = false; // right and left are exchanged
    private timer = 0;

    constructor(
        private readonly page: MapPage,
        private readonly texts: Texts,
    ) {}

    get isShown(): boolean {
        return !this.element.hidden;
    }

    get isReady(): boolean {
        return this.map !== null;
    }

    get count(): number {
        return this.map?.count ?? 0;
    }

    get address(): string {
        const { view } = this;
        if (!view) return "";
        return `#map=${view.place}${view.number ? "&number=" + view.number : ""}${this.isTurned ? "&mirror=yes" : ""}`;
    }

    get number(): number {
        return this.view?.number ?? 0;
    }

    /** home is the number of the person whom the key Home leads to. Throws MapError. */
    take(bytes: Uint8Array<ArrayBuffer>, home: number): void {
        this.home = home;
        this.isTurned = false;
        this.use(new FamilyMap(bytes));
    }

    private use(map: FamilyMap): void {
        this.map = map;
        this.search = new MapSearch(map, (texts) => this.texts.foldedWords(texts));
        this.view = null;
        this.prepareSearch(this.search);
    }

    get isMirrored(): boolean {
        return this.isTurned;
    }

    /** Exchanges right and left; what is in the middle of the window stays there. */
    setMirrored(ui: UiMessages, isMirrored: boolean): void {
        const { view, map, isTurned } = this;
        if (!map || isMirrored === isTurned) return;
        const place = view?.place.replace(/^-?/, (sign) => (sign ? "" : "-")) ?? "";
        const number = this.number;
        this.isTurned = isMirrored;
        this.use(map.mirrored());
        if (this.isShown) this.makeView(ui).restore(place, number);
    }

    forget(): void {
        this.hide();
        this.map = this.search = this.view = null;
    }

    /** The map is there, so that it can be laid out; where it stands, show says. */
    reveal(ui: UiMessages): void {
        if (!this.map) return;
        this.element.hidden = false;
        this.makeView(ui);
    }

    show(ui: UiMessages, address: string): void {
        if (!this.map) return;
        const parts = new URLSearchParams(address.replace(/^#/, ""));
        this.element.hidden = false;
        this.setMirrored(ui, parts.get("mirror") === "yes");
        this.makeView(ui).restore(parts.get("map") ?? "", Number(parts.get("number")) || this.number);
    }

    hide(): void {
        clearTimeout(this.timer);
        this.element.hidden = true;
    }

    /** In another language. */
    rebuild(ui: UiMessages): void {
        const { address } = this;
        this.view = null;
        if (this.isShown) this.show(ui, address);
    }

    goTo(number: number): void {
        if (this.map && this.view) this.view.goTo(this.map.person(number));
    }

    takeKeys(): void {
        this.view?.takeKeys();
    }

    find(text: string, limit: number): Found[] {
        const { map, search } = this;
        if (!map || !search) return [];
        return search.find(text, limit).map((one) => {
            const person = mapPerson(map, one);
            return { person, hit: { person: person.id, fit: "whole", reasons: [] } };
        });
    }

    private makeView(ui: UiMessages): MapView {
        if (this.view) return this.view;
        const map = this.map!;
        const home = Math.max(0, map.person(this.home));
        this.view = new MapView(map, ui, new Messages(ui.language, () => this.texts), home, {
            openPerson: (number) => this.page.openPerson(number),
            mapMoved: () => this.moved(),
        });
        this.element.replaceChildren(this.view.element);
        return this.view;
    }

    private moved(): void {
        clearTimeout(this.timer);
        if (!this.isShown) return;
        this.timer = window.setTimeout(() => this.page.mapSettled(this.address), kSettled);
    }

    private prepareSearch(search: MapSearch): void {
        setTimeout(() => {
            if (this.search === search && !search.prepare(kSlice)) this.prepareSearch(search);
        }, 30);
    }
}

/** What to say of a map that cannot be shown. */
export function mapComplaint(error: unknown, ui: UiMessages): string {
    const { map } = ui;
    if (error instanceof CutShortError) return map.cutShort;
    if (!(error instanceof MapError)) return map.damaged;
    if (error.kind === "cut") return map.cut(error.have, error.wanted);
    return error.kind === "version" ? map.version : map.damaged;
}
