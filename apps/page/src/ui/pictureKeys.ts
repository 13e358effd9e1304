// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the keys do in the picture and beside it.

import type { Branch } from "olvane";
import type { Direction } from "../view/kinMoves";

export interface KeyActions {
    moveKeys(direction: Direction): void;
    panBy(dx: number, dy: number): void;
    chooseActive(): void;
    nextBox(): void;
    // Folds a branch of the box that the keys stand on, or unfolds it. Answers whether there is one.
    fold(branch: Branch): boolean;
    home(): void;
    zoomIn(): void;
    zoomOut(): void;
    fit(): void;
    // A key that leads out of the picture. Answers whether somebody took it.
    outer(key: OuterKey): boolean;
}

export type OuterKey = "search" | "keys" | "back" | "forward" | "switchView" | "escape";

const kPanStep = 90; // px
const kArrows: Readonly<Record<string, readonly [Direction, number, number]>> = {
    ArrowUp: ["up", 0, 1],
    ArrowDown: ["down", 0, -1],
    ArrowLeft: ["left", 1, 0],
    ArrowRight: ["right", -1, 0],
};

const kAnywhere: Readonly<Record<string, (actions: KeyActions) => unknown>> = {
    "/": (actions) => actions.outer("search"),
    "?": (actions) => actions.outer("keys"),
    "+": (actions) => actions.zoomIn(),
    "=": (actions) => actions.zoomIn(),
    "-": (actions) => actions.zoomOut(),
    "0": (actions) => actions.fit(),
    v: (actions) => actions.outer("switchView"),
    Escape: (actions) => actions.outer("escape"),
};

const kInPicture: Readonly<Record<string, (actions: KeyActions) => unknown>> = {
    Enter: (actions) => actions.chooseActive(),
    " ": (actions) => actions.chooseActive(),
    Home: (actions) => actions.home(),
    n: (actions) => actions.nextBox(),
    u: (actions) => actions.fold("up"),
    d: (actions) => actions.fold("down"),
    b: (actions) => actions.fold("beside"),
};

const kWithAlt: Readonly<Record<string, (actions: KeyActions) => unknown>> = {
    ArrowLeft: (actions) => actions.outer("back"),
    ArrowRight: (actions) => actions.outer("forward"),
};

// Whether the key meant something. Other keys with Ctrl, Alt or the like are the browser's.
export function pictureKey(event: KeyboardEvent, inPicture: boolean, actions: KeyActions): boolean {
    if (event.altKey && !event.ctrlKey && !event.metaKey && !event.shiftKey) return run(kWithAlt[event.key], actions);
    if (event.ctrlKey || event.altKey || event.metaKey) return false;
    const arrow = kArrows[event.key];
    if (arrow && inPicture) {
        const [direction, x, y] = arrow;
        if (event.shiftKey) actions.panBy(x * kPanStep, y * kPanStep);
        else actions.moveKeys(direction);
        return true;
    }
    const key = event.key.length === 1 ? event.key.toLowerCase() : event.key;
    return run(kAnywhere[key] ?? (inPicture ? kInPicture[key] : undefined), actions);
}

// Keys that nobody took are left to the page around the viewer.
function run(action: ((actions: KeyActions) => unknown) | undefined, actions: KeyActions): boolean {
    return action !== undefined && action(actions) !== false;
}
