// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is looked at: the focus, the view and its options. Every state is an address that can be passed on.

import type { Person } from "olvane";
import { kRelativeNames, kRelatives, type RelativeName, type ViewName } from "../base/views";

export interface ViewState {
    readonly focus: number;
    readonly view: ViewName;
    // Columns of the pedigree, the focus's own included.
    readonly generations: number;
    // Names of kRelatives that are switched off.
    readonly hidden: ReadonlySet<RelativeName>;
}

export const kLeastGenerations = 2;
export const kMostGenerations = 10;
export const kUsualGenerations = 5;

/** What is shown where nobody said otherwise; the focus is then chosen from the family. */
export const kUsualState: ViewState = {
    focus: 0,
    view: "family",
    generations: kUsualGenerations,
    hidden: new Set(),
};

export function shownBits(state: ViewState): number {
    return kRelativeNames.reduce(
        (bits, name) => (state.hidden.has(name) ? bits : bits | kRelatives[name]),
        0,
    );
}

export function sameState(a: ViewState, b: ViewState): boolean {
    return (
        a.focus === b.focus &&
        a.view === b.view &&
        a.generations === b.generations &&
        a.hidden.size === b.hidden.size &&
        [...a.hidden].every((name) => b.hidden.has(name))
    );
}

// "#person=I17&view=pedigree&generations=6&hide=cousins,siblings"; what has its usual value is left out.
export function addressOf(state: ViewState, persons: readonly Person[]): string {
    const parts = new URLSearchParams();
    const person = persons[state.focus - 1];
    if (person?.xref) parts.set("person", person.xref);
    else parts.set("number", String(state.focus));
    if (state.view !== "family") parts.set("view", state.view);
    if (state.generations !== kUsualGenerations) parts.set("generations", String(state.generations));
    if (state.hidden.size > 0) parts.set("hide", [...state.hidden].join(","));
    return "#" + parts.toString().replaceAll("%2C", ",");
}

// Whatever an address does not tell, or tells wrongly, is as in the state that it is read into.
export function readAddress(address: string, persons: readonly Person[], usual: ViewState): ViewState {
    const parts = new URLSearchParams(address.replace(/^#/, ""));
    if (![...parts.keys()].some((key) => ["person", "number", "view", "generations", "hide"].includes(key)))
        return usual;
    const view = parts.get("view");
    const hidden = (parts.get("hide") ?? "")
        .split(",")
        .filter((name): name is RelativeName => name in kRelatives);
    return {
        focus: focusIn(parts, persons) || usual.focus,
        view: view === "pedigree" ? "pedigree" : "family",
        generations: clampGenerations(Number(parts.get("generations") ?? kUsualGenerations)),
        hidden: new Set(kRelativeNames.filter((name) => hidden.includes(name))),
    };
}

// The person whom an address names and the file does not hold; empty where there is none.
export function unknownPersonIn(address: string, persons: readonly Person[]): string {
    const parts = new URLSearchParams(address.replace(/^#/, ""));
    return focusIn(parts, persons) ? "" : (parts.get("person") ?? parts.get("number") ?? "");
}

export function clampGenerations(generations: number): number {
    if (!Number.isFinite(generations)) return kUsualGenerations;
    return Math.min(kMostGenerations, Math.max(kLeastGenerations, Math.round(generations)));
}

function focusIn(parts: URLSearchParams, persons: readonly Person[]): number {
    const xref = parts.get("person")?.replaceAll("@", "");
    if (xref) return personOfXref(xref, persons)?.id ?? 0;
    const id = Number(parts.get("number"));
    return Number.isInteger(id) && persons[id - 1] ? id : 0;
}

// People type an identifier as they like; the file's own letters come first.
function personOfXref(xref: string, persons: readonly Person[]): Person | undefined {
    const capitals = xref.toUpperCase();
    return (
        persons.find((person) => person.xref === xref) ??
        persons.find((person) => person.xref.toUpperCase() === capitals)
    );
}
