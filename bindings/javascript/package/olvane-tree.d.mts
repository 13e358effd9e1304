// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import type { DIRECTIONS, Olvane, PictureView } from "./olvane.mjs";

/** The engine that all elements of the page share, for families of the program's own. */
export declare function sharedEngine(): Promise<Olvane>;

/** What is looked at. Numbers of persons count from 1 in the order of the file. */
export interface ViewState {
    readonly focus: number;
    readonly view: PictureView;
    /** Columns of the pedigree, the focus's own included. */
    readonly generations: number;
    /** Of the other charts: generations above and below the focus, 0 for all. */
    readonly up: number;
    readonly down: number;
    readonly direction: (typeof DIRECTIONS)[number];
    /** The other person of the kinship view; 0 for nobody. */
    readonly to: number;
    /** Whether parents who are not known have boxes, in the family view and the pedigree. */
    readonly unknownParents: boolean;
    /** Whether boxes show photographs. */
    readonly photos: boolean;
    /** Groups of relatives that the family view leaves out. */
    readonly hidden: ReadonlySet<string>;
}

/** A person of the family that is shown. */
export interface Person {
    readonly id: number;
    /** The record's own name in the file, without its @; empty without one. */
    readonly xref: string;
    readonly name: string;
    readonly given: string;
    readonly surname: string;
    readonly sex: "male" | "female" | "other";
    readonly father: number;
    readonly mother: number;
    readonly spouses: readonly number[];
    readonly children: readonly number[];
}

/** A family of the program's own: a Family of the package olvane, or whatever answers as one does. */
export interface FamilyData extends Partial<Pick<EventTarget, "addEventListener" | "removeEventListener">> {
    /** The text of a GEDCOM file, with everybody as they are now. */
    gedcom(): string;
}

export interface OlvaneTreeEventMap {
    /** Another person is selected: the panel is about them. */
    select: CustomEvent<{ person: Person }>;
    /** Another picture is shown. byUser is false where the program asked for it. */
    focuschange: CustomEvent<{ state: ViewState; person: Person; boxes: number; byUser: boolean }>;
    /** The box of an unknown parent was chosen. */
    action: CustomEvent<{ child: Person; parent: "father" | "mother" }>;
    /** A picture could not be laid out; the one before stays. */
    refused: CustomEvent<{ tooLarge: boolean }>;
    /** A key that leads out of the viewer; preventDefault() says that it was taken. */
    outerkey: CustomEvent<{ key: string }>;
    /** What src or data ask for cannot be fetched or read. */
    error: ErrorEvent;
}

/** <olvane-tree src="family.ged" focus="I1" view="hourglass">; importing this package makes it known. */
export declare class OlvaneTree extends HTMLElement {
    /** What is shown; null before any picture. */
    readonly state: ViewState | null;
    /** The selected person: the one that the panel is about. */
    readonly selected: Person | null;
    /**
     * Fetches a GEDCOM file and shows it. Rejects where it cannot be fetched or read, and with an AbortError where another file
     * is asked for before it has come.
     */
    load(address: string): Promise<void>;
    /** Shows the bytes of a GEDCOM file. Rejects where they are none. */
    open(bytes: Uint8Array, name?: string): Promise<void>;
    /**
     * Shows what has changed in the family that is shown: the bytes of its GEDCOM file as they are now. Focus, selection and
     * place stay with the persons of the same xrefs. Rejects where the bytes are no GEDCOM, and then shows what it showed before.
     */
    update(bytes: Uint8Array): Promise<void>;
    /**
     * A family of the program's own in place of a file. It is shown again after each of its "change" events: once for all
     * changes that are made in a row. Focus, selection and place stay as update() keeps them. A person's xref is the id.
     */
    data: FamilyData | null;
    /** Shows data as it is now, for data without events. */
    refresh(): Promise<void>;
    /** Draws the inside of boxes, from the upper left corner of each; null for the usual. */
    renderBox: ((person: Person, box: { width: number; height: number }) => SVGElement | null) | null;
    /** Which part of the picture is in sight: the zoom, and the middle of the window in points from that of the focus. */
    sight: { zoom: number; x: number; y: number } | null;
    /** Shows a person, a view or options; what is left out stays as it is. False where that was not possible. */
    show(wanted: Partial<ViewState>): boolean;
    /** Selects a person without changing the picture. */
    select(person: number): void;
    fit(): void;
    home(): void;
    zoomBy(factor: number): void;
    /** The whole picture, or what of it is in sight, as the text of an SVG file; null before any. */
    saveSvg(inSight?: boolean): string | null;
    addEventListener<Name extends keyof OlvaneTreeEventMap>(
        type: Name,
        listener: (this: OlvaneTree, event: OlvaneTreeEventMap[Name]) => unknown,
        options?: boolean | AddEventListenerOptions,
    ): void;
    addEventListener(
        type: string,
        listener: EventListenerOrEventListenerObject,
        options?: boolean | AddEventListenerOptions,
    ): void;
}

declare global {
    interface HTMLElementTagNameMap {
        "olvane-tree": OlvaneTree;
    }
}
