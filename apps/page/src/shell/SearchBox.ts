// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finds persons while one types, by all that is in their records, and says what was found where. The keys stay in the field; the list below is walked with
// arrows.

import type { Person } from "olvane";
import type { UiMessages } from "../messages/ui";
import { html, onClick } from "../base/dom";
import { icon, silhouette } from "../base/icons";
import type { Messages } from "../messages";
import { type Found, marked, reasonLines, wordsInName } from "./searchReasons";

const kMostFound = 30;

export interface SearchSource {
    find(text: string, limit: number): readonly Found[];
    readonly messages: Messages;
    kinshipOf(person: Person): string;
    choose(person: Person): void;
}

export class SearchBox {
    readonly element: HTMLElement;
    readonly input: HTMLInputElement;
    private readonly list: HTMLUListElement;
    private readonly status: HTMLElement;
    private found: readonly Found[] = [];
    private current = -1;

    constructor(
        private readonly source: SearchSource,
        private readonly ui: UiMessages,
    ) {
        this.input = html("input", {
            id: "search",
            type: "text",
            role: "combobox",
            "aria-autocomplete": "list",
            "aria-expanded": "false",
            "aria-controls": "search-list",
            "aria-label": ui.search.label,
            placeholder: ui.search.label,
            autocomplete: "off",
            autocapitalize: "off",
            spellcheck: "false",
            enterkeyhint: "search",
        });
        this.list = html("ul", {
            id: "search-list",
            role: "listbox",
            "aria-label": ui.search.label,
            hidden: true,
        });
        this.status = html("div", { class: "unseen", role: "status" });
        this.element = html(
            "div",
            { class: "search", role: "search" },
            icon("search"),
            this.input,
            this.list,
            this.status,
        );
        this.listen();
    }

    private listen(): void {
        const { input } = this;
        input.addEventListener("input", () => this.look());
        input.addEventListener("focus", () => {
            input.select();
            if (input.value) this.look();
        });
        input.addEventListener("blur", () => this.close());
        input.addEventListener("keydown", (event) => {
            // While a word is being composed, the keys are the composer's.
            if (!event.isComposing && this.key(event.key)) event.preventDefault();
            // Keys of the field are no keys of the picture.
            event.stopPropagation();
        });
        // The field must not lose the keys before the click has come.
        this.list.addEventListener("mousedown", (event) => event.preventDefault());
    }

    private key(name: string): boolean {
        if (name === "ArrowDown") return this.move(1);
        if (name === "ArrowUp") return this.move(-1);
        if (name === "Enter") {
            if (this.list.hidden) this.look();
            return this.choose(this.found[Math.max(0, this.current)]?.person);
        }
        if (name !== "Escape") return false;
        if (this.list.hidden) this.input.value = "";
        this.close();
        return true;
    }

    private move(step: number): boolean {
        if (this.list.hidden) this.look();
        const count = this.found.length;
        if (count > 0) this.select((this.current + step + count) % count);
        return true;
    }

    private select(index: number): void {
        this.mark(index);
        this.list.children[index]?.scrollIntoView({ block: "nearest" });
    }

    private mark(index: number): void {
        this.current = index;
        [...this.list.children].forEach((option, i) => option.setAttribute("aria-selected", String(i === index)));
        if (index >= 0 && this.found.length > 0) this.input.setAttribute("aria-activedescendant", "found-" + index);
        else this.input.removeAttribute("aria-activedescendant");
    }

    private look(): void {
        const text = this.input.value.trim();
        if (!text) return this.close();
        const found = this.source.find(text, kMostFound + 1);
        this.found = found.slice(0, kMostFound);
        const areMore = found.length > kMostFound;
        const { search } = this.ui;
        // To the first one, while the browser need not lay the new list out for that.
        this.list.scrollTop = 0;
        this.list.replaceChildren(...this.found.map((found, i) => this.option(found, i)));
        if (this.found.length === 0) this.list.append(this.remark(search.none));
        if (areMore) this.list.append(this.remark(search.first(kMostFound)));
        this.list.hidden = false;
        this.input.setAttribute("aria-expanded", "true");
        this.status.textContent = areMore ? search.first(kMostFound) : this.counted(this.found.length);
        this.mark(this.found.length > 0 ? 0 : -1);
    }

    private counted(count: number): string {
        const { search } = this.ui;
        return count > 0 ? search.count(count) : search.none;
    }

    // A row that nobody can choose.
    private remark(text: string): HTMLLIElement {
        return html("li", { class: "none", role: "option", "aria-disabled": "true" }, text);
    }

    private option(found: Found, index: number): HTMLLIElement {
        const { source, ui } = this;
        const { messages } = source;
        const { person } = found;
        const option = html(
            "li",
            { id: "found-" + index, role: "option", "data-person-id": person.id },
            silhouette(person.sex),
            html(
                "span",
                { class: "who" },
                html("bdi", { class: "name" }, ...marked(messages.nameOf(person), wordsInName(found))),
                html("span", { class: "kin" }, source.kinshipOf(person)),
                ...reasonLines(found, ui, messages),
            ),
            html("span", { class: "years" }, messages.yearsOf(person)),
        );
        onClick(option, () => this.choose(person));
        return option;
    }

    private choose(person: Person | undefined): boolean {
        if (!person) return true;
        this.input.value = "";
        this.close();
        this.source.choose(person);
        return true;
    }

    private close(): void {
        this.list.hidden = true;
        this.found = [];
        this.current = -1;
        this.input.setAttribute("aria-expanded", "false");
        this.input.removeAttribute("aria-activedescendant");
    }
}
