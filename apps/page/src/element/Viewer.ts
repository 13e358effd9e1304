// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The inside of the element: the picture, the buttons over it, the panel about the selected person, and what follows when
// another of them changes. Everything that holds words is made again when the language changes.
//
// Holds: the panel is about one person at a time; with every new picture that is the focus.

import { type Branch, LayoutError, type PictureOptions } from "olvane";
import { html, setAttributes, svg } from "../base/dom";
import { Messages } from "../messages";
import { type UiMessages, uiMessagesFor } from "../messages/ui";
import type { PictureContents } from "../scene/PictureContents";
import { Scene } from "../scene/Scene";
import { Corner } from "../ui/Corner";
import { Overview } from "../ui/Overview";
import { SidePanel } from "../ui/SidePanel";
import type { OpenFamily } from "../view/OpenFamily";
import type { Box, Picture } from "../view/Picture";
import type { Sight } from "../view/SharedLink";
import { addressOf, type Reader, sameState, type ViewState, withFold, withNextParents } from "../view/ViewState";
import { PictureInput } from "./PictureInput";
import { ShownPicture } from "./ShownPicture";
import type { BoxRenderer, EmitTreeEvent } from "./treeTypes";

const kRightToLeft = /^(ar|dv|fa|he|iw|ps|sd|ug|ur|yi)\b/i; // languages
const kZoomStep = 1.35;

export class Viewer {
    readonly parts = html("div", { class: "parts" });
    readonly scene: Scene;
    readonly shown: ShownPicture;
    readonly input: PictureInput;
    renderer: BoxRenderer | null = null;
    private readonly surface = svg("svg", { id: "tree", role: "application", part: "tree" });
    private readonly hint = html("p", { id: "tree-hint", class: "unseen" });
    private readonly live = html("div", { id: "live", class: "unseen", "aria-live": "polite" });
    private readonly stage = html("div", { class: "stage", part: "stage" });
    private readonly overview: Overview;
    private readonly size = new ResizeObserver(() => this.resized());
    private corner!: Corner; // made by rebuildUi()
    private panel!: SidePanel;
    private words: { readonly messages: Messages; readonly ui: UiMessages };
    private panelPerson = 0;

    /** element has the attributes "language", "kinship" and "wheel". */
    constructor(
        private readonly element: HTMLElement,
        private readonly shadow: ShadowRoot,
        private readonly emit: EmitTreeEvent,
    ) {
        this.words = this.wordsOfLanguage();
        this.scene = new Scene(this.surface, {
            opened: (box) => this.openBox(box),
            selected: (box) => this.selectBox(box),
            furtherParents: (box) => this.showFurtherParents(box),
            folded: (box, branch) => this.fold(box, branch),
            active: (box) => this.showInPanel(box.person || box.child),
            pointed: (box, element) => this.input.pointAt(box, element),
            moved: () => this.moved(),
        });
        this.shown = new ShownPicture(
            () => ({ ...this.words, reader: this.reader, kinshipInBoxes: this.kinshipInBoxes, render: this.renderer }),
            () => this.scene.redraw(),
        );
        this.overview = new Overview(this.scene.camera);
        this.input = new PictureInput(this.element, this.surface, this.scene, this.shown, {
            words: () => this.words,
            openBox: (box) => this.openBox(box),
            fold: (box, branch) => this.fold(box, branch),
            home: () => this.scene.home(),
            fit: () => this.scene.fit(),
            zoomIn: () => this.zoomBy(kZoomStep),
            zoomOut: () => this.zoomBy(1 / kZoomStep),
            outer: (key) => this.emit("outerkey", { key }),
        });
        shadow.append(html("div", { class: "viewer" }, this.parts), this.input.tooltip.element, this.live);
        this.rebuildUi();
    }

    get panelPersonId(): number {
        return this.panelPerson;
    }

    get picture(): Picture | null {
        return this.shown.picture;
    }

    get messages(): Messages {
        return this.words.messages;
    }

    connect(): void {
        this.size.observe(this.surface);
    }

