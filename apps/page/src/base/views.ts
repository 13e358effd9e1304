// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The names of views and directions, of the groups of relatives that can be switched off, and of the facts that can be
// switched on.

import { DIRECTIONS, FACTS, PICTURE_VIEWS, type PictureView, Shown } from "olvane";

export type ViewName = PictureView;

export const kViewNames = PICTURE_VIEWS;

export const kDirections = DIRECTIONS;
export type ChartDirection = (typeof kDirections)[number];

// Views whose relatives are switched by groups.
export function hasGroups(view: ViewName): boolean {
    return view === "family" || view === "near";
}

// Views of which generations above the focus can be counted, and below it.
export function hasUp(view: ViewName): boolean {
    return view === "ancestors" || view === "hourglass" || view === "relatives" || view === "fan";
}
export function hasDown(view: ViewName): boolean {
    return view === "descendants" || view === "hourglass" || view === "relatives";
}
export function hasDirection(view: ViewName): boolean {
    return !["family", "pedigree", "fan"].includes(view);
}

// Views whose branches fold.
export function hasFolds(view: ViewName): boolean {
    return hasCompact(view) && view !== "kinship";
}

// Views whose generations can be packed tighter.
export function hasCompact(view: ViewName): boolean {
    return hasDirection(view) && view !== "everybody";
}

/** What boxes and lines can say beside names and years, in the order of the switches. */
export const kShownFacts = FACTS;

// In the order of the switches.
export const kRelativeNames = [
    "siblings",
    "siblingSpouses",
    "niecesNephews",
    "auntsUncles",
    "cousins",
    "greatGrandparents",
    "spousesOfChildren",
    "grandchildren",
] as const satisfies readonly (keyof typeof Shown)[];

export type RelativeName = (typeof kRelativeNames)[number];
