// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The viewer as an element of its own, <olvane-tree>: the picture, the buttons over it and the panel about the
// selected person. The page around it listens to its events and sets what it shows; it keeps no history, opens
// no dialog and stores nothing. Everything inside lies in its own shadow tree, so that any number of them stand
// on one page. Here are its attributes, properties and methods; Viewer is what they act on.

import type { DrawingTheme, GedcomFile, Olvane, PaperOptions, PaperSheets, Person } from "olvane";
import type { ViewName } from "../base/views";
import { OpenFamily } from "../view/OpenFamily";
import type { Box } from "../view/Picture";
import type { Sight } from "../view/SharedLink";
import { addressOf, factsIn, kUsualState, readAddress, type ViewState } from "../view/ViewState";
import { viewerStyles } from "./styles";
import type { BoxRenderer, EmitTreeEvent, FamilyData } from "./treeTypes";
import { Viewer } from "./Viewer";
import { WatchedData } from "./WatchedData";

export class OlvaneTree extends HTMLElement {
    /** Where viewers get the engine that they share; set before any of them gets a file. */
    static engine: (() => Promise<Olvane>) | null = null;
    static readonly observedAttributes = ["src", "focus", "view", "language", "panel", "kinship", "theme", "show"];

    private readonly viewer: Viewer;
    private loading = new AbortController(); // of the file that was asked for last
    private readonly watched = new WatchedData(() => this.orReport(this.refresh()));
    private askedSrc: string | null = null; // by the attribute, at last and without a failure

    constructor() {
        super();
        const shadow = this.attachShadow({ mode: "open", delegatesFocus: false });
        shadow.adoptedStyleSheets = [...viewerStyles()];
        const emit: EmitTreeEvent = (name, detail) =>
            !this.dispatchEvent(new CustomEvent(name, { detail, cancelable: true }));
        this.viewer = new Viewer(this, shadow, emit);
        shadow.addEventListener("keydown", (event) => this.viewer.input.key(event as KeyboardEvent));
    }

    connectedCallback(): void {
        this.viewer.connect();
        if (!this.hasAttribute("data-theme")) this.applyTheme();
        const src = this.getAttribute("src");
        if (src && src !== this.askedSrc && !(this.family && this.askedSrc === null)) this.loadAttribute(src);
        this.takeEarlyProperties();
        this.watched.follow(true);
    }

    // What was set before the browser knew the element hides the property of that name.
    private takeEarlyProperties(): void {
        for (const name of ["data", "renderBox"] as const) {
            if (!Object.hasOwn(this, name)) continue;
            const value = this[name];
            Reflect.deleteProperty(this, name);
            Object.assign(this, { [name]: value });
        }
    }

    disconnectedCallback(): void {
        this.viewer.disconnect();
        this.watched.follow(false);
    }

    attributeChangedCallback(name: string, before: string | null, now: string | null): void {
        if (before === now) return;
        if (name === "src" && this.isConnected && now) this.loadAttribute(now);
        if (name === "language") this.viewer.changeLanguage();
        if (name === "panel") this.viewer.parts.classList.toggle("panel-closed", now === "closed");
        if (name === "kinship") this.viewer.restyle();
        if (name === "theme") this.applyTheme();
        if (name === "show") this.show({ show: factsIn(now ?? "") });
        if ((name === "focus" || name === "view") && this.family) this.show(this.attributeState(this.family));
    }

    // --- the family ---

    /** The family that is shown; null before any. */
    get family(): OpenFamily | null {
        return this.viewer.shown.family;
    }

    /** What is shown; null before any picture. */
    get state(): ViewState | null {
        return this.viewer.shown.state;
    }

    /** The selected person: the one that the panel is about. */
    get selected(): Person | null {
        return this.family?.person(this.viewer.panelPersonId) ?? null;
    }

    /**
     * Fetches a GEDCOM file and shows it. Rejects where it cannot be fetched or read, and with an AbortError where another
     * file is asked for before it has come: the one that is asked for last is shown, however long each takes.
     */
    async load(address: string): Promise<void> {
        const signal = this.supersede();
        const response = await fetch(address, { signal });
        if (!response.ok) throw new Error(`${response.url}: ${response.status} ${response.statusText}`);
        const name = decodeURIComponent(new URL(address, document.baseURI).pathname.split("/").at(-1) || address);
        await this.openUnless(signal, new Uint8Array(await response.arrayBuffer()), name);
    }