    disconnect(): void {
        this.size.disconnect();
        this.input.tooltip.hide();
        this.shown.stop();
    }

    setFamily(family: OpenFamily): void {
        this.shown.setFamily(family);
        this.panelPerson = 0;
        this.scene.clear();
        this.overview.clear();
    }

    // --- what to show ---

    /** See OlvaneTree.show. */
    show(wanted: Partial<ViewState>, anchor: Box | null = null, byUser = false): boolean {
        const { family, state: before } = this.shown;
        if (!family) return false;
        const state = this.shown.stateWith(family, wanted);
        if (before && this.picture && sameState(state, before)) return true;
        const start = performance.now();
        try {
            this.shown.show(family, state);
        } catch (error) {
            this.emit("refused", { tooLarge: error instanceof LayoutError && error.status === "tooLarge" });
            return false;
        }
        this.draw(this.shown.picture!, this.shown.contents!, anchor);
        const person = family.person(state.focus)!;
        const boxes = this.picture!.boxes.length;
        this.announce(before, state, this.words.ui.focusNow(this.messages.nameOf(person), boxes));
        this.panelPerson = state.focus;
        this.refreshPanel();
        performance.measure("olvane-picture", { start });
        this.emit("focuschange", { state, person, boxes, byUser });
        return true;
    }

    private draw(picture: Picture, contents: PictureContents, anchor: Box | null): void {
        this.input.tooltip.hide();
        this.scene.show(picture, contents, anchor);
        this.overview.show(picture);
        this.corner.explain(picture);
        this.nameTree();
        this.shown.learnKinships();
    }

    private announce(before: ViewState | null, now: ViewState, boxes: string): void {
        const isNewView = before !== null && before.view !== now.view;
        if (isNewView) this.live.textContent = `${this.shown.title()}. ${boxes}`;
        else if (before?.focus !== now.focus) this.live.textContent = boxes;
    }

    // The next of several families of parents, with their child in the middle.
    private showFurtherParents(box: Box): void {
        const { family, state } = this.shown;
        const person = family?.person(box.person);
        if (!family || !person || !state) return;
        this.show(withNextParents(person, family.file.parentFamilyOf(person.id), state), box, true);
    }

    // Folds a branch or unfolds it, in place; the keys stay on the box.
    private fold(box: Box, branch: Branch): void {
        const { state } = this.shown;
        if (!state || !box.person) return;
        const keys = this.holdsKeys();
        this.show({ folded: withFold(state, box.person, branch) }, box, true);
        const again = this.picture?.boxOfKey(box.key);
        if (again) this.scene.activate(again, keys);
    }

    /** Makes a person the focus, from the box where they stand. */
    focusOn(person: number, from: Box | null = null): void {
        const { state } = this.shown;
        if (!state || !person) return;
        const anchor = from ?? this.picture?.boxesOf(person)[0] ?? null;
        if (person !== state.focus) this.show({ focus: person }, anchor, true);
        else if (this.picture) this.scene.activate(from ?? this.picture.focusBox, false);
        this.panel.draw(false);
    }

    /** Selects a person without changing the picture; keys says whether their box gets the keys. */
    select(person: number, keys = true): void {
        const box = this.picture?.boxesOf(person)[0];
        if (box) this.scene.activate(box, keys);
        else this.showInPanel(person);
    }

    private openBox(box: Box): void {
        if (box.person) this.focusOn(box.person, box);
        else this.selectBox(box);
    }

    private selectBox(box: Box): void {
        const child = this.shown.family?.person(box.child);
        if (box.person || !child) return;
        this.emit("action", { child, parent: box.sex === "male" ? "father" : "mother" });
    }

    // --- which part is in sight ---

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

    zoomBy(factor: number): void {
        this.scene.camera.zoomBy(factor);
    }

    holdsKeys(): boolean {
        return this.shadow.activeElement?.closest("#tree") != null;
    }

    /** Puts the keys on the selected box. */
    takeKeys(): void {
        if (this.scene.active) this.scene.activate(this.scene.active);
    }

    closeSheets(): void {
        this.input.tooltip.hide();
        this.corner.closeLegend();
        this.panel.draw(false);
    }

