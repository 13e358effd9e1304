// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The viewer as an element of its own, <olvane-tree>: the picture, the buttons over it and the panel about the
// selected person. Whoever places it listens to its events and sets what it shows; it keeps no history, opens
// no dialog and stores nothing. Everything inside lies in its own shadow tree, so that any number of them stand
// on one page.

import {
    type Branch,
    type BranchSize,
    type DrawingTheme,
    type GedcomFile,
    LayoutError,
    type Olvane,
    type PaperOptions,
    type PaperSheets,
    type Person,
    type PictureOptions,
} from "olvane";
import { html, setAttributes, svg } from "../base/dom";
import { hasFolds, type ViewName } from "../base/views";
import { type Messages, messagesFor } from "../messages";
import { nameOf, yearsOf } from "../messages/names";
import { type UiMessages, uiMessagesFor } from "../messages/ui";
import type { Placing } from "../scene/Camera";
import { PictureContents } from "../scene/PictureContents";
import { Scene } from "../scene/Scene";
import { Corner } from "../ui/Corner";
import { Overview } from "../ui/Overview";
import { type OuterKey, pictureKey } from "../ui/pictureKeys";
import { SidePanel } from "../ui/SidePanel";
import { Tooltip } from "../ui/Tooltip";
import { boxTowards, type Direction } from "../view/kinMoves";
import { OpenFamily } from "../view/OpenFamily";
import type { Box, Picture } from "../view/Picture";
import type { Sight } from "../view/SharedLink";
import {
    addressOf,
    factsIn,
    kUsualState,
    readAddress,
    type Reader,
    sameState,
    type ViewState,
    withFold,
    withNextParents,
} from "../view/ViewState";
import { viewerStyles } from "./styles";

const kSoonSearched = 6000; // persons; among so many, kinship is known before a picture of usual size is drawn
const kKinshipTime = 12; // ms at a time for finding it out
const kWarmUps = 8;
const kWarmUpPause = 120; // ms
const kWarmEnough = 12; // ms; what takes less needs no warming
const kRedrawDelay = 60; // ms
const kKinshipDelay = 600; // ms after the picture of a larger family, when its boxes are in their places

const kRightToLeft = /^(ar|dv|fa|he|iw|ps|sd|ug|ur|yi)\b/i; // languages

/** What stands in the box of a person, which has this width and height in points; null for the usual. */
export type BoxRenderer = (person: Person, box: { width: number; height: number }) => SVGElement | null;

/** A family of the program's own: a Family of the package olvane, or whatever answers as one does. */
export interface FamilyData extends Pick<EventTarget, "addEventListener" | "removeEventListener"> {
    /** The text of a GEDCOM file, with everybody as they are now. */
    gedcom(): string;
}

export interface OlvaneTreeEvents {
    /** Another person is selected: the panel is about them. */
    select: CustomEvent<{ person: Person }>;
    /** Another picture is shown. byUser is false where the program asked for it. */
    focuschange: CustomEvent<{ state: ViewState; person: Person; boxes: number; byUser: boolean }>;
    /** The box of an unknown parent was chosen. */
    action: CustomEvent<{ child: Person; parent: "father" | "mother" }>;
    /** A picture could not be laid out; the one before stays. */
    refused: CustomEvent<{ tooLarge: boolean }>;
    /** A key that leads out of the viewer; preventDefault says that it was taken. */
    outerkey: CustomEvent<{ key: OuterKey }>;
}

export class OlvaneTree extends HTMLElement {
    /** Where viewers get the engine that they share; set before any of them gets a file. */
    static engine: (() => Promise<Olvane>) | null = null;
    static readonly observedAttributes = ["src", "focus", "view", "language", "panel", "kinship", "theme", "show"];

