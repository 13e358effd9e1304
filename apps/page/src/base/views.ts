// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The names of views and directions, of the groups of relatives that can be switched off, and of the facts that can be
// switched on.

import type { PictureView, ShownFact } from "olvane";

export type ViewName = PictureView;

export const kViewNames = [
    "family",
    "pedigree",
    "near",
    "ancestors",
    "descendants",
    "hourglass",
    "relatives",
    "fan",
    "kinship",
    "everybody",
] as const satisfies readonly ViewName[];

export const kDirections = ["down", "up", "left", "right"] as const;
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

// Views whose generations can be packed tighter.
export function hasCompact(view: ViewName): boolean {
    return hasDirection(view) && view !== "everybody";
}

/** What boxes and lines can say beside names and years, in the order of the switches. */
export const kShownFacts = ["dates", "places", "occupation", "marriage"] as const satisfies readonly ShownFact[];

// In the order of the switches. A bit is the engine's own.
export const kRelatives = {
    siblings: 0x04,
    siblingSpouses: 0x08,
    niecesNephews: 0x10,
    auntsUncles: 0x01,
    cousins: 0x02,
    greatGrandparents: 0x40,
    spousesOfChildren: 0x80,
    grandchildren: 0x20,
} as const;

export type RelativeName = keyof typeof kRelatives;
export const kRelativeNames = Object.keys(kRelatives) as RelativeName[];
