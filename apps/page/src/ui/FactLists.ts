// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the file states of a person or a family, as lists of facts: names, dates, places, and further details of each. What
// the panel shows in other ways, or is of no use to a reader, is left out.

import type { DetailedFact, DetailedName, PersonDetails } from "olvane";
import { html, isolated } from "../base/dom";
import type { Messages } from "../messages";
import type { UiMessages } from "../messages/ui";
import { type DetailView, ownNameOf } from "./DetailView";

// Shown by the panel in other ways, or of no use to a reader.
const kShownElsewhere = new Set([
    "NAME",
    "SEX",
    "FAMC",
    "FAMS",
    "HUSB",
    "WIFE",
    "CHIL",
    "CHAN",
    "CREA",
    "RIN",
    "UID",
    "_UID",
    "SUBM",
    "EXID",
]);

export class FactLists {
    constructor(
        private readonly messages: Messages,
        private readonly ui: UiMessages,
        private readonly details: DetailView,
    ) {}

    /** Facts as they come; without any, an empty list. */
    listOf(facts: readonly DetailedFact[]): HTMLElement {
        const list = html("dl", {});
        this.appendAll(list, facts);
        return list;
    }

    /** Everything that the file states of a person, under a heading. */
    facts({ names, facts }: PersonDetails): HTMLElement {
        const list = html("dl", {});
        const first = names[0];
        if (first) {
            const parts = [...this.nicknameOf(first, names), ...this.details.linesOf(first.details)];
            if (parts.length > 0) this.appendFact(list, this.ui.details.name, parts);
        }
        for (const name of names.slice(1)) this.appendName(list, name, names);
        this.appendAll(list, facts);
        return html(
            "section",
            { class: "facts" },
            html("h3", {}, this.ui.panel.facts),
            list.childElementCount > 0 ? list : html("p", { class: "quiet" }, this.ui.panel.noFacts),
        );
    }

    // A nickname that stands in a name already needs no line.
    private nicknameOf({ nickname }: DetailedName, names: readonly DetailedName[]): HTMLElement[] {
        if (!nickname || names.some(({ text }) => text.includes(nickname))) return [];
        return [html("span", { class: "detail" }, this.ui.details.nickname + ": ", isolated(nickname))];
    }

    private appendName(list: HTMLElement, name: DetailedName, names: readonly DetailedName[]): void {
        const isAgain = name.text === "" || names.find(({ text }) => text === name.text) !== name;
        const parts = [
            ...(isAgain ? [] : [isolated(name.text)]),
            ...this.nicknameOf(name, names),
            ...this.details.linesOf(name.details),
        ];
        if (parts.length > 0) this.appendFact(list, this.nameLabel(name.type), parts);
    }

    private nameLabel(type: string): string {
        const { nameTypes } = this.ui.details;
        const known = type.toLowerCase();
        return Object.hasOwn(nameTypes, known) ? nameTypes[known]! : type || this.ui.panel.otherNames;
    }

    /** What the file says of the person in no certain place of their life; null for nothing. */
    further(known: PersonDetails): HTMLElement | null {
        const address = known.address && html("p", { class: "note", dir: "auto" }, known.address);
        const parts = this.details.partsOf({ ...known, media: [] });
        if (parts.length === 0 && !address) return null;
        return html("section", { class: "further" }, html("h3", {}, this.ui.details.notes), address, ...parts);
    }

    private appendFactOf(list: HTMLElement, fact: DetailedFact): void {
        const { date, place, value, details } = fact;
        const label = ownNameOf(fact) || this.messages.factLabel(fact.tag);
        const type = details.type === label || details.type === value ? "" : details.type;
        const parts = [
            date && html("span", { class: "date" }, this.messages.dateText(date.written)),
            place && html("span", { class: "place", dir: "auto" }, this.messages.placeText(place)),
            value && value !== "Y" && value !== label && html("span", { class: "value", dir: "auto" }, value),
            type && html("span", { class: "detail", dir: "auto" }, type),
            ...this.details.linesOf(details),
        ].filter((part): part is HTMLElement => Boolean(part));
        this.appendFact(list, label, parts);
    }

    private appendFact(list: HTMLElement, label: string, parts: readonly HTMLElement[]): void {
        list.append(html("div", {}, html("dt", {}, label), html("dd", {}, ...(parts.length > 0 ? parts : ["\u2713"]))));
    }

    private appendAll(list: HTMLElement, facts: readonly DetailedFact[]): void {
        for (const fact of facts) if (!kShownElsewhere.has(fact.tag)) this.appendFactOf(list, fact);
    }
}