    private readonly shadow: ShadowRoot;
    private readonly surface = svg("svg", { id: "tree", role: "application", part: "tree" });
    private readonly hint = html("p", { id: "tree-hint", class: "unseen" });
    private readonly live = html("div", { id: "live", class: "unseen", "aria-live": "polite" });
    private readonly stage = html("div", { class: "stage", part: "stage" });
    private readonly parts = html("div", { class: "parts" });
    private readonly tooltip = new Tooltip();
    private readonly scene: Scene;
    private readonly overview: Overview;
    private readonly size = new ResizeObserver(() => this.resized());
    private corner!: Corner; // made by rebuildUi()
    private panel!: SidePanel;
    private messages: Messages;
    private ui: UiMessages;
    private opened: OpenFamily | null = null;
    private shownState: ViewState | null = null;
    private picture: Picture | null = null;
    private contents: PictureContents | null = null;
    private shownPerson = 0; // in the panel
    private kinshipTimer = 0;
    private boxRenderer: BoxRenderer | null = null;
    private redrawTimer = 0;
    private ownData: FamilyData | null = null;
    private willRefresh = false;
    private isInUse = false; // by a pointer that was pressed in the picture and has not left it

    constructor() {
        super();
        this.shadow = this.attachShadow({ mode: "open", delegatesFocus: false });
        this.shadow.adoptedStyleSheets = [...viewerStyles()];
        this.messages = messagesFor(this.languageTag);
        this.ui = uiMessagesFor(this.languageTag);
        this.scene = new Scene(this.surface, {
            opened: (box) => this.openBox(box),
            selected: (box) => this.selectBox(box),
            furtherParents: (box) => this.showFurtherParents(box),
            folded: (box, branch) => this.fold(box, branch),
            active: (box) => this.showInPanel(box.person || box.child),
            pointed: (box, element) => this.pointAt(box, element),
            moved: (placing) => this.moved(placing),
        });
        this.overview = new Overview(this.scene.camera);
        this.scene.camera.takesWheel = () => this.takesWheel();
        this.surface.addEventListener("pointerdown", () => (this.isInUse = true));
        this.surface.addEventListener("pointerleave", () => (this.isInUse = false));
        this.shadow.append(html("div", { class: "viewer" }, this.parts), this.tooltip.element, this.live);
        this.shadow.addEventListener("keydown", (event) => this.key(event as KeyboardEvent));
        this.rebuildUi();
    }

    connectedCallback(): void {
        this.size.observe(this.surface);
        if (!this.hasAttribute("data-theme")) this.applyTheme();
        const src = this.getAttribute("src");
        if (src && !this.opened) this.loadAttribute(src);
        this.takeEarlyProperties();
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
        this.size.disconnect();
        this.tooltip.hide();
        clearTimeout(this.kinshipTimer);
    }

    attributeChangedCallback(name: string, before: string | null, now: string | null): void {
        if (before === now) return;
        if (name === "src" && this.isConnected && now) this.loadAttribute(now);
        if (name === "language") this.setLanguage(now ?? navigator.language);
        if (name === "panel") this.parts.classList.toggle("panel-closed", now === "closed");
        if (name === "kinship") this.restyle();
        if (name === "theme") this.applyTheme();
        if (name === "show") this.show({ show: factsIn(now ?? "") });
        if ((name === "focus" || name === "view") && this.opened) this.show(this.attributeState());
    }

    // --- the family ---

    /** The family that is shown; null before any. */
    get family(): OpenFamily | null {
        return this.opened;
    }

    /** What is shown; null before any picture. */
    get state(): ViewState | null {
        return this.shownState;
    }

    /** The selected person: the one that the panel is about. */
    get selected(): Person | null {
        return this.opened?.person(this.shownPerson) ?? null;
    }

    /** Fetches a GEDCOM file and shows it. Rejects where it cannot be had or read. */
    async load(address: string): Promise<void> {
        const response = await fetch(address);
        if (!response.ok) throw new Error(`${response.url}: ${response.status} ${response.statusText}`);
        const name = decodeURIComponent(new URL(address, document.baseURI).pathname.split("/").at(-1) || address);
        await this.open(new Uint8Array(await response.arrayBuffer()), name);
    }

    private loadAttribute(address: string): void {
        this.orReport(this.load(address));
    }

    // Nobody waits for what an attribute or a property asks for, so a failure is an event.
    private orReport(work: Promise<void>): void {
        work.catch((error: unknown) => {
            const message = error instanceof Error ? error.message : String(error);
            this.dispatchEvent(new ErrorEvent("error", { message, error }));
        });
    }

