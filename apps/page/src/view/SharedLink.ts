// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A link that shows somebody else what is seen here: beside the state of the picture it says who is selected, which part of
// the picture is in sight and how large, the language and the colours. The address that the page itself uses says no more
// than the state, so that a step back changes neither language nor zoom.

import type { Person } from "olvane";
import { addressOf, type ViewState } from "./ViewState";

/** The middle of the window, in points from the middle of the focus's box, and the zoom. */
export interface Sight {
    readonly zoom: number;
    readonly x: number;
    readonly y: number;
}

export interface SharedLooks {
    /** 0 for nobody but the focus. */
    readonly selected: number;
    readonly sight: Sight | null;
    readonly language: string;
    readonly theme: string;
    /** Whether boxes say how somebody is related to the focus. */
    readonly kinship: boolean;
}

export function linkOf(state: ViewState, looks: SharedLooks, persons: readonly Person[]): string {
    const parts = new URLSearchParams(addressOf(state, persons).replace(/^#/, ""));
    // In every view a second person is kept, so that the ways between the two are one step away.
    if (state.to) parts.set("to", persons[state.to - 1]?.xref || String(state.to));
    if (looks.selected && looks.selected !== state.focus)
        parts.set("selected", persons[looks.selected - 1]?.xref || String(looks.selected));
    if (looks.sight) {
        const { zoom, x, y } = looks.sight;
        parts.set("sight", [zoom.toFixed(3), Math.round(x), Math.round(y)].join(","));
    }
    if (!looks.kinship) parts.set("kinship", "no");
    parts.set("language", looks.language);
    parts.set("theme", looks.theme);
    return "#" + parts.toString().replaceAll("%2C", ",");
}

/** What a link says of the looks; what it does not say, or says wrongly, is left out. */
export function looksIn(address: string, persons: readonly Person[]): Partial<SharedLooks> {
    const parts = new URLSearchParams(address.replace(/^#/, ""));
    const who = parts.get("selected") ?? "";
    const selected = persons.find(({ xref }) => xref !== "" && xref === who) ?? persons[Number(who) - 1];
    const [zoom = NaN, x = NaN, y = NaN] = (parts.get("sight") ?? "").split(",").map(Number);
    const language = parts.get("language");
    const theme = parts.get("theme");
    return {
        ...(selected && { selected: selected.id }),
        ...([zoom, x, y].every(Number.isFinite) && zoom > 0 && { sight: { zoom, x, y } }),
        ...(language && { language }),
        ...(theme && { theme }),
        ...(parts.get("kinship") === "no" && { kinship: false }),
    };
}