    // Ends the loading of the file before; the signal is that of the file that follows.
    private supersede(): AbortSignal {
        this.loading.abort();
        this.loading = new AbortController();
        return this.loading.signal;
    }

    private loadAttribute(address: string): void {
        this.askedSrc = address;
        this.orReport(this.load(address));
    }

    // Nobody waits for what an attribute or a property asks for, so a failure is an event.
    private orReport(work: Promise<void>): void {
        work.catch((error: unknown) => {
            if (error instanceof DOMException && error.name === "AbortError") return;
            this.askedSrc = null;
            const message = error instanceof Error ? error.message : String(error);
            this.dispatchEvent(new ErrorEvent("error", { message, error }));
        });
    }

    /** Shows the bytes of a GEDCOM file. Rejects with GedcomError where they are none, and with an AbortError as load() does. */
    async open(bytes: Uint8Array, name = "family.ged"): Promise<void> {
        await this.openUnless(this.supersede(), bytes, name);
    }

    private async openUnless(signal: AbortSignal, bytes: Uint8Array, name: string): Promise<void> {
        if (!OlvaneTree.engine) throw new Error("OlvaneTree.engine is not set");
        const engine = await OlvaneTree.engine();
        signal.throwIfAborted();
        this.openFile(engine.readGedcom(bytes, name));
    }

    /** Shows a file that is open already; the viewer closes it when it gets another. */
    openFile(file: GedcomFile, title = file.name, livingHidden = false): void {
        this.supersede();
        const family = new OpenFamily(file, title, livingHidden);
        this.setFamily(family);
        this.show(this.attributeState(family));
        this.warmUp();
    }

    /**
     * Shows what has changed in the family that is shown: the bytes of its GEDCOM file as they are now. Focus, selection and
     * place stay with the persons of the same xrefs. Rejects with GedcomError, and then shows what it showed before.
     */
    async update(bytes: Uint8Array): Promise<void> {
        const { family: earlier, state: before, sight } = this;
        if (!earlier || !before || !OlvaneTree.engine) return this.open(bytes);
        const engine = await OlvaneTree.engine();
        const family = new OpenFamily(engine.readGedcom(bytes, earlier.file.name), earlier.title, earlier.livingHidden);
        family.file.takePlacesOf(earlier.file);
        const address = addressOf(before, earlier.persons);
        const selected = this.selected?.xref ?? "";
        const state = readAddress(address, family.persons, { ...kUsualState, focus: family.bestFocus() });
        const keys = this.viewer.holdsKeys();
        this.setFamily(family);
        this.show(state);
        const again = family.persons.find(({ xref }) => xref !== "" && xref === selected)?.id ?? state.focus;
        this.viewer.select(again, keys);
        this.sight = sight;
    }

    /**
     * A family of the program's own in place of a file. It is shown again after each of its "change" events: once for all
     * changes that are made in a row. What stays then is as in update().
     */
    get data(): FamilyData | null {
        return this.watched.data;
    }

    set data(data: FamilyData | null) {
        this.watched.data = data;
    }

    /** Shows data as it is now, for data without events. */
    async refresh(): Promise<void> {
        const bytes = this.watched.bytes();
        if (bytes) await this.update(bytes);
    }

    /**
     * Draws the inside of boxes: an SVG element with its origin in the box's upper left corner, or null for the usual. What is
     * read out of a box, its frame and its marks stay.
     */
    get renderBox(): BoxRenderer | null {
        return this.viewer.renderer;
    }

    set renderBox(render: BoxRenderer | null) {
        this.viewer.renderer = render;
        this.viewer.restyle();
    }

    /** Takes a family without showing it yet: show() follows. */
    setFamily(family: OpenFamily): void {
        this.viewer.setFamily(family);
    }

    // --- what to show ---

    /**
     * Shows a person, a view or options; what is left out stays as it is. anchor is the box that hands its place
     * on the screen to the new focus. False where that was not possible: then everything is as before.
     */
    show(wanted: Partial<ViewState>, anchor: Box | null = null, byUser = false): boolean {
        return this.viewer.show(wanted, anchor, byUser);
    }