    /** Shows the bytes of a GEDCOM file. Rejects with GedcomError where they are none. */
    async open(bytes: Uint8Array, name = "family.ged"): Promise<void> {
        if (!OlvaneTree.engine) throw new Error("OlvaneTree.engine is not set");
        const engine = await OlvaneTree.engine();
        this.openFile(engine.readGedcom(bytes, name));
    }

    /** Shows a file that is open already; the viewer closes it when it gets another. */
    openFile(file: GedcomFile, title = file.name, livingHidden = false): void {
        this.setFamily(new OpenFamily(file, title, livingHidden));
        this.show(this.attributeState());
        this.warmUp();
    }

    /**
     * Shows what has changed in the family that is shown: the bytes of its GEDCOM file as they are now. Focus, selection and
     * place stay with the persons of the same xrefs. Rejects with GedcomError, and then shows what it showed before.
     */
    async update(bytes: Uint8Array): Promise<void> {
        const { opened, shownState, sight } = this;
        if (!opened || !shownState || !OlvaneTree.engine) return this.open(bytes);
        const engine = await OlvaneTree.engine();
        const family = new OpenFamily(engine.readGedcom(bytes, opened.file.name), opened.title, opened.livingHidden);
        family.file.takePlacesOf(opened.file);
        const address = addressOf(shownState, opened.persons);
        const selected = this.selected?.xref ?? "";
        const state = readAddress(address, family.persons, { ...kUsualState, focus: family.bestFocus() });
        const keys = holdsKeys(this.shadow);
        this.setFamily(family);
        this.show(state);
        const again = family.persons.find(({ xref }) => xref !== "" && xref === selected)?.id ?? state.focus;
        const box = this.picture?.boxesOf(again)[0];
        if (box) this.scene.activate(box, keys);
        else this.showInPanel(again);
        this.sight = sight;
    }

    /**
     * A family of the program's own in place of a file. It is shown again after each of its "change" events: once for all
     * changes that are made in a row. What stays then is as in update().
     */
    get data(): FamilyData | null {
        return this.ownData;
    }

    set data(data: FamilyData | null) {
        this.ownData?.removeEventListener("change", this.dataChanged);
        this.ownData = data;
        data?.addEventListener("change", this.dataChanged);
        this.dataChanged();
    }

    /** Shows data as it is now, for data without events. */
    async refresh(): Promise<void> {
        const { ownData } = this;
        if (ownData) await this.update(new TextEncoder().encode(ownData.gedcom()));
    }

    private readonly dataChanged = (): void => {
        if (this.willRefresh) return;
        this.willRefresh = true;
        queueMicrotask(() => {
            this.willRefresh = false;
            this.orReport(this.refresh());
        });
    };

    /**
     * Draws the inside of boxes: an SVG element with its origin in the box's upper left corner, or null for the usual. What is
     * read out of a box, its frame and its marks stay.
     */
    get renderBox(): BoxRenderer | null {
        return this.boxRenderer;
    }

    set renderBox(render: BoxRenderer | null) {
        this.boxRenderer = render;
        this.restyle();
    }

    /** Takes a family without showing it yet: show() follows. */
    setFamily(family: OpenFamily): void {
        this.opened?.close();
        this.opened = family;
        this.picture = null;
        this.shownState = null;
        this.shownPerson = 0;
        this.scene.clear();
        this.overview.clear();
    }

    // --- what to show ---

