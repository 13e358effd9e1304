// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the file states of one person: who that is to the focus, facts with dates and places, and the
// relatives, each a link. On a narrow window it is a sheet at the lower edge that shows the name until it is
// drawn up.

import type { GedcomFamily as Family, KinshipWay, Person } from "olvane";
import type { Messages } from "../messages";
import type { UiMessages } from "../messages/ui";
import type { OpenFamily } from "../view/OpenFamily";
import { html, isolated, onClick } from "../base/dom";
import { icon, silhouette } from "../base/icons";
import { DetailView } from "./DetailView";
import { FactLists } from "./FactLists";

const kMostListed = 24; // relatives of a kind, until all are asked for

export interface PanelEvents {
    select(person: number): void;
    choose(person: number): void;
    // Draws the ways between the person and the focus.
    relate(person: number): void;
    // Where a link to them leads.
    waysAddressOf(person: number): string;
    nextBox(person: number): void;
    addressOf(person: number): string;
}

// What the picture knows of the person.
export interface Standing {
    readonly focus: Person;
    readonly kinship: string;
    readonly boxes: number;
    // Whether the picture shows the ways between the two.
    readonly showsWays: boolean;
}

export class SidePanel {
    readonly element: HTMLElement;
    private readonly body = html("div", { class: "panel-body" });
    private readonly handle: HTMLButtonElement;
    // Known without asking: a question, or a scroll that changes nothing, has the browser lay out the whole
    // page.
    private isScrolled = false;
    private details!: DetailView; // of the family that is shown, as the next one
    private factLists!: FactLists;

    constructor(
        private readonly messages: Messages,
        private readonly ui: UiMessages,
        private readonly events: PanelEvents,
    ) {
        this.handle = html(
            "button",
            { class: "handle", type: "button", "aria-label": ui.panel.toggle, "aria-expanded": "false" },
            icon("up"),
        );
        this.element = html(
            "aside",
            { id: "side-panel", "aria-label": ui.panel.label, tabindex: -1 },
            this.handle,
            this.body,
        );
        for (const part of [this.element, this.body]) part.addEventListener("scroll", () => (this.isScrolled = true));
        onClick(this.handle, () => this.draw(!this.element.classList.contains("drawn")));
    }

    // Draws the sheet up or down.
    draw(up: boolean): void {
        this.element.classList.toggle("drawn", up);
        this.handle.setAttribute("aria-expanded", String(up));
    }

    show(person: Person, family: OpenFamily, standing: Standing): void {
        this.details = new DetailView(this.ui, family.photographs);
        this.factLists = new FactLists(this.messages, this.ui, this.details);
        const known = family.file.detailsOfPerson(person.id);
        const sections = [
            this.header(person, standing),
            standing.kinship === "" ? null : this.ways(person, family, standing),
            this.details.media(known.media),
            this.factLists.facts(known),
            this.people(this.ui.panel.parents, this.parents(person, family), (link) => link),
            this.couples(person, family),
            this.people(this.ui.panel.siblings, family.file.siblingsOf(person.id), (id) =>
                this.link(family.person(id)),
            ),
            this.factLists.further(known),
        ];
        this.body.replaceChildren(...sections.filter((section) => section !== null));
        if (this.isScrolled) [this.element, this.body].forEach((part) => part.scrollTo(0, 0));
        this.isScrolled = false;
        this.element.dataset["personId"] = String(person.id);
    }

    private header(person: Person, { focus, kinship, boxes }: Standing): HTMLElement {
        const isFocus = person.id === focus.id;
        const relation = kinship
            ? this.ui.relatedTo(kinship, "\u2068" + this.messages.nameOf(focus) + "\u2069")
            : this.ui.notRelated("\u2068" + this.messages.nameOf(focus) + "\u2069");
        const header = html(
            "header",
            {},
            silhouette(person.sex),
            html("h2", { dir: "auto" }, this.messages.nameOf(person)),
            html("p", { class: "years" }, this.messages.yearsOf(person)),
            html("p", { class: "kinship" }, isFocus ? this.ui.inFocus : relation),
        );
        if (!isFocus)
            header.append(
                this.button("make-focus", this.ui.makeFocus, () => this.events.choose(person.id)),
                this.button("how-related", this.ui.howRelated, () => this.events.relate(person.id)),
            );
        if (boxes > 1) {
            header.append(
                html("p", { class: "places" }, this.ui.severalBoxes(boxes) + " "),
                this.button("next-box", this.ui.nextBox, () => this.events.nextBox(person.id)),
            );
        }
        return header;
    }

    // Every way between the two in words, found when first asked for, each a link to the picture of them.
    private ways(person: Person, family: OpenFamily, { focus, showsWays }: Standing): HTMLElement {
        const section = html("details", { id: "ways" }, html("summary", {}, this.ui.waysBetween));
        const open = () => {
            if (section.childElementCount > 1) return;
            const { ways } = family.file.kinship(focus.id, person.id, this.ui.language);
            section.append(this.list(ways, (way) => this.way(way, person, family)));
        };
        section.addEventListener("toggle", open);
        if (showsWays) open();
        section.open = showsWays;
        return section;
    }