    /** Makes a person the focus, from the box where they stand. */
    focusOn(person: number, from: Box | null = null): void {
        this.viewer.focusOn(person, from);
    }

    /** Selects a person without changing the picture. */
    select(person: number): void {
        this.viewer.select(person);
    }

    fit(): void {
        this.viewer.scene.fit();
    }

    home(): void {
        this.viewer.scene.home();
    }

    zoomBy(factor: number): void {
        this.viewer.zoomBy(factor);
    }

    /** Which part of the picture is in sight; null before any. */
    get sight(): Sight | null {
        return this.viewer.sight;
    }

    set sight(sight: Sight | null) {
        this.viewer.sight = sight;
    }

    /** Puts the keys on the selected box. */
    takeKeys(): void {
        this.viewer.takeKeys();
    }

    /** Draws the panel down to its name on a narrow window. */
    closeSheets(): void {
        this.viewer.closeSheets();
    }

    /** Acts on a key as if it had been pressed in the picture. True where it meant something. */
    press(event: KeyboardEvent): boolean {
        return this.viewer.input.press(event);
    }

    /** Lays out the picture a few times more while nobody waits for it; see ShownPicture. */
    warmUp(): void {
        this.viewer.shown.warmUp();
    }

    /** The whole picture, or what of it is in sight, as the text of an SVG file in the viewer's colours; null before any. */
    saveSvg(inSight = false): string | null {
        return this.drawing(this.dataset["theme"] === "dark" ? "dark" : "light", inSight);
    }

    /** The whole picture, or what of it is in sight, as the text of an SVG file; null before any. Throws LayoutError. */
    drawing(theme: DrawingTheme, inSight = false): string | null {
        return this.viewer.shown.drawing(theme, inSight ? this.boxesInSight() : undefined);
    }

    private boxesInSight(): number[] {
        const { picture, scene } = this.viewer;
        return picture?.boxesWithin(scene.camera.shown).map(({ index }) => index) ?? [];
    }

    /** The whole picture on sheets of paper, in its colours; null before any. */
    sheets(paper: PaperOptions): PaperSheets | null {
        return this.viewer.shown.sheets(paper);
    }

    // --- words ---

    /** What the picture is called; empty before any. */
    get shownTitle(): string {
        return this.viewer.picture ? this.viewer.shown.title() : "";
    }

    nameOf(person: Person): string {
        return this.viewer.messages.nameOf(person);
    }

    yearsOf(person: Person): string {
        return this.viewer.messages.yearsOf(person);
    }

    /** To the focus; empty while it is not known. */
    kinshipOf(person: Person): string {
        return this.viewer.shown.kinshipOf(person);
    }

    private applyTheme(): void {
        const theme = this.getAttribute("theme");
        if (theme) this.dataset["theme"] = theme;
        else if (matchMedia("(prefers-color-scheme: dark)").matches) this.dataset["theme"] = "dark";
        else delete this.dataset["theme"];
    }

    // The state that the attributes ask for, in the form of an address.
    private attributeState(family: OpenFamily): ViewState {
        const focus = (this.getAttribute("focus") ?? "").replaceAll("@", "");
        const usual = { ...kUsualState, focus: this.state?.focus ?? family.bestFocus() };
        const view = (this.getAttribute("view") ?? this.state?.view ?? usual.view) as ViewName;
        const parts = new URLSearchParams({ view });
        if (focus) parts.set("person", focus);
        parts.set("show", this.getAttribute("show") ?? [...(this.state?.show ?? [])].join(","));
        return readAddress("#" + parts.toString(), family.persons, usual);
    }
}

/** Makes <olvane-tree> known to the browser; once is enough. */
export function defineOlvaneTree(): void {
    // Frameworks set an attribute as the property of its name where there is one: here that would be the method.
    Object.defineProperty(OlvaneTree.prototype, "focus", {
        get: () => HTMLElement.prototype.focus,
        set(this: OlvaneTree, person: unknown) {
            this.setAttribute("focus", String(person));
        },
    });
    if (!customElements.get("olvane-tree")) customElements.define("olvane-tree", OlvaneTree);
}
