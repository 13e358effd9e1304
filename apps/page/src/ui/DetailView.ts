// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a file knows beyond dates and places, as parts of the panel: notes, sources, photographs, documents and links.
// Everything is text. An address becomes a link only where it is http or https, and nothing is fetched before somebody
// follows one.

import type { Citation, DetailedFact, Details, MediaFile } from "olvane";
import { html, onClick } from "../base/dom";
import type { Photographs } from "../engine/photographs";
import type { UiMessages } from "../messages/ui";

const kLongNote = 420; // characters; of a longer one the rest is shown on demand
const kShortened = 320;
const kAddress = /https?:\/\/[^\s<>"]*[^\s<>".,;:!?)\]'\u2019]/gi;

export class DetailView {
    constructor(
        private readonly ui: UiMessages,
        private readonly photographs: Photographs,
    ) {}

    /** Of a fact or a name: short lines, then notes, sources and media. */
    linesOf(details: Details): HTMLElement[] {
        const { words } = this;
        const line = (label: string, text: string) =>
            text && html("span", { class: "detail" }, label + ": ", html("bdi", {}, text));
        const lines = [
            details.address && html("span", { class: "detail address", dir: "auto" }, details.address),
            line(words.cause, details.cause),
            line(words.age, details.age),
            line(words.husbandAge, details.husbandAge),
            line(words.wifeAge, details.wifeAge),
            line(words.agency, details.agency),
        ];
        return [...lines.filter((one): one is HTMLSpanElement => Boolean(one)), ...this.partsOf(details)];
    }

    /** Notes, links, sources and media alone. */
    partsOf(details: Details): HTMLElement[] {
        return [
            ...details.notes.map((note) => this.note(note)),
            ...details.links.map((address) => html("p", { class: "note" }, ...linked(address))),
            this.media(details.media),
            this.sources(details.citations),
        ].filter((part) => part !== null);
    }

    note(text: string): HTMLElement {
        const note = html("p", { class: "note", dir: "auto" });
        if (text.length <= kLongNote) {
            note.append(...linked(text));
            return note;
        }
        const rest = html("button", { type: "button", class: "plain" }, this.words.readOn);
        onClick(rest, () => {
            note.replaceChildren(...linked(text));
            note.tabIndex = -1;
            note.focus();
        });
        const end = text.lastIndexOf(" ", kShortened);
        note.append(text.slice(0, end > 0 ? end : kShortened) + "\u2026 ", rest);
        return note;
    }

    /** Folded under how many there are; null for none. */
    sources(citations: readonly Citation[]): HTMLElement | null {
        if (citations.length === 0) return null;
        return html(
            "details",
            { class: "sources" },
            html("summary", {}, this.words.sources(citations.length)),
            html("ul", {}, ...citations.map((citation) => this.citation(citation))),
        );
    }

    /** Photographs as pictures, whatever else there is by its name; null for none. */
    media(media: readonly MediaFile[]): HTMLElement | null {
        if (media.length === 0) return null;
        const list = html("ul", { class: "media" });
        for (const medium of media) {
            const item = html("li", {});
            const url = this.photographs.urlOf(medium.file);
            if (typeof url === "string") item.append(this.photograph(url, medium));
            else item.append(this.document(medium));
            if (url instanceof Promise)
                void url.then((found) => found && item.replaceChildren(this.photograph(found, medium)));
            list.append(item);
        }
        return list;
    }

    private get words(): UiMessages["details"] {
        return this.ui.details;
    }

    private citation({ title, author, publication, page, text, quality }: Citation): HTMLElement {
        const { words } = this;
        const part = (className: string, content: string) =>
            content && html("span", { class: className, dir: "auto" }, ...linked(content));
        return html(
            "li",
            {},
            part("source", title || words.untitled),
            part("by", [author, publication].filter(Boolean).join(", ")),
            part("page", page),
            quality !== null && html("span", { class: "quality" }, words.qualities[quality] ?? ""),
            part("note", text),
        );
    }

    private photograph(url: string, medium: MediaFile): HTMLElement {
        const title = titleOf(medium);
        const picture = html("img", { src: url, alt: title, loading: "lazy", decoding: "async" });
        const button = html(
            "button",
            { type: "button", class: "photograph", "aria-label": this.words.enlarge(title) },
            picture,
        );
        onClick(button, () => this.enlarge(button, url, title));
        return html("figure", {}, button, html("figcaption", { dir: "auto" }, title));
    }

    // A dialog of its own, gone when it is closed.
    private enlarge(button: HTMLElement, url: string, title: string): void {
        const close = html("button", { type: "button", class: "plain" }, this.ui.close);
        const dialog = html(
            "dialog",
            { class: "enlarged", "aria-label": title },
            html("img", { src: url, alt: title }),
            html("p", { dir: "auto" }, title),
            close,
        );
        onClick(close, () => dialog.close());
        onClick(dialog, (event) => event.target === dialog && dialog.close());
        dialog.addEventListener("keydown", (event) => event.stopPropagation());
        dialog.addEventListener("close", () => {
            dialog.remove();
            button.focus();
        });
        button.after(dialog);
        dialog.showModal();
    }

    private document(medium: MediaFile): HTMLElement {
        const title = titleOf(medium);
        const address = webAddress(medium.file);
        return html(
            "span",
            { class: "document", dir: "auto" },
            address ? link(address, title) : title,
            medium.format && ` (${medium.format})`,
        );
    }
}

/** What a fact is called in its own words, where its tag says no more than that there is one. */
export function ownNameOf({ tag, value, details }: DetailedFact): string {
    return tag === "EVEN" || tag === "FACT" ? details.type || value : "";
}

/** The address as the browser takes it; null for all but http and https. */
export function webAddress(text: string): string | null {
    try {
        const url = new URL(text.trim());
        return url.protocol === "http:" || url.protocol === "https:" ? url.href : null;
    } catch {
        return null;
    }
}

function link(address: string, text: string): HTMLElement {
    return html("a", { href: address, target: "_blank", rel: "noopener noreferrer" }, text);
}

// The text with each address in it as a link.
function linked(text: string): (string | HTMLElement)[] {
    const parts: (string | HTMLElement)[] = [];
    let from = 0;
    for (const { 0: written, index } of text.matchAll(kAddress)) {
        const address = webAddress(written);
        if (!address) continue;
        parts.push(text.slice(from, index), link(address, written));
        from = index + written.length;
    }
    return [...parts, text.slice(from)].filter((part) => part !== "");
}

function titleOf({ title, file }: MediaFile): string {
    return title || file.split(/[\\/]/).at(-1) || file;
}
