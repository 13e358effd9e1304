// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the element shows: the open family, the state that was asked for, the picture of it, and what stands in its boxes.
// Kinship is written into boxes as it becomes known: at once in most families, a little at a time in a large one, so that
// a search never holds up the picture.
//
// Holds: state, picture and contents belong together; all are null before the first picture of a family.

import { type BranchSize, type DrawingTheme, type PaperOptions, type PaperSheets, type Person } from "olvane";
import { hasFolds } from "../base/views";
import type { Messages } from "../messages";
import type { UiMessages } from "../messages/ui";
import { PictureContents } from "../scene/PictureContents";
import type { OpenFamily } from "../view/OpenFamily";
import type { Picture } from "../view/Picture";
import { kUsualState, type Reader, type ViewState } from "../view/ViewState";
import type { BoxRenderer } from "./treeTypes";

const kSoonSearched = 6000; // persons; up to here, kinship is known before a picture of usual size is drawn
const kKinshipTime = 12; // ms at a time for finding it out
const kWarmUps = 8;
const kWarmUpPause = 120; // ms
const kWarmEnough = 12; // ms; what takes less needs no warming
const kRedrawDelay = 60; // ms
const kKinshipDelay = 600; // ms after the picture of a larger family, when its boxes are in their places

/** What the element knows of its words and its reader when contents are made. */
export interface ShownWords {
    readonly messages: Messages;
    readonly ui: UiMessages;
    readonly reader: Reader;
    readonly kinshipInBoxes: boolean;
    readonly render: BoxRenderer | null;
}

export class ShownPicture {
    private opened: OpenFamily | null = null;
    private shownState: ViewState | null = null;
    private shown: Picture | null = null;
    private shownContents: PictureContents | null = null;
    private kinshipTimer = 0;
    private redrawTimer = 0;

    /** redraw is called when what boxes say has come to be known. */
    constructor(
        private readonly words: () => ShownWords,
        private readonly redraw: () => void,
    ) {}

    get family(): OpenFamily | null {
        return this.opened;
    }

    get state(): ViewState | null {
        return this.shownState;
    }

    get picture(): Picture | null {
        return this.shown;
    }

    get contents(): PictureContents | null {
        return this.shownContents;
    }

    /** Takes a family, closes the one before, and shows nothing of it yet. */
    setFamily(family: OpenFamily): void {
        this.opened?.close();
        this.opened = family;
        this.shown = null;
        this.shownState = null;
        this.shownContents = null;
    }

    /** What is wanted, with the rest as it is; the usual state before any picture. */
    stateWith(family: OpenFamily, wanted: Partial<ViewState>): ViewState {
        return { ...(this.shownState ?? { ...kUsualState, focus: family.bestFocus() }), ...wanted };
    }

    /** Makes the picture of a state. Throws LayoutError, and then everything is as before. */
    show(family: OpenFamily, state: ViewState): void {
        let picture: Picture;
        try {
            picture = family.picture(state, this.words().reader);
        } catch (error) {
            this.shownState ??= state;
            throw error;
        }
        this.shownState = state;
        this.shown = picture;
        const contents = this.newContents(family, picture);
        this.shownContents = contents;
        if (family.persons.length <= kSoonSearched) contents.learnKinships(kKinshipTime);
    }

    /** The next call of show() makes another picture of the same state. */
    forgetPicture(): void {
        this.shown = null;
    }

    /** New contents of the same boxes, where words or marks have changed; null where nothing is shown. */
    restyled(): PictureContents | null {
        const { opened, shown } = this;
        if (!opened || !shown || !this.shownState) return null;
        const known = this.shownContents?.kinshipKnown ?? false;
        this.shownContents = this.newContents(opened, shown);
        this.shownContents.kinshipKnown = known;
        this.learnKinships();
        return this.shownContents;
    }

    /** In words, of the whole picture; empty before any. */
    title(): string {
        const focus = this.opened?.person(this.shownState?.focus ?? 0);
        const { messages, ui } = this.words();
        return focus ? ui.treeLabel(messages.nameOf(focus), ui.views[this.shownState!.view]) : "";
    }

    /** To the focus; empty while it is not known. */
    kinshipOf(person: Person): string {
        return this.shownContents?.kinshipKnown ? this.shownContents.kinshipOf(person.id) : "";
    }

    /** The text of an SVG file; part names boxes by their index, around which it ends. Null before any picture. */
    drawing(theme: DrawingTheme, part?: readonly number[]): string | null {
        const { opened, shownState } = this;
        if (!opened || !shownState || !this.shown) return null;
        return opened.svg(shownState, theme, this.words().reader, part);
    }

    sheets(paper: PaperOptions): PaperSheets | null {
        const { opened, shownState } = this;
        return opened && shownState && this.shown ? opened.sheets(shownState, paper, this.words().reader) : null;
    }

    stop(): void {
        clearTimeout(this.kinshipTimer);
    }

    // In a large family or picture the boxes come first; what is written into them of kinship follows, found out a little
    // at a time.
    learnKinships(): void {
        clearTimeout(this.kinshipTimer);
        const { shownContents: contents, opened } = this;
        if (!contents || !opened || contents.kinshipKnown) return;
        const learn = (): void => {
            if (this.shownContents !== contents) return;
            const start = performance.now();
            const done = contents.learnKinships(kKinshipTime);
            performance.measure("olvane-kinship", { start });
            if (done) this.redraw();
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
            if (!opened || this.opened !== opened || !this.shown || !shownState) return;
            const start = performance.now();
            opened.picture(shownState, this.words().reader);
            if (performance.now() - start > kWarmEnough && times > 1) this.warmUp(times - 1);
        }, kWarmUpPause);
    }

    private newContents(family: OpenFamily, picture: Picture): PictureContents {
        const { messages, ui, kinshipInBoxes, render } = this.words();
        return new PictureContents(family, picture, {
            ...{ messages, ui, kinshipInBoxes, render },
            show: this.shownState?.show ?? kUsualState.show,
            branchesOf: (person) => this.branchesOf(family, person),
            portraitOf: this.shownState?.photos ? (person) => family.portraitOf(person, () => this.redrawSoon()) : null,
        });
    }

    private branchesOf(family: OpenFamily, person: number): readonly BranchSize[] {
        const state = this.shownState;
        return state && hasFolds(state.view) ? family.branches(state, person, this.words().reader) : [];
    }

    // Photographs of an archive come one by one.
    private redrawSoon(): void {
        clearTimeout(this.redrawTimer);
        this.redrawTimer = window.setTimeout(() => this.redraw(), kRedrawDelay);
    }
}
