// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the switches of the bar change in the picture: each change is a step of the way through the family.

import type { ShownFact } from "olvane";
import type { ChartDirection, RelativeName } from "../base/views";
import type { OlvaneTree } from "../element/OlvaneTree";
import { clampDepth, clampGenerations, sameState, type ViewState } from "../view/ViewState";

export class PictureSwitches {
    constructor(private readonly tree: OlvaneTree) {}

    /** Nothing happens where the picture is like that already. */
    travel(change: Partial<ViewState>): void {
        const { state } = this.tree;
        if (state && !sameState({ ...state, ...change }, state)) this.tree.show(change, null, true);
    }

    setDepth(which: "up" | "down", generations: number): void {
        this.travel({ [which]: clampDepth(generations, this.tree.state?.[which] ?? 0) });
    }

    setDirection(direction: ChartDirection): void {
        this.travel({ direction });
    }

    setRelative(name: RelativeName, shown: boolean): void {
        this.travel({ hidden: switched(this.tree.state?.hidden, name, !shown) });
    }

    setGenerations(generations: number): void {
        this.travel({ generations: clampGenerations(generations) });
    }

    setFact(fact: ShownFact, shown: boolean): void {
        this.travel({ show: switched(this.tree.state?.show, fact, shown) });
    }

    setMirrored(mirrored: boolean): void {
        this.travel({ mirrored });
    }

    setCompact(compact: boolean): void {
        this.travel({ compact });
    }

    setUnknownParents(shown: boolean): void {
        this.travel({ unknownParents: shown });
    }

    setPhotos(photos: boolean): void {
        this.travel({ photos });
    }
}

// The set with the name, or without it.
function switched<Name>(set: ReadonlySet<Name> | undefined, name: Name, isIn: boolean): ReadonlySet<Name> {
    const changed = new Set(set);
    if (isIn) changed.add(name);
    else changed.delete(name);
    return changed;
}
