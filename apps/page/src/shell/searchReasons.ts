// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Why a search has found a person, for a reader: the parts of the name that fit are marked, and what is not in name and
// years is quoted from the record.

import type { Person, SearchHit, SearchReason } from "olvane";
import { html } from "../base/dom";
import type { Messages } from "../messages";
import type { UiMessages } from "../messages/ui";

/** Somebody whom a search has found. */
export interface Found {
    readonly person: Person;
    readonly hit: SearchHit;
}

/** The text with each of the words marked where it first stands. */
export function marked(text: string, words: readonly string[]): (Node | string)[] {
    const parts: (Node | string)[] = [];
    let at = 0;
    while (at < text.length) {
        const next = words
            .map((word) => ({ word, start: word === "" ? -1 : text.indexOf(word, at) }))
            .filter(({ start }) => start >= 0)
            .sort((one, other) => one.start - other.start || other.word.length - one.word.length)[0];
        if (!next) break;
        parts.push(text.slice(at, next.start), html("mark", {}, next.word));
        at = next.start + next.word.length;
    }
    parts.push(text.slice(at));
    return parts.filter((part) => part !== "");
}

/** The words of the shown name that a search has found. */
export function wordsInName({ person, hit }: Found): string[] {
    return hit.reasons.filter((reason) => isShownName(reason, person)).map(({ written }) => written);
}

/** A line for each reason that name and years do not show. */
export function reasonLines({ person, hit }: Found, ui: UiMessages, messages: Messages): HTMLElement[] {
    const seen = new Set<string>();
    const lines: HTMLElement[] = [];
    for (const reason of hit.reasons) {
        const label = labelOf(reason, person, ui, messages);
        const text = reason.foundIn === "identifier" ? person.xref : reason.text;
        if (label === "" || text === "" || seen.has(label + text)) continue;
        seen.add(label + text);
        const shown = shownText(reason, text, messages);
        const words = reason.isDate
            ? [shown]
            : hit.reasons.filter((other) => other.text === reason.text).map(({ written }) => written);
        lines.push(html("span", { class: "why" }, label + ": ", html("bdi", {}, ...marked(shown, words))));
    }
    return lines;
}

function shownText({ foundIn, isDate }: SearchReason, text: string, messages: Messages): string {
    if (isDate) return messages.dateText(text);
    return foundIn === "place" ? messages.placeText(text) : text;
}

// A given name or a surname alone stands in the whole name, too.
function isShownName({ foundIn, written }: SearchReason, person: Person): boolean {
    return foundIn === "name" && written !== "" && person.name.includes(written);
}

// Empty where the list shows it anyway.
function labelOf(reason: SearchReason, person: Person, ui: UiMessages, messages: Messages): string {
    const { foundIn, label, fit } = reason;
    if (isShownName(reason, person)) return fit === "similar" ? ui.search.similar : "";
    if (foundIn === "birth" || foundIn === "death") return "";
    if (foundIn === "identifier") return ui.search.foundIn.identifier;
    if (foundIn === "place" || foundIn === "other" || label !== "") return messages.factLabel(label);
    return ui.search.foundIn[foundIn];
}