    /**
     * Shows a person, a view or options; what is left out stays as it is. anchor is the box that hands its place
     * on the screen to the new focus. False where that was not possible: then everything is as before.
     */
    show(wanted: Partial<ViewState>, anchor: Box | null = null, byUser = false): boolean {
        const { opened } = this;
        if (!opened) return false;
        const state: ViewState = { ...(this.shownState ?? { ...kUsualState, focus: opened.bestFocus() }), ...wanted };
        if (this.shownState && this.picture && sameState(state, this.shownState)) return true;
        const start = performance.now();
        let picture: Picture;
        try {
            picture = opened.picture(state, this.reader);
        } catch (error) {
            this.shownState ??= state;
            this.emit("refused", { tooLarge: error instanceof LayoutError && error.status === "tooLarge" });
            return false;
        }
        const isNewFocus = this.shownState?.focus !== state.focus;
        const isNewView = this.shownState !== null && this.shownState.view !== state.view;
        this.shownState = state;
        this.picture = picture;
        this.tooltip.hide();
        this.contents = this.newContents(opened, picture);
        if (opened.persons.length <= kSoonSearched) this.contents.learnKinships(kKinshipTime);
        this.scene.show(picture, this.contents, anchor);
        this.overview.show(picture);
        this.corner.showWays(picture.kinship?.ways ?? []);
        this.nameTree();
        this.learnKinships();
        const person = opened.person(state.focus)!;
        if (isNewFocus || isNewView) {
            const boxes = this.ui.focusNow(this.nameOf(person), picture.boxes.length);
            this.live.textContent = isNewView ? `${this.pictureTitle()}. ${boxes}` : boxes;
        }
        this.shownPerson = state.focus;
        this.refreshPanel();
        performance.measure("olvane-picture", { start });
        this.emit("focuschange", { state, person, boxes: picture.boxes.length, byUser });
        return true;
    }

    // The next of several families of parents, with their child in the middle.
    private showFurtherParents(box: Box): void {
        const { opened, shownState } = this;
        const person = opened?.person(box.person);
        if (!opened || !person || !shownState) return;
        this.show(withNextParents(person, opened.file.parentFamilyOf(person.id), shownState), box, true);
    }

    // Folds a branch or unfolds it, in place; the keys stay on the box.
    private fold(box: Box, branch: Branch): void {
        const { shownState } = this;
        if (!shownState || !box.person) return;
        const keys = holdsKeys(this.shadow);
        this.show({ folded: withFold(shownState, box.person, branch) }, box, true);
        const again = this.picture?.boxOfKey(box.key);
        if (again) this.scene.activate(again, keys);
    }

    // In what language pictures are, and which way it is read.
    private get reader(): Reader {
        const rightToLeft = getComputedStyle(this).direction === "rtl" || kRightToLeft.test(this.languageTag);
        return { language: this.messages.language as PictureOptions["language"], rightToLeft };
    }

    private get languageTag(): string {
        return this.getAttribute("language") ?? navigator.language;
    }

    /** Makes a person the focus, from the box where they stand. */
    focusOn(person: number, from: Box | null = null): void {
        if (!this.shownState || !person) return;
        const anchor = from ?? this.picture?.boxesOf(person)[0] ?? null;
        if (person !== this.shownState.focus) this.show({ focus: person }, anchor, true);
        else if (this.picture) this.scene.activate(from ?? this.picture.focusBox, false);
        this.panel.draw(false);
    }

    /** Selects a person without changing the picture. */
    select(person: number): void {
        const box = this.picture?.boxesOf(person)[0];
        if (box) this.scene.activate(box);
        else this.showInPanel(person);
    }

    fit(): void {
        this.scene.fit();
    }

    home(): void {
        this.scene.home();
    }

    zoomBy(factor: number): void {
        this.scene.camera.zoomBy(factor);
    }

    /** Which part of the picture is in sight; null before any. */
    get sight(): Sight | null {
        if (!this.picture) return null;
        const { camera } = this.scene;
        const { k, x, y } = camera.placing;
        const { width, height } = camera.size;
        const middle = middleOf(this.picture.focusBox);
        return { zoom: k, x: (width / 2 - x) / k - middle.x, y: (height / 2 - y) / k - middle.y };
    }

    set sight(sight: Sight | null) {
        if (!this.picture || !sight) return;
        const { x, y } = middleOf(this.picture.focusBox);
        this.scene.camera.place(this.scene.camera.centring({ x: x + sight.x, y: y + sight.y }, sight.zoom));
    }

    // In a frame the wheel scrolls the page around it until the picture is used.
    private takesWheel(): boolean {
        const rule = this.getAttribute("wheel") ?? (window.self === window.top ? "always" : "active");
        return rule !== "active" || this.isInUse || (document.hasFocus() && this.matches(":focus-within"));
    }

