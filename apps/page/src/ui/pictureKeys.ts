// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the keys do in the picture and beside it.

import type { Direction } from "../view/kinMoves";

export interface KeyActions {
    moveKeys(direction: Direction): void;
    panBy(dx: number, dy: number): void;
    chooseActive(): void;
    nextBox(): void;
    home(): void;
    switchView(): void;
    startSearch(): void;
    escape(): void;
    showKeys(): void;
    zoomIn(): void;
    zoomOut(): void;
    fit(): void;
    back(): void;
    forward(): void;
}

const kPanStep = 90; // px
const kArrows: Readonly<Record<string, readonly [Direction, number, number]>> = {
    ArrowUp: ["up", 0, 1],
    ArrowDown: ["down", 0, -1],
    ArrowLeft: ["left", 1, 0],
    ArrowRight: ["right", -1, 0],
};

const kAnywhere: Readonly<Record<string, (actions: KeyActions) => void>> = {
    "/": (actions) => actions.startSearch(),
    "?": (actions) => actions.showKeys(),
    "+": (actions) => actions.zoomIn(),
    "=": (actions) => actions.zoomIn(),
    "-": (actions) => actions.zoomOut(),
    "0": (actions) => actions.fit(),
    v: (actions) => actions.switchView(),
    Escape: (actions) => actions.escape(),
};

const kInPicture: Readonly<Record<string, (actions: KeyActions) => void>> = {
    Enter: (actions) => actions.chooseActive(),
    " ": (actions) => actions.chooseActive(),
    Home: (actions) => actions.home(),
    n: (actions) => actions.nextBox(),
};

const kWithAlt: Readonly<Record<string, (actions: KeyActions) => void>> = {
    ArrowLeft: (actions) => actions.back(),
    ArrowRight: (actions) => actions.forward(),
};

// Whether the key meant something. Other keys with Ctrl, Alt or the like are the browser's.
export function pictureKey(event: KeyboardEvent, inPicture: boolean, actions: KeyActions): boolean {
    if (event.altKey && !event.ctrlKey && !event.metaKey && !event.shiftKey) {
        const action = kWithAlt[event.key];
        action?.(actions);
        return action !== undefined;
    }
    if (event.ctrlKey || event.altKey || event.metaKey) return false;
    const arrow = kArrows[event.key];
    if (arrow && inPicture) {
        const [direction, x, y] = arrow;
        if (event.shiftKey) actions.panBy(x * kPanStep, y * kPanStep);
        else actions.moveKeys(direction);
        return true;
    }
    const key = event.key.length === 1 ? event.key.toLowerCase() : event.key;
    const action = kAnywhere[key] ?? (inPicture ? kInPicture[key] : undefined);
    action?.(actions);
    return action !== undefined;
}
