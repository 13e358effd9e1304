// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a program that places the element meets: its events, and what it may hand over in place of a file.

import type { Person } from "olvane";
import type { OuterKey } from "../ui/pictureKeys";
import type { ViewState } from "../view/ViewState";

/** What stands in the box of a person, which has this width and height in points; null for the usual. */
export type BoxRenderer = (person: Person, box: { width: number; height: number }) => SVGElement | null;

/** A family of the program's own: a Family of the package olvane, or whatever answers as one does. */
export interface FamilyData extends Partial<Pick<EventTarget, "addEventListener" | "removeEventListener">> {
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

/** Dispatches an event of the element. True where a listener prevented what usually follows. */
export type EmitTreeEvent = <Name extends keyof OlvaneTreeEvents>(
    name: Name,
    detail: OlvaneTreeEvents[Name] extends CustomEvent<infer Detail> ? Detail : never,
) => boolean;