    /** Puts the keys on the selected box. */
    takeKeys(): void {
        if (this.scene.active) this.scene.activate(this.scene.active);
    }

    /** Draws the panel down to its name on a narrow window. */
    closeSheets(): void {
        this.tooltip.hide();
        this.corner.closeLegend();
        this.panel.draw(false);
    }

    /** The whole picture, or what of it is in sight, as the text of an SVG file in the viewer's colours; null before any. */
    saveSvg(inSight = false): string | null {
        return this.drawing(this.dataset["theme"] === "dark" ? "dark" : "light", inSight);
    }

    /** The whole picture, or what of it is in sight, as the text of an SVG file; null before any. Throws LayoutError. */
    drawing(theme: DrawingTheme, inSight = false): string | null {
        const { opened, shownState } = this;
        if (!opened || !shownState || !this.picture) return null;
        return opened.svg(shownState, theme, this.reader, inSight ? this.boxesInSight() : undefined);
    }

    private boxesInSight(): number[] {
        return this.picture?.boxesWithin(this.scene.camera.shown).map(({ index }) => index) ?? [];
    }

    /** The whole picture on sheets of paper, in its colours; null before any. */
    sheets(paper: PaperOptions): PaperSheets | null {
        const { opened, shownState } = this;
        return opened && shownState && this.picture ? opened.sheets(shownState, paper, this.reader) : null;
    }

    /** What the picture is called; empty before any. */
    get shownTitle(): string {
        return this.picture ? this.pictureTitle() : "";
    }

    // --- words ---

    nameOf(person: Person): string {
        return nameOf(person, this.messages);
    }

    yearsOf(person: Person): string {
        return yearsOf(person, this.messages);
    }

    /** To the focus; empty while it is not known. */
    kinshipOf(person: Person): string {
        return this.contents?.kinshipKnown ? this.contents.kinshipOf(person.id) : "";
    }

    private setLanguage(language: string): void {
        this.messages = messagesFor(language);
        this.ui = uiMessagesFor(language);
        this.rebuildUi();
        this.showWays();
    }

    // Kinship is put into words with the picture, so another language needs another one.
    private showWays(): void {
        const { opened, shownState, sight } = this;
        if (opened && shownState && this.picture?.kinship) {
            this.picture = null;
            this.show({});
            this.sight = sight;
        }
        this.corner.showWays(this.picture?.kinship?.ways ?? []);
    }

    // Makes everything that holds words.
    private rebuildUi(): void {
        const { ui } = this;
        this.corner = new Corner(ui, this.overview.element, {
            zoomIn: () => this.zoomBy(1.35),
            zoomOut: () => this.zoomBy(1 / 1.35),
            fit: () => this.fit(),
            home: () => this.home(),
        });
        this.panel = new SidePanel(this.messages, ui, {
            select: (person) => this.select(person),
            choose: (person) => {
                this.focusOn(person);
                this.takeKeys();
            },
            relate: (person) => {
                this.show({ view: "kinship", to: person }, null, true);
                this.panel.draw(false);
            },
            waysAddressOf: (person) =>
                addressOf({ ...this.shownState!, view: "kinship", to: person }, this.opened!.persons),
            nextBox: (person) => this.nextBox(person),
            addressOf: (person) => addressOf({ ...this.shownState!, focus: person }, this.opened!.persons),
        });
        this.hint.textContent = ui.treeHint;
        this.stage.replaceChildren(this.hint, this.surface, this.corner.element);
        this.parts.replaceChildren(this.stage, this.panel.element);
        this.restyle();
    }

    /** Writes the boxes again, where words or marks have changed. */
    private restyle(): void {
        if (!this.opened || !this.picture || !this.shownState) return;
        const known = this.contents?.kinshipKnown ?? false;
        this.contents = this.newContents(this.opened, this.picture);
        this.contents.kinshipKnown = known;
        this.learnKinships();
        this.scene.restyle(this.contents);
        this.nameTree();
        this.refreshPanel();
    }

    private applyTheme(): void {
        const theme = this.getAttribute("theme");
        if (theme) this.dataset["theme"] = theme;
        else if (matchMedia("(prefers-color-scheme: dark)").matches) this.dataset["theme"] = "dark";
    }