    private way({ text, persons }: KinshipWay, person: Person, family: OpenFamily): HTMLElement {
        const names = persons.map((id) => isolated(this.messages.nameOf(family.person(id)!)));
        const link = html(
            "a",
            { class: "way", href: this.events.waysAddressOf(person.id) },
            html("span", {}, text),
            html("span", { class: "detail" }, ...names.flatMap((name, i) => (i > 0 ? [" \u2013 ", name] : [name]))),
        );
        this.follow(link, () => this.events.relate(person.id));
        return link;
    }

    private button(id: string, label: string, action: () => void): HTMLElement {
        const button = html("button", { id, type: "button", class: "plain" }, label);
        onClick(button, action);
        return button;
    }

    private parents(person: Person, family: OpenFamily): HTMLElement[] {
        const links: HTMLElement[] = [];
        const listed = new Set<number>();
        const add = (id: number, note: string) => {
            if (id === 0 || listed.has(id)) return;
            listed.add(id);
            links.push(this.link(family.person(id), note));
        };
        add(person.father, this.adoption(person, family, person.father));
        add(person.mother, this.adoption(person, family, person.mother));
        for (const { family: id, pedigree } of person.parentFamilies) {
            const couple = family.families[id - 1];
            const note = this.ui.pedigrees[pedigree as keyof UiMessages["pedigrees"]] ?? "";
            if (couple) [couple.husband, couple.wife].forEach((parent) => add(parent, note));
        }
        return links;
    }

    // How a child came to a parent, where that was not by birth.
    private adoption(person: Person, family: OpenFamily, parent: number): string {
        const link = person.parentFamilies.find(({ family: id }) => {
            const couple = family.families[id - 1];
            return couple !== undefined && (couple.husband === parent || couple.wife === parent);
        });
        return this.ui.pedigrees[link?.pedigree as keyof UiMessages["pedigrees"]] ?? "";
    }

    private couples(person: Person, family: OpenFamily): HTMLElement | null {
        const couples = person.coupleFamilies
            .map((id) => family.families[id - 1])
            .filter((couple) => couple !== undefined);
        if (couples.length === 0) return null;
        const section = html("section", { class: "couples" }, html("h3", {}, this.ui.panel.partners));
        for (const couple of couples) section.append(this.couple(person, couple, family));
        return section;
    }

    private couple(person: Person, couple: Family, family: OpenFamily): HTMLElement {
        const partner = couple.husband === person.id ? couple.wife : couple.husband;
        const known = family.file.detailsOfFamily(couple.id);
        const facts = this.factLists.listOf(known.facts);
        const further = this.details.partsOf(known);
        const children = this.list(couple.children, (id) => this.link(family.person(id)));
        children.className = "children";
        children.setAttribute("aria-label", this.ui.panel.children);
        return html(
            "div",
            { class: "couple" },
            partner ? this.link(family.person(partner)) : html("p", { class: "quiet" }, this.ui.panel.unknownPartner),
            facts.childElementCount > 0 && facts,
            further.length > 0 && html("div", { class: "further" }, ...further),
            couple.children.length > 0 && children,
        );
    }

    private people<Thing>(
        title: string,
        things: readonly Thing[],
        linkOf: (thing: Thing) => HTMLElement,
    ): HTMLElement | null {
        return things.length > 0 ? html("section", {}, html("h3", {}, title), this.list(things, linkOf)) : null;
    }

    private list<Thing>(things: readonly Thing[], linkOf: (thing: Thing) => HTMLElement): HTMLElement {
        const list = html("ul", {});
        const add = (some: readonly Thing[]) => list.append(...some.map((thing) => html("li", {}, linkOf(thing))));
        const isLong = things.length > kMostListed + 1;
        add(isLong ? things.slice(0, kMostListed) : things);
        if (!isLong) return list;
        const rest = html("button", { type: "button", class: "plain" }, this.ui.panel.allOf(things.length));
        const last = html("li", {}, rest);
        onClick(rest, () => {
            last.remove();
            add(things.slice(kMostListed));
            list.querySelectorAll("a")[kMostListed]?.focus();
        });
        list.append(last);
        return list;
    }

    private link(person: Person | undefined, note = ""): HTMLElement {
        if (!person) return html("span", {});
        const link = html(
            "a",
            { class: "relative", href: this.events.addressOf(person.id), "data-person-id": person.id },
            silhouette(person.sex),
            html("bdi", { class: "name" }, this.messages.nameOf(person)),
            html("span", { class: "years" }, [this.messages.yearsOf(person), note].filter(Boolean).join(", ")),
        );
        this.follow(link, () => this.events.select(person.id));
        return link;
    }

    // What a link does here; with a key that opens it elsewhere, it is the browser's.
    private follow(link: HTMLElement, action: () => void): void {
        onClick(link, (event) => {
            if (event.ctrlKey || event.metaKey || event.shiftKey) return;
            event.preventDefault();
            action();
        });
    }
}