    private moved(): void {
        this.input.tooltip.hide();
        this.overview?.follow();
    }

    private resized(): void {
        this.scene.resized();
        this.overview.follow();
    }

    // --- words ---

    // In what language pictures are, and which way it is read.
    private get reader(): Reader {
        const rightToLeft = getComputedStyle(this.element).direction === "rtl" || kRightToLeft.test(this.languageTag);
        return { language: this.messages.language as PictureOptions["language"], rightToLeft };
    }

    private get languageTag(): string {
        return this.element.getAttribute("language") ?? navigator.language;
    }

    private get kinshipInBoxes(): boolean {
        return this.element.getAttribute("kinship") !== "none";
    }

    private wordsOfLanguage(): { messages: Messages; ui: UiMessages } {
        const messages = new Messages(this.languageTag, () => this.shown.family!.file.texts);
        return { messages, ui: uiMessagesFor(this.languageTag) };
    }

    /** Speaks the language that the element's attribute names now. */
    changeLanguage(): void {
        this.words = this.wordsOfLanguage();
        this.rebuildUi();
        this.explainLines();
    }

    // Kinship and lines are put into words with the picture, so another language needs another one.
    private explainLines(): void {
        const { sight } = this;
        if (this.picture?.kinship || this.picture?.lineStyles.length) {
            this.shown.forgetPicture();
            this.show({});
            this.sight = sight;
        }
        if (this.picture) this.corner.explain(this.picture);
    }

    // Makes everything that holds words.
    private rebuildUi(): void {
        const { messages, ui } = this.words;
        this.corner = new Corner(ui, this.overview.element, {
            zoomIn: () => this.zoomBy(kZoomStep),
            zoomOut: () => this.zoomBy(1 / kZoomStep),
            fit: () => this.scene.fit(),
            home: () => this.scene.home(),
        });
        const address = (wanted: Partial<ViewState>) =>
            addressOf({ ...this.shown.state!, ...wanted }, this.shown.family!.persons);
        this.panel = new SidePanel(messages, ui, {
            select: (person) => this.select(person),
            choose: (person) => {
                this.focusOn(person);
                this.takeKeys();
            },
            relate: (person) => {
                this.show({ view: "kinship", to: person }, null, true);
                this.panel.draw(false);
            },
            waysAddressOf: (person) => address({ view: "kinship", to: person }),
            nextBox: (person) => this.input.nextBox(person),
            addressOf: (person) => address({ focus: person }),
        });
        this.hint.textContent = ui.treeHint;
        this.stage.replaceChildren(this.hint, this.surface, this.corner.element);
        this.parts.replaceChildren(this.stage, this.panel.element);
        this.restyle();
    }

    /** Writes the boxes again, where words or marks have changed. */
    restyle(): void {
        const contents = this.shown.restyled();
        if (!contents) return;
        this.scene.restyle(contents);
        this.nameTree();
        this.refreshPanel();
    }

    private nameTree(): void {
        setAttributes(this.surface, { "aria-label": this.shown.title(), "aria-describedby": "tree-hint" });
    }

    // --- the panel ---

    /** Makes the panel about somebody, with an event where that is somebody else. */
    showInPanel(person: number): void {
        if (!person || person === this.panelPerson) return;
        this.panelPerson = person;
        this.refreshPanel();
        this.emit("select", { person: this.shown.family!.person(person)! });
    }

    private refreshPanel(): void {
        const { family, state, picture, contents } = this.shown;
        const person = family?.person(this.panelPerson);
        if (!family || !state || !picture || !person) return;
        const isFocus = person.id === state.focus;
        this.panel.show(person, family, {
            focus: family.person(state.focus)!,
            kinship: isFocus ? "" : (contents?.kinshipOf(person.id) ?? ""),
            boxes: picture.boxesOf(person.id).length,
            showsWays: picture.kinship !== null,
        });
    }
}

function middleOf({ x, y, width, height }: Box): { x: number; y: number } {
    return { x: x + width / 2, y: y + height / 2 };
}