    // --- events of the picture ---

    private openBox(box: Box): void {
        if (box.person) this.focusOn(box.person, box);
        else this.selectBox(box);
    }

    private selectBox(box: Box): void {
        const child = this.opened?.person(box.child);
        if (box.person || !child) return;
        this.emit("action", { child, parent: box.sex === "male" ? "father" : "mother" });
    }

    private showInPanel(person: number): void {
        if (!person || person === this.shownPerson) return;
        this.shownPerson = person;
        this.refreshPanel();
        this.emit("select", { person: this.opened!.person(person)! });
    }

    private refreshPanel(): void {
        const { opened, shownState, picture } = this;
        const person = opened?.person(this.shownPerson);
        if (!opened || !shownState || !picture || !person) return;
        const isFocus = person.id === shownState.focus;
        this.panel.show(person, opened, {
            focus: opened.person(shownState.focus)!,
            kinship: isFocus ? "" : (this.contents?.kinshipOf(person.id) ?? ""),
            boxes: picture.boxesOf(person.id).length,
            showsWays: picture.kinship !== null,
        });
    }

    private pointAt(box: Box | null, element: SVGGElement | null): void {
        const { picture, contents } = this;
        this.scene.pointAt(box);
        const person = box ? this.opened?.person(box.person) : undefined;
        this.scene.markDuplicates(person && picture!.boxesOf(person.id).length > 1 ? person.id : 0);
        if (!box || !person || !element || !contents || !picture) return this.tooltip.hide();
        const hidden = contents.hiddenOf(box);
        const boxes = picture.boxesOf(person.id).length;
        this.tooltip.show(element, {
            name: this.nameOf(person),
            lines: [
                this.yearsOf(person),
                box === picture.focusBox ? this.ui.inFocus : this.kinshipOf(person),
                hidden >= 0 ? this.ui.hiddenCount(hidden) : "",
                boxes > 1 ? this.ui.severalBoxes(boxes) : "",
            ],
        });
    }

    private moved(_placing: Placing): void {
        this.tooltip.hide();
        this.overview?.follow();
    }

    private resized(): void {
        this.scene.resized();
        this.overview.follow();
    }

    // --- keys ---

    /** Acts on a key as if it had been pressed in the picture. True where it meant something. */
    press(event: KeyboardEvent): boolean {
        const target = event.composedPath()[0] as Element;
        const inPicture = target === document.body || this.surface.contains(target);
        return pictureKey(event, inPicture, {
            moveKeys: (direction) => this.moveKeys(direction),
            panBy: (dx, dy) => this.scene.camera.panBy(dx, dy),
            chooseActive: () => this.chooseActive(),
            nextBox: () => this.nextBox(),
            fold: (branch) => this.foldActive(branch),
            home: () => this.home(),
            zoomIn: () => this.zoomBy(1.35),
            zoomOut: () => this.zoomBy(1 / 1.35),
            fit: () => this.fit(),
            outer: (key) => this.emit("outerkey", { key }),
        });
    }

    private key(event: KeyboardEvent): void {
        if (!this.opened || event.defaultPrevented) return;
        const target = event.composedPath()[0] as Element;
        if (target.matches("input:not([type=checkbox]), select, textarea")) return;
        const branch = [" ", "Enter"].includes(event.key) && target.getAttribute("data-branch");
        if (branch && this.foldActive(branch as Branch)) return event.preventDefault();
        if (this.press(event)) event.preventDefault();
    }

    private moveKeys(direction: Direction): void {
        const { picture, opened } = this;
        const from = this.scene.active ?? picture?.focusBox;
        if (!picture || !opened || !from) return;
        const next = boxTowards(from, direction, picture, opened);
        if (next) this.scene.activate(next);
    }

    private chooseActive(): void {
        if (this.scene.active) this.openBox(this.scene.active);
    }

    private foldActive(branch: Branch): boolean {
        const box = this.scene.active;
        if (!box || !this.contents?.branchesOf(box).some((mark) => mark.branch === branch)) return false;
        this.fold(box, branch);
        return true;
    }

