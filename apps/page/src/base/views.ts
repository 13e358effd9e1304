// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The names of views and directions, of the groups of relatives that can be switched off, and of the facts that can be
// switched on. Which option changes which view the engine says.

import {
    DIRECTIONS,
    FACTS,
    PICTURE_VIEWS,
    type PictureOptionInfo,
    type PictureOptions,
    type PictureView,
    Shown,
} from "olvane";

export type ViewName = PictureView;

export const kViewNames = PICTURE_VIEWS;

export const kDirections = DIRECTIONS;
export type ChartDirection = (typeof kDirections)[number];

// By option, the views that it changes.
let viewsOf: ReadonlyMap<string, readonly ViewName[]> = new Map();

/** Takes over the engine's table of options. To be called before any family is shown. */
export function learnOptions(options: readonly Pick<PictureOptionInfo, "name" | "views">[]): void {
    viewsOf = new Map(options.map(({ name, views }) => [name, views]));
}

function changes(option: keyof PictureOptions, view: ViewName): boolean {
    return viewsOf.get(option)?.includes(view) ?? false;
}

// Views whose relatives are switched by groups.
export function hasGroups(view: ViewName): boolean {
    return changes("shown", view);
}

// Views of which generations above the focus can be counted, and below it. The page's fans are of ancestors.
export function hasUp(view: ViewName): boolean {
    return changes("up", view);
}
export function hasDown(view: ViewName): boolean {
    return changes("down", view) && view !== "fan";
}
export function hasDirection(view: ViewName): boolean {
    return changes("direction", view);
}

// Views whose branches fold.
export function hasFolds(view: ViewName): boolean {
    return changes("folded", view);
}

// Views whose generations can be packed tighter.
export function hasCompact(view: ViewName): boolean {
    return changes("compact", view);
}

// Views that have boxes for parents who are not known.
export function hasUnknownParents(view: ViewName): boolean {
    return changes("unknownParents", view);
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