    private nextBox(person = this.scene.active?.person ?? 0): void {
        const boxes = this.picture?.boxesOf(person) ?? [];
        if (boxes.length < 2) return;
        const at = boxes.findIndex((box) => box === this.scene.active);
        this.scene.activate(boxes[(at + 1) % boxes.length]!);
    }

    // --- the picture's contents ---

    private newContents(family: OpenFamily, picture: Picture): PictureContents {
        return new PictureContents(family, picture, {
            messages: this.messages,
            ui: this.ui,
            kinshipInBoxes: this.getAttribute("kinship") !== "none",
            show: this.shownState?.show ?? kUsualState.show,
            render: this.boxRenderer,
            branchesOf: (person) => this.branchesOf(family, person),
            portraitOf: this.shownState?.photos ? (person) => family.portraitOf(person, () => this.redrawSoon()) : null,
        });
    }

    private branchesOf(family: OpenFamily, person: number): readonly BranchSize[] {
        const state = this.shownState;
        return state && hasFolds(state.view) ? family.branches(state, person, this.reader) : [];
    }

    // In a large family or picture the boxes come first; what is written into them of kinship follows, found out a little
    // at a time.
    private learnKinships(): void {
        clearTimeout(this.kinshipTimer);
        const { contents, opened } = this;
        if (!contents || !opened || contents.kinshipKnown) return;
        const learn = (): void => {
            if (this.contents !== contents) return;
            const start = performance.now();
            const done = contents.learnKinships(kKinshipTime);
            performance.measure("olvane-kinship", { start });
            if (done) this.scene.redraw();
            else this.kinshipTimer = window.setTimeout(learn);
        };
        this.kinshipTimer = window.setTimeout(learn, opened.persons.length <= kSoonSearched ? 0 : kKinshipDelay);
    }

    /**
     * Browsers compile well only what has run for a while, so a large picture is laid out a few times more while
     * nobody waits for it. The first click then is as quick as those after it.
     */
    warmUp(times = kWarmUps): void {
        const { opened } = this;
        setTimeout(() => {
            const { shownState } = this;
            if (!opened || this.opened !== opened || !this.picture || !shownState) return;
            const start = performance.now();
            opened.picture(shownState, this.reader);
            if (performance.now() - start > kWarmEnough && times > 1) this.warmUp(times - 1);
        }, kWarmUpPause);
    }

    // Photographs of an archive come one by one.
    private redrawSoon(): void {
        clearTimeout(this.redrawTimer);
        this.redrawTimer = window.setTimeout(() => this.scene.redraw(), kRedrawDelay);
    }

    private nameTree(): void {
        setAttributes(this.surface, { "aria-label": this.pictureTitle(), "aria-describedby": "tree-hint" });
    }

    private pictureTitle(): string {
        const focus = this.opened?.person(this.shownState?.focus ?? 0);
        return focus ? this.ui.treeLabel(this.nameOf(focus), this.ui.views[this.shownState!.view]) : "";
    }

    // The state that the attributes ask for, in the form of an address.
    private attributeState(): ViewState {
        const family = this.opened!;
        const focus = (this.getAttribute("focus") ?? "").replaceAll("@", "");
        const usual = { ...kUsualState, focus: this.shownState?.focus ?? family.bestFocus() };
        const view = (this.getAttribute("view") ?? this.shownState?.view ?? usual.view) as ViewName;
        const parts = new URLSearchParams({ view });
        if (focus) parts.set("person", focus);
        parts.set("show", this.getAttribute("show") ?? [...(this.shownState?.show ?? [])].join(","));
        return readAddress("#" + parts.toString(), family.persons, usual);
    }

    private emit<Name extends keyof OlvaneTreeEvents>(
        name: Name,
        detail: OlvaneTreeEvents[Name] extends CustomEvent<infer Detail> ? Detail : never,
    ): boolean {
        return !this.dispatchEvent(new CustomEvent(name, { detail, cancelable: true }));
    }
}

function holdsKeys(shadow: ShadowRoot): boolean {
    return shadow.activeElement?.closest("#tree") != null;
}

function middleOf({ x, y, width, height }: Box): { x: number; y: number } {
    return { x: x + width / 2, y: y + height / 2 };
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
